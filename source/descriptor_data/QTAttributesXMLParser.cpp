// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/descriptor_data/QTAttributesXMLParser.h"

#include "source/plugin/GuidText.h"
#include "source/plugin/PluginLogSink.h"
#include "source/plugin/ResultChecks.h"
#include "source/plugin/TextToNumber.h"

namespace ParseHelperFunctions {
namespace {

using NMA::XMLUtils::NMAXmlDoc;
using NMA::XMLUtils::NMAXmlElement;

// Stands for a value that is missing; numbers read from it are 0.
constexpr char kEmptyValue[] = "Empty";

constexpr const char* kBoxTags[] = {"Framing", "Valid", "Essence", "Source"};

NMAXmlElement* FirstChild(NMAXmlElement* node, const char* tag) {
    return node->FindChild(NMAString(tag), 0);
}

NMAString TextOf(NMAXmlElement* node) {
    NMAString text;
    node->GetText(text);
    return text;
}

ncfSInt32 NumberOf(const NMAString& text) {
    return static_cast<ncfSInt32>(TextToNumber(text.GetUTF8String()));
}

// A level below 1 can't be told from one that is not given.
ncfSInt32 ReferenceOf(const NMAString& text) {
    const ncfSInt32 level = NumberOf(text);
    return level < 1 ? -1 : level;
}

NCFSmartPtr<INCFString> HostString(const NMAString& text) {
    NCFSmartPtr<INCFString> string;
    ThrowIfFailed(NMAString::CreateString(string.outArg()));
    ThrowIfFailed(string->Assign(text.InArg()));
    return string;
}

}  // namespace

QTAttributesXMLParser::QTAttributesXMLParser(NCFSmartPtr<INCFComponentFactory> factory,
                                             const NMAString& xmlText, NCFRESULT& op_res)
    : factory_(factory), xmlText_(xmlText) {
    op_res = NCF_OK;
    try {
        document_ = std::make_unique<NMAXmlDoc>(factory_.inArg());
        document_->LoadFromString(xmlText_);
        root_ = document_->GetRoot();
    } catch (NCFRESULT failure) {
        op_res = failure;
    } catch (...) {
        op_res = NCF_E_UNEXPECTED;
    }
}

NMAString QTAttributesXMLParser::_ReadElement(const char* tag, bool required) {
    NCF_FUNCTION("ParseHelperFunctions::QTAttributesXMLParser::_ReadElement");
    NMAXmlElement* const element = FirstChild(root_, tag);
    const NMAString text = element ? TextOf(element) : NMAString();
    if (!text.IsEmpty()) {
        return text;
    }
    if (required) {
        ThrowIfFailed(NCF_E_UNEXPECTED);
    }
    slog::Error(ncfFunction) << "Element with tag <" << tag
                             << (element ? "> is empty!" : "> is missing!");
    return NMAString(kEmptyValue);
}

NCFRESULT QTAttributesXMLParser::GetColorSpaceDescriptor(ColorSpaceDescriptor* op_descriptor) {
    NCF_FUNCTION("ParseHelperFunctions::QTAttributesXMLParser::GetColorSpaceDescriptor");
    CHK_PTR(op_descriptor);
    if (!root_) {
        return NMA_E_NOTINITIALIZED;
    }
    op_descriptor->name = HostString(_ReadElement("Name", false));
    op_descriptor->bitDepth = NumberOf(_ReadElement("BitDepth", false));
    op_descriptor->minReference = ReferenceOf(_ReadElement("MinReference", false));
    op_descriptor->maxReference = ReferenceOf(_ReadElement("MaxReference", false));
    op_descriptor->transferCharacteristicName =
        HostString(_ReadElement("TransferCharacteristicName", false));
    (void)StringToGUID(_ReadElement("TransferCharacteristicUID", true),
                       &op_descriptor->transferCharacteristicUID);
    return NCF_OK;
}

NCFRESULT QTAttributesXMLParser::GetBox(QTBoxKind kind, BoundsBox* op_box) {
    NCF_FUNCTION("ParseHelperFunctions::QTAttributesXMLParser::GetBox");
    CHK_PTR(op_box);
    if (!root_) {
        return NMA_E_NOTINITIALIZED;
    }
    NMAXmlElement* const box = kind <= kBoxSource ? FirstChild(root_, kBoxTags[kind]) : nullptr;
    if (!box) {
        return NMA_E_NODATA;
    }
    NMAXmlElement* const positionXNode = FirstChild(box, "PositionX");
    NCFASSERT(positionXNode);
    NCF_RETURN(_GetNumerator(positionXNode,&op_box->positionX.numerator));
    NCF_RETURN(_GetDenominator(positionXNode,&op_box->positionX.denominator));
    NMAXmlElement* const positionYNode = FirstChild(box, "PositionY");
    NCFASSERT(positionYNode);
    NCF_RETURN(_GetNumerator(positionYNode,&op_box->positionY.numerator));
    NCF_RETURN(_GetDenominator(positionYNode,&op_box->positionY.denominator));
    NMAXmlElement* const heightNode = FirstChild(box, "Height");
    NCFASSERT(heightNode);
    NCF_RETURN(_GetNumerator(heightNode,&op_box->height.numerator));
    NCF_RETURN(_GetDenominator(heightNode, &op_box->height.denominator));
    NMAXmlElement* const widthNode = FirstChild(box, "Width");
    NCFASSERT(widthNode);
    NCF_RETURN(_GetNumerator(widthNode, &op_box->width.numerator));
    NCF_RETURN(_GetDenominator(widthNode, &op_box->width.denominator));
    return NCF_OK;
}

NCFRESULT QTAttributesXMLParser::_GetNumerator(NMAXmlElement* node, ncfSInt32* value) {
    NCF_FUNCTION("ParseHelperFunctions::QTAttributesXMLParser::_GetNumerator");
    NMAXmlElement* const numeratorElement = FirstChild(node, "Numerator");
    NCFASSERT(numeratorElement);
    const NMAString text = TextOf(numeratorElement);
    if (text.IsEmpty()) {
        return NCF_E_UNEXPECTED;
    }
    *value = NumberOf(text);
    return NCF_OK;
}

NCFRESULT QTAttributesXMLParser::_GetDenominator(NMAXmlElement* node, ncfSInt32* value) {
    NCF_FUNCTION("ParseHelperFunctions::QTAttributesXMLParser::_GetDenominator");
    // Logged under the numerator's name, as its twin.
    NMAXmlElement* const denominatorElement = FirstChild(node, "Denominator");
    NCFASSERT_TEXT("numeratorElement", denominatorElement);
    const NMAString text = TextOf(denominatorElement);
    if (text.IsEmpty()) {
        return NCF_E_UNEXPECTED;
    }
    *value = NumberOf(text);
    return NCF_OK;
}

}  // namespace ParseHelperFunctions
