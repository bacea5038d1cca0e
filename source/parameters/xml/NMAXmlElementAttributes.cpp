// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// An element's attributes.

#include <memory>

#include "source/parameters/xml/NMAXmlElement.h"
#include "source/parameters/xml/NMAXmlLeaves.h"
#include "source/plugin/ResultChecks.h"

namespace NMA::XMLUtils {

bool NMAXmlElement::HasAttribute(const NMAString& name) {
    return FindAttribute(name) != nullptr;
}

NMAXmlAttribute* NMAXmlElement::FindAttribute(const NMAString& name) {
    LoadChildren();
    const auto found = attributeIndex_.find(name.GetUTF8String());
    if (found == attributeIndex_.end() || found->second >= children_.size()) {
        return nullptr;
    }
    return dynamic_cast<NMAXmlAttribute*>(children_[found->second]);
}

void NMAXmlElement::GetAttribute(const NMAString& name, NMAString& out) {
    NMAXmlAttribute* const attribute = FindAttribute(name);
    if (!attribute) {
        ThrowIfFailed(NMA_E_NODATA);
    }
    attribute->GetNodeValue(out);
}

void NMAXmlElement::SetAttribute(const NMAString& name, const NMAString& value) {
    LoadChildren();
    const auto found = attributeIndex_.find(name.GetUTF8String());
    if (found == attributeIndex_.end()) {
        auto attribute = std::make_unique<NMAXmlAttribute>(name, value);
        attribute->SetParent(this);
        children_.push_back(attribute.get());
        attribute.release();
    } else {
        auto* const attribute = found->second < children_.size()
                                    ? dynamic_cast<NMAXmlAttribute*>(children_[found->second])
                                    : nullptr;
        if (!attribute) {
            ThrowIfFailed(NCF_E_UNEXPECTED);
        }
        attribute->SetValue(value);
    }
    SetChanged();
}

void NMAXmlElement::RemoveAttribute(const NMAString& name) {
    LoadChildren();
    bool removed = false;
    for (NMAXmlNode* child : children_) {
        auto* const attribute = dynamic_cast<NMAXmlAttribute*>(child);
        if (!attribute || attribute->GetState() == kDeleted) {
            continue;
        }
        NMAString itsName;
        attribute->GetNodeName(itsName);
        if (itsName == name) {
            attribute->MarkDeleted();
            removed = true;
        }
    }
    if (!removed) {
        ThrowIfFailed(NMA_E_NODATA);
    }
    SetChanged();
}

void NMAXmlElement::GetAttributes(std::vector<NMAXmlNode*>& out) {
    LoadChildren();
    for (NMAXmlNode* child : children_) {
        if (dynamic_cast<NMAXmlAttribute*>(child)) {
            out.push_back(child);
        }
    }
}

void NMAXmlElement::GetNonAttributes(std::vector<NMAXmlNode*>& out) {
    LoadChildren();
    for (NMAXmlNode* child : children_) {
        if (!dynamic_cast<NMAXmlAttribute*>(child)) {
            out.push_back(child);
        }
    }
}

}  // namespace NMA::XMLUtils
