// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/NMAXmlElement.h"

#include <memory>

#include "source/parameters/NMAXmlLeaves.h"
#include "source/plugin/ResultChecks.h"

namespace NMA::XMLUtils {

void NMAXmlElement::LoadChildren() {
    if (state_ != kUnread) {
        return;
    }
    NMAXmlNode::LoadChildren();
    rebuildAttributeIndex();
}

void NMAXmlElement::SetChanged() {
    NMAXmlNode::SetChanged();
    rebuildAttributeIndex();
}

// Only children that are new to their place are looked at, so building a long
// list costs one look at each.
void NMAXmlElement::rebuildAttributeIndex() {
    found_.reset();
    while (!attributePlaces_.empty() && attributePlaces_.back() >= standing_) {
        attributePlaces_.pop_back();
    }
    for (; standing_ < children_.size(); ++standing_) {
        if (dynamic_cast<NMAXmlAttribute*>(children_[standing_])) {
            attributePlaces_.push_back(standing_);
        }
    }
    attributeIndex_.clear();
    for (const std::size_t place : attributePlaces_) {
        if (children_[place]->GetState() != kDeleted) {
            NMAString name;
            children_[place]->GetNodeName(name);
            attributeIndex_.emplace(name.GetUTF8String(), place);
        }
    }
}

void NMAXmlElement::CopyTo(NMAXmlNode& target) {
    NMAXmlNode::CopyTo(target);
    auto& copy = static_cast<NMAXmlElement&>(target);
    copy.tagName_ = tagName_;
    copy.rebuildAttributeIndex();
}

// Attributes made in memory are gone and deleted ones are back.
void NMAXmlElement::DiscardNewChildren() {
    NMAXmlNode::DiscardNewChildren();
    rebuildAttributeIndex();
}

NCFRESULT NMAXmlElement::WriteTo(IXmlWriter* writer) {
    if (!writer) {
        ThrowIfFailed(NCF_E_INVALIDARG);
    }
    if (state_ == kDeleted) {
        return NCF_OK;
    }
    LoadChildren();
    NMAString tag;
    GetTagName(tag);
    NMAString parentTag;
    auto* const parentElement = dynamic_cast<NMAXmlElement*>(parent_);
    if (parentElement) {
        parentElement->GetTagName(parentTag);
    }
    ThrowIfFailed(writer->Element(tag.InArg(), parentElement ? parentTag.InArg() : nullptr));

    std::vector<NMAXmlNode*> attributes;
    std::vector<NMAXmlNode*> others;
    GetAttributes(attributes);
    GetNonAttributes(others);
    for (NMAXmlNode* child : attributes) {
        ThrowIfFailed(child->WriteTo(writer));
    }
    for (NMAXmlNode* child : others) {
        ThrowIfFailed(child->WriteTo(writer));
    }
    return NCF_OK;
}

void NMAXmlElement::GetTagName(NMAString& out) {
    if (origin_ == kOriginMemory) {
        out = tagName_;
        return;
    }
    NCFSmartPtr<IXmlElement> element;
    ThrowIfFailed(ncfQuery(RequireHostNode(), element));
    NCFSmartPtr<INCFString> name;
    ThrowIfFailed(element->GetTagName(name.outArg()));
    out = NMAString(name.inArg(), kNCFUTF16);
}

void NMAXmlElement::SetTagName(const NMAString& name) {
    if (origin_ != kOriginMemory) {
        ThrowIfFailed(NCF_E_UNEXPECTED);
    }
    tagName_ = name;
    if (auto* const parent = dynamic_cast<NMAXmlElement*>(parent_)) {
        parent->found_.reset();
    }
}

void NMAXmlElement::GetText(NMAString& out) {
    LoadChildren();
    NMAString joined;
    for (NMAXmlNode* child : children_) {
        if (auto* const text = dynamic_cast<NMAXmlText*>(child)) {
            joined += text->GetText();
        }
    }
    out = joined;
}

void NMAXmlElement::SetText(const NMAString& text) {
    LoadChildren();
    for (std::size_t i = children_.size(); i-- > 0;) {
        if (dynamic_cast<NMAXmlText*>(children_[i])) {
            DropChildAt(i);
        }
    }
    AddText(text);
}

void NMAXmlElement::AddText(const NMAString& text) {
    auto child = std::make_unique<NMAXmlText>(text);
    AddChild(child.get());
    child.release();
}

void NMAXmlElement::AddChildElement(const NMAString& name, NMAXmlElement** out) {
    auto child = std::make_unique<NMAXmlElement>();
    child->SetTagName(name);
    AddChild(child.get());
    NMAXmlElement* const added = child.release();
    if (out) {
        *out = added;
    }
}

void NMAXmlElement::AddChildElementWithText(const NMAString& name, const NMAString& text) {
    auto child = std::make_unique<NMAXmlElement>();
    child->SetTagName(name);
    child->SetText(text);
    AddChild(child.get());
    child.release();
}

}  // namespace NMA::XMLUtils
