// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <map>
#include <memory>
#include <string>
#include <vector>

#include "host_interfaces/xml/XmlDocument.h"
#include "host_interfaces/xml/XmlWriter.h"
#include "tests/support/fakes/FakeHost.h"

// Results by operation; what is not listed succeeds.
class Refusals {
public:
    std::map<std::string, NCFRESULT> results;

protected:
    NCFRESULT ResultOf(const std::string& operation) const {
        const auto found = results.find(operation);
        return found == results.end() ? NCF_OK : found->second;
    }
    NCFRESULT GiveText(const std::string& operation, const std::string& text,
                       INCFString** out) const {
        const NCFRESULT result = ResultOf(operation);
        *out = result < 0 ? nullptr : MakeHostString(text);
        return result;
    }
    template <class T>
    NCFRESULT GiveObject(const std::string& operation, T* object, T** out) const {
        const NCFRESULT result = ResultOf(operation);
        *out = result < 0 ? nullptr : object;
        if (*out) {
            (*out)->AddRef();
        }
        return result;
    }
};

// A node of a host document that refuses what it is told to and counts how often
// its identity, its children, its tag and its name are asked for. The test owns the tree;
// references are counted, not obeyed.
class FakeXmlNode final : public IXmlNode, public Refusals {
public:
    FakeXmlNode(XmlNodeType type, const std::string& name, const std::string& value = {})
        : type_(type), name_(name), value_(value), element_(this), list_(this) {}

    FakeXmlNode& AddAttribute(const std::string& name, const std::string& value) {
        attributes_.push_back(std::make_unique<FakeXmlNode>(kXmlAttribute, name, value));
        return *attributes_.back();
    }
    FakeXmlNode& AddElement(const std::string& name) {
        children_.push_back(std::make_unique<FakeXmlNode>(kXmlElement, name));
        return *children_.back();
    }
    FakeXmlNode& AddText(const std::string& text) {
        children_.push_back(std::make_unique<FakeXmlNode>(kXmlText, "", text));
        return *children_.back();
    }

    int references = 0;
    int identityQuestions = 0;
    int childQuestions = 0;
    int tagQuestions = 0;
    int nameQuestions = 0;

    NCFRESULT QueryInterface(const GUID& iid, void** out) override {
        *out = nullptr;
        if (iid == IID_INCFUnknown || iid == kIID_XmlNode) {
            identityQuestions += iid == IID_INCFUnknown ? 1 : 0;
            const NCFRESULT result =
                ResultOf(iid == kIID_XmlNode ? "query node" : "query identity");
            if (result < 0) {
                return result;
            }
            *out = static_cast<IXmlNode*>(this);
        } else if (iid == kIID_XmlElement && type_ == kXmlElement) {
            const NCFRESULT result = ResultOf("query element");
            if (result < 0) {
                return result;
            }
            *out = static_cast<IXmlElement*>(&element_);
        } else {
            return NCF_E_NOINTERFACE;
        }
        AddRef();
        return NCF_OK;
    }
    ncfUInt32 AddRef() override { return static_cast<ncfUInt32>(++references); }
    ncfUInt32 Release() override { return static_cast<ncfUInt32>(--references); }

    ncfBool HasAttributes() override { return attributes_.empty() ? 0 : 1; }
    ncfUInt32 GetType() override { return type_; }
    NCFRESULT GetName(INCFString** out) override {
        ++nameQuestions;
        return GiveText("GetName", name_, out);
    }
    NCFRESULT GetValue(INCFString** out) override { return GiveText("GetValue", value_, out); }
    ncfUInt32 GetChildCount() override {
        ++childQuestions;
        return static_cast<ncfUInt32>(children_.size());
    }
    NCFRESULT GetChild(ncfUInt32 index, IXmlNode** out) override {
        return GiveObject<IXmlNode>("GetChild", children_.at(index).get(), out);
    }
    NCFRESULT GetAttributes(IXmlAttributeList** out) override {
        return GiveObject<IXmlAttributeList>("GetAttributes", &list_, out);
    }

private:
    // Further faces of the node share its count.
    template <class Interface>
    class Face : public Interface {
    public:
        explicit Face(FakeXmlNode* node) : node_(node) {}
        NCFRESULT QueryInterface(const GUID& iid, void** out) override {
            return node_->QueryInterface(iid, out);
        }
        ncfUInt32 AddRef() override { return node_->AddRef(); }
        ncfUInt32 Release() override { return node_->Release(); }

    protected:
        ~Face() = default;
        FakeXmlNode* node_;
    };
    class Element final : public Face<IXmlElement> {
    public:
        using Face::Face;
        NCFRESULT GetTagName(INCFString** out) override {
            ++node_->tagQuestions;
            return node_->GiveText("GetTagName", node_->name_, out);
        }
    };
    class List final : public Face<IXmlAttributeList> {
    public:
        using Face::Face;
        ncfUInt32 GetCount() override { return static_cast<ncfUInt32>(node_->attributes_.size()); }
        NCFRESULT GetItem(ncfUInt32 index, IXmlNode** out) override {
            return node_->GiveObject<IXmlNode>("GetItem", node_->attributes_.at(index).get(), out);
        }
    };

    XmlNodeType type_;
    std::string name_;
    std::string value_;
    std::vector<std::unique_ptr<FakeXmlNode>> attributes_;
    std::vector<std::unique_ptr<FakeXmlNode>> children_;
    Element element_;
    List list_;
};

// A host document that shows a given tree, whatever it is told to load.
class FakeXmlDocument final : public FakeObject<IXmlDocument>, public Refusals {
public:
    explicit FakeXmlDocument(INCFUnknown* root) : root_(root) {}
    NCFRESULT Load(INCFString*) override { return ResultOf("Load"); }
    NCFRESULT LoadFromText(INCFString*) override { return ResultOf("LoadFromText"); }
    NCFRESULT GetRootNode(INCFUnknown** out) override {
        return GiveObject("GetRootNode", root_, out);
    }

private:
    INCFUnknown* root_;
};

// A host writer that keeps what it hears, one line each; "-" is no text.
class FakeXmlWriter final : public FakeObject<IXmlWriter>, public Refusals {
public:
    std::vector<std::string> lines;

    NCFRESULT Open(INCFString* path) override { return Hear("Open", {path}); }
    NCFRESULT Close() override { return Hear("Close", {}); }
    NCFRESULT GetText(INCFString** out) override {
        lines.push_back("GetText");
        return GiveText("GetText", "the text", out);
    }
    NCFRESULT Attribute(INCFString* element, INCFString* name, INCFString* value) override {
        return Hear("Attribute", {element, name, value});
    }
    NCFRESULT Element(INCFString* name, INCFString* parent) override {
        return Hear("Element", {name, parent});
    }
    NCFRESULT Text(INCFString* text, INCFString* parent) override {
        return Hear("Text", {text, parent});
    }

private:
    NCFRESULT Hear(const std::string& operation, const std::vector<INCFString*>& texts) {
        std::string line = operation;
        for (INCFString* const text : texts) {
            line += " " + (text ? TextOf(text) : "-");
        }
        lines.push_back(line);
        return ResultOf(operation);
    }
};
