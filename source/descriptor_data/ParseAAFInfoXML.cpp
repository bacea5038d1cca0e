// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/descriptor_data/ParseAAFInfoXML.h"

#include "source/descriptor_data/XMLParserHelpers.h"
#include "source/plugin/ResultChecks.h"

namespace {

// One element below a descriptor; a row of level n + 1 belongs to the nearest
// row of level n before it.
struct PropertyRow {
    int level;
    const char* name;
    ncfUInt32 kind;
};
constexpr int kDeepestLevel = 2;

constexpr PropertyRow kCDCIProperties[] = {
    {0, "rp210:SampleRate", DCF_COMPLEX_ELEMENT},
    {1, "types:Numerator", DCF_ELEMENT},
    {1, "types:Denominator", DCF_ELEMENT},
    {0, "rp210:PictureEssenceCoding", DCF_ELEMENT},
    {0, "rp210:EssenceContainerLabel", DCF_ELEMENT},
    {0, "rp210:FrameLayout", DCF_ELEMENT},
    {0, "rp210:ImageStartOffset", DCF_ELEMENT},
    {0, "rp210:ImageAlignmentOffset", DCF_ELEMENT},
    {0, "rp210:ComponentDepth", DCF_ELEMENT},
    {0, "rp210:StoredWidth", DCF_ELEMENT},
    {0, "rp210:StoredHeight", DCF_ELEMENT},
    {0, "rp210:SampledWidth", DCF_ELEMENT},
    {0, "rp210:DisplayWidth", DCF_ELEMENT},
    {0, "rp210:DisplayHeight", DCF_ELEMENT},
    {0, "rp210:DisplayYOffset", DCF_ELEMENT},
    {0, "rp210:AspectRatio", DCF_COMPLEX_ELEMENT},
    {1, "types:Numerator", DCF_ELEMENT},
    {1, "types:Denominator", DCF_ELEMENT},
    {0, "rp210:HorizontalSubsampling", DCF_ELEMENT},
    {0, "rp210:VerticalSubsampling", DCF_ELEMENT},
    {0, "rp210:ColorSiting", DCF_ELEMENT},
    {0, "rp210:ColorRange", DCF_ELEMENT},
    {0, "rp210:VideoLineMap", DCF_COMPLEX_ELEMENT},
    {1, "rp210:Element", DCF_ELEMENT},
    {0, "rp210:BlackRefLevel", DCF_ELEMENT},
    {0, "rp210:WhiteReflevel", DCF_ELEMENT},  // the file spells it so
    {0, "AVCSliceCounter", DCF_ELEMENT},
};

constexpr PropertyRow kMPEG2Properties[] = {
    {0, "rp210:ProfileAndLevel", DCF_ELEMENT},
    {0, "rp210:BitRate", DCF_ELEMENT},
    {0, "rp210:MaxGOP", DCF_ELEMENT},
};

constexpr PropertyRow kRGBAProperties[] = {
    {0, "rp210:SampleRate", DCF_COMPLEX_ELEMENT},
    {1, "types:Numerator", DCF_ELEMENT},
    {1, "types:Denominator", DCF_ELEMENT},
    {0, "rp210:PictureEssenceCoding", DCF_ELEMENT},
    {0, "rp210:EssenceContainerLabel", DCF_ELEMENT},
    {0, "rp210:FrameLayout", DCF_ELEMENT},
    {0, "rp210:ImageStartOffset", DCF_ELEMENT},
    {0, "rp210:ImageAlignmentOffset", DCF_ELEMENT},
    {0, "rp210:StoredWidth", DCF_ELEMENT},
    {0, "rp210:StoredHeight", DCF_ELEMENT},
    {0, "rp210:SampledWidth", DCF_ELEMENT},
    {0, "rp210:DisplayWidth", DCF_ELEMENT},
    {0, "rp210:DisplayHeight", DCF_ELEMENT},
    {0, "rp210:DisplayYOffset", DCF_ELEMENT},
    {0, "rp210:AspectRatio", DCF_COMPLEX_ELEMENT},
    {1, "types:Numerator", DCF_ELEMENT},
    {1, "types:Denominator", DCF_ELEMENT},
    {0, "rp210:VideoLineMap", DCF_COMPLEX_ELEMENT},
    {1, "rp210:Element", DCF_ELEMENT},
    {0, "rp210:ComponentMaxRef", DCF_ELEMENT},
    {0, "rp210:ComponentMinRef", DCF_ELEMENT},
    {0, "rp210:PixelLayout", DCF_COMPLEX_ELEMENT},
    {1, "rp210:RGBALayout", DCF_COMPLEX_ELEMENT},
    {2, "rp210:Code", DCF_ELEMENT},
    {2, "rp210:Depth", DCF_ELEMENT},
};

template <std::size_t count>
NCFRESULT AddProperties(GenericXMLDataContainer* dataContainer,
                        XMLDataPropertyValue* descriptorNode, const PropertyRow (&rows)[count]) {
    NCF_FUNCTION("ParseAAFInfoXML::AddProperties");
    CHK_INARG(dataContainer);
    CHK_INARG(descriptorNode);
    XMLDataPropertyValue* parents[kDeepestLevel + 2] = {descriptorNode};
    for (const PropertyRow& row : rows) {
        XMLDataPropertyValue* node = nullptr;
        NCF_RETURN(dataContainer->CreateDescriptionNode(row.name, row.kind, &node));
        NCF_RETURN(parents[row.level]->AddChild(node));
        parents[row.level + 1] = node;
    }
    return NCF_OK;
}

// Every failure of a step ends the loading in the same way.
void Require(NCFRESULT result) {
    if (result != NCF_OK) {
        throw NCF_E_FAIL;
    }
}

XMLDataPropertyValue* Declare(GenericXMLDataContainer* container, const char* name,
                              ncfUInt32 kind) {
    XMLDataPropertyValue* node = nullptr;
    Require(container->CreateDescriptionNode(name, kind, &node));
    return node;
}

void DeclareShape(GenericXMLDataContainer* container) {
    XMLDataPropertyValue* const signature =
        Declare(container, "MediaDescriptorSignature", DCF_ENTRY_ELEMENT);
    XMLDataPropertyValue* const info = Declare(container, "NivoInfo", DCF_COMPLEX_ELEMENT);
    XMLDataPropertyValue* const id = Declare(container, "ResolutionID", DCF_KEY_ELEMENT);
    XMLDataPropertyValue* const cdci =
        Declare(container, "groups:CDCIDescriptor", DCF_COMPLEX_ELEMENT);
    Require(AddCDCIProperties(container, cdci));
    XMLDataPropertyValue* const mpeg2 =
        Declare(container, "groups:MPEG2VideoDescriptor", DCF_COMPLEX_ELEMENT);
    Require(AddCDCIProperties(container, mpeg2));
    AddMPEG2Properties(container, mpeg2);
    XMLDataPropertyValue* const rgba =
        Declare(container, "groups:RGBADescriptor", DCF_COMPLEX_ELEMENT);
    Require(AddRGBAProperties(container, rgba));

    Require(container->SetContainerDescription(signature));
    signature->AddChild(info);
    Require(info->AddChild(id));
    Require(signature->AddChild(cdci));
    Require(signature->AddChild(mpeg2));
    Require(signature->AddChild(rgba));
}

}  // namespace

NCFRESULT AddCDCIProperties(GenericXMLDataContainer* dataContainer,
                            XMLDataPropertyValue* descriptorNode) {
    NCF_FUNCTION("AddCDCIProperties");
    NCF_RETURN(AddProperties(dataContainer, descriptorNode, kCDCIProperties));
    return NCF_OK;
}

NCFRESULT AddMPEG2Properties(GenericXMLDataContainer* dataContainer,
                             XMLDataPropertyValue* descriptorNode) {
    NCF_FUNCTION("AddMPEG2Properties");
    NCF_RETURN(AddProperties(dataContainer, descriptorNode, kMPEG2Properties));
    return NCF_OK;
}

NCFRESULT AddRGBAProperties(GenericXMLDataContainer* dataContainer,
                            XMLDataPropertyValue* descriptorNode) {
    NCF_FUNCTION("AddRGBAProperties");
    NCF_RETURN(AddProperties(dataContainer, descriptorNode, kRGBAProperties));
    return NCF_OK;
}

void ParseAAFInfoXML(INCFComponentFactory* factory, GenericXMLDataContainer* container,
                     const NMAString& filePath) {
    DeclareShape(container);
    NCFSmartPtr<UTIL::INCFSaxDocumentHandler> handler;
    Require(ParseHelperFunctions::MakeDocHandler(factory, container, handler));
    Require(ParseHelperFunctions::ParseXML(filePath, handler.inArg(), factory));
}
