// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <memory>

#include "host_interfaces/framework/ComponentFactory.h"
#include "source/parameters/xml/NMAXmlDoc.h"
#include "source/plugin/BoundsBox.h"

// What a movie's colour text says.
struct ColorSpaceDescriptor {
    NCFSmartPtr<INCFString> name;
    ncfSInt32 bitDepth = 0;
    ncfSInt32 minReference = -1;  // -1: not given
    ncfSInt32 maxReference = -1;
    NCFSmartPtr<INCFString> transferCharacteristicName;
    GUID transferCharacteristicUID{};
};

// The boxes of a movie's geometry text.
enum QTBoxKind : ncfUInt32 {
    kBoxFraming = 0,
    kBoxValid = 1,
    kBoxEssence = 2,
    kBoxSource = 3,
};

namespace ParseHelperFunctions {

// Reads the XML texts that a movie keeps in its video sample description: the
// colour text and the geometry text, each from its tag to its end. Lives on the
// stack of one call.
class QTAttributesXMLParser {
public:
    // Loads the text; `op_res` tells how that went.
    QTAttributesXMLParser(NCFSmartPtr<INCFComponentFactory> factory, const NMAString& xmlText,
                          NCFRESULT& op_res);

    // Throws NCF_E_UNEXPECTED when the label of the transfer characteristic is
    // missing or empty. A label that can't be read leaves the field as it was.
    NCFRESULT GetColorSpaceDescriptor(ColorSpaceDescriptor* op_descriptor);
    // NMA_E_NODATA when there is no such box. Fields read before a failure stay
    // filled.
    NCFRESULT GetBox(QTBoxKind kind, BoundsBox* op_box);

private:
    NMAString _ReadElement(const char* tag, bool required);
    NCFRESULT _GetNumerator(NMA::XMLUtils::NMAXmlElement* node, ncfSInt32* value);
    NCFRESULT _GetDenominator(NMA::XMLUtils::NMAXmlElement* node, ncfSInt32* value);

    NCFSmartPtr<INCFComponentFactory> factory_;
    NMAString xmlText_;
    std::unique_ptr<NMA::XMLUtils::NMAXmlDoc> document_;
    NMA::XMLUtils::NMAXmlElement* root_ = nullptr;  // owned by the document
};

}  // namespace ParseHelperFunctions
