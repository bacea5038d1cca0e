// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/xml/XmlTree.h"

#include "reference_host/xml/EventReader.h"
#include "reference_host/xml/XmlTreeObjects.h"

namespace host {

namespace {

// The tree's parser forgives what is not well-formed, so a strict one goes
// over the text first.
NCFRESULT Check(const std::string& bytes, const char* encoding) {
    XmlEvents events;
    EventReader reader(events, encoding);
    return reader.Feed(bytes.data(), bytes.size(), true);
}

// Keeps everything in the document, white space between elements too: what is read
// and written again must be complete.
constexpr unsigned kParse =
    pugi::parse_default | pugi::parse_ws_pcdata | pugi::parse_comments | pugi::parse_pi;

}  // namespace

std::shared_ptr<XmlTree> XmlTree::Load(const std::string& bytes, const char* encoding,
                                       NCFRESULT& result) {
    result = Check(bytes, encoding);
    if (result < 0) {
        return nullptr;
    }
    auto tree = std::make_shared<XmlTree>();
    const pugi::xml_encoding form = encoding == nullptr ? pugi::encoding_auto : pugi::encoding_utf8;
    const pugi::xml_parse_result parsed =
        tree->document_.load_buffer(bytes.data(), bytes.size(), kParse, form);
    if (!parsed || !tree->root()) {
        result = parsed.status == pugi::status_out_of_memory ? NCF_E_OUTOFMEMORY : NCF_E_FAIL;
        return nullptr;
    }
    return tree;
}

template <class Make>
Ref<IXmlNode> XmlTree::Find(const void* key, Make make) {
    const std::lock_guard<std::mutex> guard(mutex_);
    const auto found = objects_.find(key);
    if (found != objects_.end()) {
        return Ref<IXmlNode>(found->second);
    }
    // The place first: once the object stands, nothing may fail any more.
    IXmlNode*& place = objects_[key];
    try {
        place = make();
    } catch (...) {
        objects_.erase(key);
        throw;
    }
    return Ref<IXmlNode>::Adopt(place);
}

Ref<IXmlNode> XmlTree::ObjectFor(pugi::xml_node node) {
    return Find(node.internal_object(),
                [&] { return MakeNodeObject(shared_from_this(), node).Detach(); });
}

Ref<IXmlNode> XmlTree::ObjectFor(pugi::xml_attribute attribute) {
    return Find(attribute.internal_object(),
                [&] { return MakeAttributeObject(shared_from_this(), attribute).Detach(); });
}

}  // namespace host
