// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The values of an entry, one operation for each.

#include <cstdio>
#include <cstring>

#include "source/descriptor_data/AAFInfoDataContainerReader2.h"
#include "source/plugin/ResultChecks.h"
#include "source/plugin/TextToNumber.h"

namespace {

// Ids whose pictures start at the first byte, whatever the file says.
constexpr ncfUInt32 kIdsWithoutStartOffset[] = {2000, 2003, 2004, 2021, 2022, 2023, 2024};

bool StartsAtZero(ncfUInt32 vcid) {
    for (const ncfUInt32 id : kIdsWithoutStartOffset) {
        if (id == vcid) {
            return true;
        }
    }
    return false;
}

}  // namespace

NCFRESULT AAFInfoDataContainerReader2::GetImageStartOffsetFromVCID(ncfUInt32* outValue) {
    NCF_FUNCTION("AAFInfoDataContainerReader2::GetImageStartOffsetFromVCID");
    if (StartsAtZero(m_curVCID)) {
        CHK_PTR(outValue);
        *outValue = 0;
        return NCF_OK;
    }
    return GetOneProperty("rp210:ImageStartOffset", outValue);
}

NCFRESULT AAFInfoDataContainerReader2::GetAspectRatioFromVCID(ncfUInt32* outNumerator,
                                                              ncfUInt32* outDenominator) {
    return GetTwoProperties("rp210:AspectRatio", "types:Numerator", "types:Denominator",
                            outNumerator, outDenominator);
}

NCFRESULT AAFInfoDataContainerReader2::GetProfileAndLevelFromVCID(ncfUInt8* outProfileAndLevel) {
    NCF_FUNCTION("AAFInfoDataContainerReader2::GetProfileAndLevelFromVCID");
    CHK_INARG(outProfileAndLevel);
    const char* const profileAndLevelNameString = "rp210:ProfileAndLevel";
    NMAString profileAndLevelValueString;
    NCF_RETURN(GetOneProperty(profileAndLevelNameString, &profileAndLevelValueString));
    const char* const text = profileAndLevelValueString.GetUTF8String();
    char digits[3] = {};
    if (std::strncmp(text, "0x", 2) == 0) {
        std::strncpy(digits, text + 2, 2);
    }
    unsigned value = *outProfileAndLevel;
    if (std::sscanf(digits, "%x", &value) == 1) {
        *outProfileAndLevel = static_cast<ncfUInt8>(value);
    }
    return NCF_OK;
}

NCFRESULT AAFInfoDataContainerReader2::GetVideoLineMapFromVCID(
    std::vector<ncfSInt32>* outVideoLineMap) {
    NCF_FUNCTION("AAFInfoDataContainerReader2::GetVideoLineMapFromVCID");
    CHK_INARG(outVideoLineMap);
    NCF_RETURN(GetMediaDescriptorSignature(m_curVCID, m_curWidth, m_curHeight));
    XMLDataPropertyValue* lineMap = nullptr;
    std::vector<XMLDataPropertyValue*> lines;
    if (descriptor_->FindPropertyInChildren("rp210:VideoLineMap", &lineMap) != NCF_OK ||
        lineMap->FindPropertyInChildren("rp210:Element", &lines) != NCF_OK) {
        return NCF_E_PARAMETERNOTAVAILABLE;
    }
    for (const XMLDataPropertyValue* line : lines) {
        outVideoLineMap->push_back(static_cast<ncfSInt32>(TextToNumber(line->ValueText())));
    }
    return NCF_OK;
}

NCFRESULT AAFInfoDataContainerReader2::GetPixelLayoutFromVCID(
    std::vector<aafRGBAComponent_t>* outPixelLayoutVect) {
    NCF_FUNCTION("AAFInfoDataContainerReader2::GetPixelLayoutFromVCID");
    CHK_INARG(outPixelLayoutVect);
    NCF_RETURN(GetMediaDescriptorSignature(m_curVCID, m_curWidth, m_curHeight));
    XMLDataPropertyValue* layout = nullptr;
    std::vector<XMLDataPropertyValue*> components;
    if (descriptor_->FindPropertyInChildren("rp210:PixelLayout", &layout) != NCF_OK ||
        layout->FindPropertyInChildren("rp210:RGBALayout", &components) != NCF_OK) {
        return NCF_E_PARAMETERNOTAVAILABLE;
    }
    for (const XMLDataPropertyValue* node : components) {
        XMLDataPropertyValue* code = nullptr;
        XMLDataPropertyValue* depth = nullptr;
        if (node->FindPropertyInChildren("rp210:Code", &code) != NCF_OK ||
            node->FindPropertyInChildren("rp210:Depth", &depth) != NCF_OK) {
            return NCF_E_PARAMETERNOTAVAILABLE;
        }
        aafRGBAComponent_t component{};
        component.Code = static_cast<unsigned char>(code->ValueText()[0]);
        component.Size = static_cast<aafUInt8>(TextToNumber(depth->ValueText()));
        outPixelLayoutVect->push_back(component);
    }
    return NCF_OK;
}
