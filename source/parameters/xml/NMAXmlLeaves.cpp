// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/xml/NMAXmlLeaves.h"

#include "source/parameters/xml/NMAXmlElement.h"
#include "source/plugin/ResultChecks.h"

namespace NMA::XMLUtils {
namespace {

// The tag of the element that a leaf stands in; the writer places it by that.
NMAString ParentTag(const NMAXmlNode& leaf) {
    auto* const element = dynamic_cast<NMAXmlElement*>(leaf.Parent());
    if (!element) {
        ThrowIfFailed(NMA_E_NOTINITIALIZED);
    }
    NMAString tag;
    element->GetTagName(tag);
    return tag;
}

}  // namespace

void NMAXmlAttribute::CopyTo(NMAXmlNode& target) {
    NMAXmlNode::CopyTo(target);
    auto& copy = static_cast<NMAXmlAttribute&>(target);
    copy.name_ = name_;
    copy.value_ = value_;
}

NCFRESULT NMAXmlAttribute::WriteTo(IXmlWriter* writer) {
    if (!writer) {
        return NCF_E_INVALIDARG;
    }
    const NMAString tag = ParentTag(*this);
    if (state_ == kDeleted) {
        return NCF_OK;
    }
    NMAString name;
    NMAString value;
    GetNodeName(name);
    GetNodeValue(value);
    ThrowIfFailed(writer->Attribute(tag.InArg(), name.InArg(), value.InArg()));
    return NCF_OK;
}

void NMAXmlAttribute::GetNodeName(NMAString& out) {
    if (state_ == kDeleted) {
        ThrowIfFailed(NMA_E_NODATA);
    }
    if (HoldsOwnText()) {
        out = name_;
    } else {
        NMAXmlNode::GetNodeName(out);
    }
}

void NMAXmlAttribute::GetNodeValue(NMAString& out) {
    if (state_ == kDeleted) {
        ThrowIfFailed(NMA_E_NODATA);
    }
    if (HoldsOwnText()) {
        out = value_;
    } else {
        NMAXmlNode::GetNodeValue(out);
    }
}

void NMAXmlAttribute::SetValue(const NMAString& value) {
    // From here on the stored texts stand, so the host's name is taken first.
    GetNodeName(name_);
    value_ = value;
    SetChanged();
}

void NMAXmlText::CopyTo(NMAXmlNode& target) {
    NMAXmlNode::CopyTo(target);
    static_cast<NMAXmlText&>(target).text_ = text_;
}

NCFRESULT NMAXmlText::WriteTo(IXmlWriter* writer) {
    if (!writer) {
        ThrowIfFailed(NCF_E_INVALIDARG);
    }
    const NMAString tag = ParentTag(*this);
    if (state_ == kDeleted) {
        return NCF_OK;
    }
    ThrowIfFailed(writer->Text(GetText().InArg(), tag.InArg()));
    return NCF_OK;
}

NMAString NMAXmlText::GetText() {
    if (state_ == kDeleted) {
        return NMAString();
    }
    if (HoldsOwnText()) {
        return text_;
    }
    NMAString value;
    GetNodeValue(value);
    return value;
}

NCFRESULT NMAXmlCDATA::WriteTo(IXmlWriter* writer) {
    if (!writer) {
        ThrowIfFailed(NCF_E_INVALIDARG);
    }
    return NCF_OK;
}

}  // namespace NMA::XMLUtils
