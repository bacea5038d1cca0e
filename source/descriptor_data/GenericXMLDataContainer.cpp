// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/descriptor_data/GenericXMLDataContainer.h"

#include "source/plugin/ResultChecks.h"

GenericXMLDataContainer::GenericXMLDataContainer() = default;
GenericXMLDataContainer::~GenericXMLDataContainer() = default;

NCFRESULT GenericXMLDataContainer::CreateDescriptionNode(const char* name, ncfUInt32 kind,
                                                         XMLDataPropertyValue** node) {
    NCF_FUNCTION("GenericXMLDataContainer::CreateDescriptionNode");
    CHK_INARG(node);
    descriptions_.push_back(std::make_unique<XMLDataPropertyDescription>(NMAString(name), kind));
    descriptionNodes_.push_back(std::make_unique<XMLDataPropertyValue>(descriptions_.back().get()));
    *node = descriptionNodes_.back().get();
    return NCF_OK;
}

NCFRESULT GenericXMLDataContainer::SetContainerDescription(XMLDataPropertyValue* parent) {
    NCF_FUNCTION("GenericXMLDataContainer::SetContainerDescription");
    CHK_INARG(parent);
    containerDescription_ = parent;
    return NCF_OK;
}

void GenericXMLDataContainer::Start() {}

void GenericXMLDataContainer::End() {
    AddEntry();
}

// The find moves the position in the declared tree even where the value that it
// belongs to is not there.
void GenericXMLDataContainer::Element(const NMAString& tag) {
    XMLDataPropertyValue* const from =
        currentDescription_ ? currentDescription_ : containerDescription_;
    const bool isFirst = currentDescription_ == nullptr;
    XMLDataPropertyValue* found = nullptr;
    if (!from || from->FindNextProperty(tag.GetUTF8String(), &found) == kPropertyNotFound) {
        return;
    }
    if (!found) {
        throw NCF_E_INVALIDARG;
    }
    currentDescription_ = found;
    const XMLDataPropertyDescription* description = nullptr;
    if (found->GetDesc(&description) < 0 || !description) {
        throw NCF_E_INVALIDARG;
    }
    XMLDataPropertyValue* valueParent = nullptr;
    if (!isFirst && !FindValueParent(&valueParent)) {
        return;
    }
    switch (description->GetKind()) {
        case DCF_COMPLEX_ELEMENT:
        case DCF_ELEMENT:
            AddValueElement(description, valueParent);
            break;
        case DCF_KEY_ELEMENT:
            AddKeyElement(description, valueParent);
            break;
        case DCF_ENTRY_ELEMENT:
            AddEntryElement(description);
            break;
        default:
            break;
    }
}

void GenericXMLDataContainer::Text(const NMAString& text) {
    if (!expectText_) {
        return;
    }
    currentValue_->SetValue(text);
    expectText_ = false;
}

// To a declared tree an attribute and a child element are the same.
void GenericXMLDataContainer::Attribute(const NMAString& name, const NMAString& value) {
    Element(name);
    Text(value);
}

void GenericXMLDataContainer::GetEntries(const char* key,
                                         std::vector<XMLDataPropertyValue*>* entries) const {
    const auto range = entries_.equal_range(key);
    for (auto entry = range.first; entry != range.second; ++entry) {
        entries->push_back(entry->second);
    }
}

// The value node under which the element just found belongs: the nearest value
// with the name of its declared parent. Null for the root of the declared tree;
// false when there should be one and is none.
bool GenericXMLDataContainer::FindValueParent(XMLDataPropertyValue** valueParent) const {
    *valueParent = nullptr;
    XMLDataPropertyValue* declaredParent = nullptr;
    const XMLDataPropertyDescription* description = nullptr;
    if (currentDescription_->GetParent(&declaredParent) < 0 || !declaredParent ||
        declaredParent->GetDesc(&description) < 0 || !description) {
        return true;
    }
    *valueParent = currentValue_ ? currentValue_->NearestNamed(description->NameText()) : nullptr;
    return *valueParent != nullptr;
}

XMLDataPropertyValue* GenericXMLDataContainer::MakeValueNode(
    const XMLDataPropertyDescription* description) {
    return &valueNodes_.emplace_back(description);
}

void GenericXMLDataContainer::AddValueElement(const XMLDataPropertyDescription* description,
                                              XMLDataPropertyValue* valueParent) {
    if (!valueParent) {
        throw NCF_E_INVALIDARG;
    }
    XMLDataPropertyValue* const node = MakeValueNode(description);
    ThrowIfFailed(valueParent->AddChild(node));
    currentValue_ = node;
    // A complex element waits for no text, but the text that a leaf before it
    // still waits for would be its own.
    if (description->GetKind() == DCF_ELEMENT) {
        expectText_ = true;
    }
}

// The key knows its entry without being one of its children.
void GenericXMLDataContainer::AddKeyElement(const XMLDataPropertyDescription* description,
                                            XMLDataPropertyValue* valueParent) {
    if (!valueParent) {
        throw NCF_E_INVALIDARG;
    }
    XMLDataPropertyValue* const node = MakeValueNode(description);
    ThrowIfFailed(node->SetParent(valueParent));
    currentKey_ = node;
    currentValue_ = node;
    expectText_ = true;
}

void GenericXMLDataContainer::AddEntryElement(const XMLDataPropertyDescription* description) {
    if (entryOpen_) {
        AddEntry();
    }
    XMLDataPropertyValue* const node = MakeValueNode(description);
    currentValue_ = node;
    openEntry_ = node;
    entryOpen_ = true;
}

// The key stays for the next entry: one without a key of its own is filed under
// the key before it. Before the first key there is nothing to file under.
void GenericXMLDataContainer::AddEntry() {
    if (openEntry_ && currentKey_) {
        entries_.emplace(currentKey_, openEntry_);
    }
    expectText_ = false;
}
