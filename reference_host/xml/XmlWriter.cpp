// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/xml/XmlWriter.h"

#include <fstream>
#include <pugixml.hpp>
#include <sstream>

#include "reference_host/framework/Guard.h"
#include "reference_host/framework/HostPath.h"
#include "reference_host/util/text/HostText.h"
#include "reference_host/xml/XmlLimits.h"
#include "reference_host/xml/XmlNames.h"
#include "text/Encodings.h"

namespace host {

namespace {

constexpr char kDeclaration[] = "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n";

// A name or a content as UTF-8; false when it may not stand in a document.
bool ReadName(INCFString* string, std::string& out) {
    const std::u32string text = text::Read(string);
    return IsXmlName(text) && encodings::ToUtf8(text, out);
}

bool ReadContent(INCFString* string, std::string& out) {
    const std::u32string text = text::Read(string);
    return IsXmlContent(text) && encodings::ToUtf8(text, out);
}

// A carriage return that stands bare in a text is a line feed to every reader;
// everywhere else the printer escapes it.
std::string KeepReturns(const std::string& printed) {
    std::string out;
    out.reserve(printed.size());
    for (const char c : printed) {
        if (c == '\r') {
            out += "&#13;";
        } else {
            out.push_back(c);
        }
    }
    return out;
}

}  // namespace

struct XmlWriter::Tree {
    pugi::xml_document document;
    pugi::xml_node open;  // the innermost element that is still open
    int depth = 0;        // of that element

    // The nearest open element of that name, without closing anything.
    pugi::xml_node Nearest(const std::string& name, int& depthThere) const {
        depthThere = depth;
        for (pugi::xml_node node = open; node.type() == pugi::node_element; node = node.parent()) {
            if (name == node.name()) {
                return node;
            }
            --depthThere;
        }
        return {};
    }

    std::string Print() const {
        std::ostringstream stream;
        stream << kDeclaration;
        document.save(stream, "", pugi::format_raw | pugi::format_no_declaration,
                      pugi::encoding_utf8);
        return KeepReturns(stream.str());
    }
};

XmlWriter::XmlWriter() = default;

XmlWriter::~XmlWriter() = default;

NCFRESULT XmlWriter::Open(INCFString* path) {
    return Guarded([&] {
        std::filesystem::path file;
        Check(path == nullptr ? NCF_OK : PathFrom(path, file));
        tree_ = std::make_unique<Tree>();
        file_ = std::move(file);
        isClosed_ = false;
        return NCF_OK;
    });
}

NCFRESULT XmlWriter::Close() {
    return Guarded([&] {
        Need(tree_ && !isClosed_, NMA_E_NOTINITIALIZED);
        Need(tree_->document.document_element(), NMA_E_NODATA);
        isClosed_ = true;
        if (file_.empty()) {
            return NCF_OK;
        }
        const std::string text = tree_->Print();
        std::ofstream stream(file_, std::ios::binary | std::ios::trunc);
        stream.write(text.data(), static_cast<std::streamsize>(text.size()));
        stream.close();
        return stream ? NCF_OK : NCF_E_HANDLE;
    });
}

NCFRESULT XmlWriter::GetText(INCFString** text) {
    return Guarded([&] {
        Need(text);
        *text = nullptr;
        Need(tree_, NMA_E_NOTINITIALIZED);
        return GiveString(tree_->Print(), text);
    });
}

NCFRESULT XmlWriter::Attribute(INCFString* element, INCFString* name, INCFString* value) {
    return Guarded([&] {
        Need(tree_ && !isClosed_, NMA_E_NOTINITIALIZED);
        std::string key;
        std::string content;
        Need(ReadName(name, key) && ReadContent(value, content), NCF_E_INVALIDARG);
        int depth = 0;
        pugi::xml_node node = tree_->Nearest(text::ReadUtf8(element), depth);
        Need(node, NCF_E_INVALIDARG);
        Need(!node.first_child(), NCF_E_FAIL);
        Need(!(node.attribute(key.c_str())), NMA_E_ALREADYSET);
        const bool made = node.append_attribute(key.c_str()).set_value(content.c_str());
        return made ? NCF_OK : NCF_E_OUTOFMEMORY;
    });
}

NCFRESULT XmlWriter::Element(INCFString* name, INCFString* parent) {
    return Guarded([&] {
        Need(tree_ && !isClosed_, NMA_E_NOTINITIALIZED);
        std::string tag;
        Need(ReadName(name, tag), NCF_E_INVALIDARG);
        int depth = 0;
        pugi::xml_node place = tree_->document;
        if (parent != nullptr) {
            place = tree_->Nearest(text::ReadUtf8(parent), depth);
        } else if (tree_->document.document_element()) {
            return NMA_E_ROOTEXISTS;
        }
        Need(place, NCF_E_INVALIDARG);
        // What is written must be readable again.
        Need(depth < XmlLimits::kDeepest, NCF_E_NOTSUPPORTED);
        pugi::xml_node made = place.append_child(tag.c_str());
        Need(made, NCF_E_OUTOFMEMORY);
        tree_->open = made;
        tree_->depth = depth + 1;
        return NCF_OK;
    });
}

NCFRESULT XmlWriter::Text(INCFString* text, INCFString* parent) {
    return Guarded([&] {
        Need(tree_ && !isClosed_, NMA_E_NOTINITIALIZED);
        std::string content;
        Need(text && ReadContent(text, content), NCF_E_INVALIDARG);
        int depth = 0;
        pugi::xml_node node = tree_->Nearest(text::ReadUtf8(parent), depth);
        Need(node, NCF_E_INVALIDARG);
        const bool made = node.append_child(pugi::node_pcdata).set_value(content.c_str());
        Need(made, NCF_E_OUTOFMEMORY);
        tree_->open = node;
        tree_->depth = depth;
        return NCF_OK;
    });
}

}  // namespace host
