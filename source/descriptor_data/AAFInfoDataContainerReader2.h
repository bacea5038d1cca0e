// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#pragma once

#include <array>
#include <optional>
#include <vector>

#include "host_interfaces/aaf/AAFPlainTypes.h"
#include "source/descriptor_data/GenericXMLDataContainer.h"
#include "source/plugin/Rational.h"

// Answers questions about the entry of "AAFInfo.xml" that fits one video
// compression id and one picture size. Made on the stack for one query.
//
// Every question searches the entry anew: the data are small, and a descriptor
// is made once for a clip. Results: NCF_E_NOTSUPPORTED when no entry fits,
// NCF_E_PARAMETERNOTAVAILABLE when the entry lacks the element; an output then
// keeps its value.
class AAFInfoDataContainerReader2 {
public:
    // The container is borrowed. The rate plays no part in the search.
    AAFInfoDataContainerReader2(const GenericXMLDataContainer* container, ncfUInt32 vcid,
                                const Rational& editRate, ncfUInt32 width, ncfUInt32 height);
    AAFInfoDataContainerReader2(const AAFInfoDataContainerReader2&) = delete;
    AAFInfoDataContainerReader2& operator=(const AAFInfoDataContainerReader2&) = delete;

    // Finds the entry. The first one in file order wins whose width is that
    // of the stored or the sampled picture and whose height fits: equal, half,
    // double, or 3 or 6 lines less. An id with a single entry takes any height.
    NCFRESULT GetMediaDescriptorSignature(ncfUInt32 vcid, ncfUInt32 width, ncfUInt32 height);

    NCFRESULT GetUID(const char* name, aafUID_t* outUID);
    NCFRESULT GetOneProperty(const char* name, NMAString* outString);
    NCFRESULT GetOneProperty(const char* name, ncfUInt32* elementValue);
    NCFRESULT GetTwoProperties(const char* name, const char* subName1, const char* subName2,
                               ncfUInt32* elementValue1, ncfUInt32* elementValue2);

    NCFRESULT IsDescriptorMPEG2(bool* isMPEG2);
    NCFRESULT IsDescriptorRGBA(bool* isRGBA);

    NCFRESULT GetPictureEssenceCodingFromVCID(aafUID_t* out) {
        return GetUID("rp210:PictureEssenceCoding", out);
    }
    NCFRESULT GetEssenceContainerLabelFromVCID(aafUID_t* out) {
        return GetUID("rp210:EssenceContainerLabel", out);
    }
    NCFRESULT GetFrameLayoutFromVCID(ncfUInt32* out) {
        return GetOneProperty("rp210:FrameLayout", out);
    }
    NCFRESULT GetStoredWidthFromVCID(ncfUInt32* out) {
        return GetOneProperty("rp210:StoredWidth", out);
    }
    NCFRESULT GetStoredHeightFromVCID(ncfUInt32* out) {
        return GetOneProperty("rp210:StoredHeight", out);
    }
    NCFRESULT GetSampledWidthFromVCID(ncfUInt32* out) {
        return GetOneProperty("rp210:SampledWidth", out);
    }
    NCFRESULT GetDisplayWidthFromVCID(ncfUInt32* out) {
        return GetOneProperty("rp210:DisplayWidth", out);
    }
    NCFRESULT GetDisplayHeightFromVCID(ncfUInt32* out) {
        return GetOneProperty("rp210:DisplayHeight", out);
    }
    NCFRESULT GetDisplayYOffsetFromVCID(ncfUInt32* out) {
        return GetOneProperty("rp210:DisplayYOffset", out);
    }
    // A few ids start at 0 whatever the file says.
    NCFRESULT GetImageStartOffsetFromVCID(ncfUInt32* outValue);
    NCFRESULT GetImageAlignmentOffsetFromVCID(ncfUInt32* out) {
        return GetOneProperty("rp210:ImageAlignmentOffset", out);
    }
    NCFRESULT GetComponentDepthFromVCID(ncfUInt32* out) {
        return GetOneProperty("rp210:ComponentDepth", out);
    }
    NCFRESULT GetHorizontalSubsamplingFromVCID(ncfUInt32* out) {
        return GetOneProperty("rp210:HorizontalSubsampling", out);
    }
    NCFRESULT GetVerticalSubsamplingFromVCID(ncfUInt32* out) {
        return GetOneProperty("rp210:VerticalSubsampling", out);
    }
    NCFRESULT GetColorSitingFromVCID(ncfUInt32* out) {
        return GetOneProperty("rp210:ColorSiting", out);
    }
    NCFRESULT GetColorRangeFromVCID(ncfUInt32* out) {
        return GetOneProperty("rp210:ColorRange", out);
    }
    // These two choose their element by what the last search found: ask
    // IsDescriptorRGBA first.
    NCFRESULT GetBlackRefLevelFromVCID(ncfUInt32* out) {
        return GetOneProperty(isRGBA_ ? "rp210:ComponentMinRef" : "rp210:BlackRefLevel", out);
    }
    NCFRESULT GetWhiteRefLevelFromVCID(ncfUInt32* out) {
        return GetOneProperty(isRGBA_ ? "rp210:ComponentMaxRef" : "rp210:WhiteReflevel", out);
    }
    NCFRESULT GetMaxGOPFromVCID(ncfUInt32* out) { return GetOneProperty("rp210:MaxGOP", out); }
    NCFRESULT GetBitRateFromVCID(ncfUInt32* out) { return GetOneProperty("rp210:BitRate", out); }
    NCFRESULT GetAVCSliceCounter(ncfUInt32* out) { return GetOneProperty("AVCSliceCounter", out); }
    NCFRESULT GetAspectRatioFromVCID(ncfUInt32* outNumerator, ncfUInt32* outDenominator);
    // Two hexadecimal digits behind "0x"; another text is passed over.
    NCFRESULT GetProfileAndLevelFromVCID(ncfUInt8* outProfileAndLevel);
    // These two append.
    NCFRESULT GetVideoLineMapFromVCID(std::vector<ncfSInt32>* outVideoLineMap);
    NCFRESULT GetPixelLayoutFromVCID(std::vector<aafRGBAComponent_t>* outPixelLayoutVect);

private:
    bool FindDescriptor(const XMLDataPropertyValue* entry);
    bool DescriptorFits(ncfUInt32 width, ncfUInt32 height, bool isOnlyEntry) const;

    const GenericXMLDataContainer* container_;
    const ncfUInt32 m_curVCID;
    [[maybe_unused]] const Rational editRate_;
    const ncfUInt32 m_curWidth;
    const ncfUInt32 m_curHeight;
    XMLDataPropertyValue* signature_ = nullptr;   // the entry found
    XMLDataPropertyValue* descriptor_ = nullptr;  // its descriptor
    // Id, width and height that it was found for; each value is asked of the same entry.
    std::optional<std::array<ncfUInt32, 3>> found_;
    bool isMPEG2_ = false;
    bool isRGBA_ = false;
};

// The same questions to a given descriptor.
NCFRESULT GetUIDImpl(const XMLDataPropertyValue* pMediaDescriptorNode, const char* name,
                     aafUID_t* outUID);
NCFRESULT GetOnePropertyImpl(const XMLDataPropertyValue* pMediaDescriptorNode, const char* name,
                             NMAString* elementValue);
NCFRESULT GetTwoPropertiesImpl(const XMLDataPropertyValue* pMediaDescriptorNode, const char* name,
                               const char* subName1, const char* subName2, ncfUInt32* elementValue1,
                               ncfUInt32* elementValue2);
