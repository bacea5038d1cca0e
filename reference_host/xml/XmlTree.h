// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <memory>
#include <mutex>
#include <pugixml.hpp>
#include <string>
#include <unordered_map>

#include "host_interfaces/xml/XmlDocument.h"
#include "reference_host/util/Ref.h"

namespace host {

// One loaded document and the objects that stand for its nodes. The document
// component and every object of the tree share it, so it lives as long as any
// of them. It never changes after loading.
class XmlTree : public std::enable_shared_from_this<XmlTree> {
public:
    // Takes the document's bytes. `encoding` overrides what they say of
    // themselves; null: they decide. Null on failure.
    static std::shared_ptr<XmlTree> Load(const std::string& bytes, const char* encoding,
                                         NCFRESULT& result);

    pugi::xml_node root() const { return document_.document_element(); }

    // The object of a node or an attribute: the living one, or a new one.
    Ref<IXmlNode> ObjectFor(pugi::xml_node node);
    Ref<IXmlNode> ObjectFor(pugi::xml_attribute attribute);

    // For the objects: gives one reference back by `drop`, which returns how
    // many are left, and forgets the object with the last.
    template <class Drop>
    ncfUInt32 GiveBack(const void* key, Drop drop) {
        const std::lock_guard<std::mutex> guard(mutex_);
        const ncfUInt32 left = drop();
        if (left == 0) {
            objects_.erase(key);
        }
        return left;
    }

private:
    template <class Make>
    Ref<IXmlNode> Find(const void* key, Make make);

    pugi::xml_document document_;
    std::mutex mutex_;
    std::unordered_map<const void*, IXmlNode*> objects_;  // not counted
};

}  // namespace host
