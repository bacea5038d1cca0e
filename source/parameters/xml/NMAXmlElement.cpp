// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/xml/NMAXmlElement.h"

#include <iterator>
#include <memory>

#include "source/parameters/xml/NMAXmlLeaves.h"
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

// Only children that are new to their place are asked for their names, unless
// any node has changed quietly: building a long list costs one look at each.
void NMAXmlElement::rebuildAttributeIndex() {
    found_.reset();
    const ncfUInt64 changes = QuietChanges();
    if (changes != indexedAtChange_) {
        standing_ = 0;
        indexedAtChange_ = changes;
    }
    if (standing_ < indexed_) {
        for (auto it = attributeIndex_.begin(); it != attributeIndex_.end();) {
            it = it->second < standing_ ? std::next(it) : attributeIndex_.erase(it);
        }
        indexed_ = standing_;
    }
    for (; indexed_ < children_.size(); standing_ = ++indexed_) {
        auto* const attribute = dynamic_cast<NMAXmlAttribute*>(children_[indexed_]);
        if (attribute && attribute->GetState() != kDeleted) {
            NMAString name;
            attribute->GetNodeName(name);
            attributeIndex_.emplace(name.GetUTF8String(), indexed_);
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
    if (parent_) {
        CountQuietChange();
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
