// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/descriptor_data/AAFInfoFields.h"

namespace {

using Reader = AAFInfoDataContainerReader2;

// What it means that an entry is silent on a field.
enum Silence {
    kFails,
    kKeepsDefault,
    kKeepsDefaultInRGBA,  // and fails elsewhere
};

struct Field {
    const char* getter;
    NCFRESULT (*read)(Reader& reader, AAFInfo& info);
    Silence silence;
    // Value to take instead of the default; may be null.
    void (*substitute)(AAFInfo& info) = nullptr;
};

// Reads a value that fills one field.
template <auto getter, auto field>
NCFRESULT Read(Reader& reader, AAFInfo& info) {
    return (reader.*getter)(&(info.*field));
}

constexpr Field kPictureFields[] = {
    {kContainerLabelGetter,
     Read<&Reader::GetEssenceContainerLabelFromVCID, &AAFInfo::essenceContainerLabel>, kFails},
    {"GetFrameLayoutFromVCID", Read<&Reader::GetFrameLayoutFromVCID, &AAFInfo::frameLayout>,
     kFails},
    {"GetStoredWidthFromVCID", Read<&Reader::GetStoredWidthFromVCID, &AAFInfo::storedWidth>,
     kFails},
    {"GetStoredHeightFromVCID", Read<&Reader::GetStoredHeightFromVCID, &AAFInfo::storedHeight>,
     kFails},
    {"GetSampledWidthFromVCID", Read<&Reader::GetSampledWidthFromVCID, &AAFInfo::sampledWidth>,
     kKeepsDefault, [](AAFInfo& i) { i.sampledWidth = i.storedWidth; }},
    {"GetDisplayWidthFromVCID", Read<&Reader::GetDisplayWidthFromVCID, &AAFInfo::displayWidth>,
     kKeepsDefault, [](AAFInfo& i) { i.displayWidth = i.storedWidth; }},
    {"GetDisplayHeightFromVCID", Read<&Reader::GetDisplayHeightFromVCID, &AAFInfo::displayHeight>,
     kKeepsDefault, [](AAFInfo& i) { i.displayHeight = i.storedHeight; }},
    {"GetDisplayYOffsetFromVCID",
     Read<&Reader::GetDisplayYOffsetFromVCID, &AAFInfo::displayYOffset>, kKeepsDefault},
    {"GetAspectRatioFromVCID",
     [](Reader& r, AAFInfo& i) {
         return r.GetAspectRatioFromVCID(&i.aspectNumerator, &i.aspectDenominator);
     },
     kFails},
    {"GetImageStartOffsetFromVCID",
     Read<&Reader::GetImageStartOffsetFromVCID, &AAFInfo::ImageStartOffset>, kKeepsDefault},
    {"GetImageAlignmentOffsetFromVCID",
     Read<&Reader::GetImageAlignmentOffsetFromVCID, &AAFInfo::imageAlignmentOffset>, kKeepsDefault},
    {"GetPictureEssenceCodingFromVCID",
     Read<&Reader::GetPictureEssenceCodingFromVCID, &AAFInfo::pictureEssenceCoding>, kFails},
    {"GetComponentDepthFromVCID",
     Read<&Reader::GetComponentDepthFromVCID, &AAFInfo::componentDepth>, kKeepsDefaultInRGBA},
    {"GetVideoLineMapFromVCID", Read<&Reader::GetVideoLineMapFromVCID, &AAFInfo::videoLineMapVect>,
     kFails},
    {"GetHorizontalSubsamplingFromVCID",
     Read<&Reader::GetHorizontalSubsamplingFromVCID, &AAFInfo::horizontalSubsampling>,
     kKeepsDefaultInRGBA},
    {"GetVerticalSubsamplingFromVCID",
     Read<&Reader::GetVerticalSubsamplingFromVCID, &AAFInfo::verticalSubsampling>,
     kKeepsDefaultInRGBA},
    {"GetColorSitingFromVCID", Read<&Reader::GetColorSitingFromVCID, &AAFInfo::colorSiting>,
     kKeepsDefaultInRGBA},
    {"GetBlackRefLevelFromVCID", Read<&Reader::GetBlackRefLevelFromVCID, &AAFInfo::blackRefLevel>,
     kFails},
    {"GetWhiteRefLevelFromVCID", Read<&Reader::GetWhiteRefLevelFromVCID, &AAFInfo::whiteRefLevel>,
     kFails},
    {"GetColorRangeFromVCID", Read<&Reader::GetColorRangeFromVCID, &AAFInfo::colorRange>,
     kKeepsDefaultInRGBA},
    {"GetAVCSliceCounter", Read<&Reader::GetAVCSliceCounter, &AAFInfo::sliceCounter>,
     kKeepsDefault},
};

constexpr Field kMPEG2Fields[] = {
    {"GetBitRateFromVCID", Read<&Reader::GetBitRateFromVCID, &AAFInfo::bitRate>, kFails},
    {"GetProfileAndLevelFromVCID",
     Read<&Reader::GetProfileAndLevelFromVCID, &AAFInfo::levelAndProfile>, kFails},
    {"GetMaxGOPFromVCID", Read<&Reader::GetMaxGOPFromVCID, &AAFInfo::maxGOP>, kFails},
};

bool MayBeSilent(const Field& field, bool isRGBA) {
    return field.silence == kKeepsDefault || (field.silence == kKeepsDefaultInRGBA && isRGBA);
}

template <std::size_t count>
NCFRESULT ReadFields(const Field (&fields)[count], Reader& reader, bool isRGBA, AAFInfo& aafInfo,
                     const char** failedCall) {
    for (const Field& field : fields) {
        const NCFRESULT result = field.read(reader, aafInfo);
        if (result == NCF_OK) {
            continue;
        }
        if (result != NCF_E_PARAMETERNOTAVAILABLE || !MayBeSilent(field, isRGBA)) {
            *failedCall = field.getter;
            return result;
        }
        if (field.substitute) {
            field.substitute(aafInfo);
        }
    }
    return NCF_OK;
}

}  // namespace

NCFRESULT ReadPictureFields(AAFInfoDataContainerReader2& reader, bool isRGBA, AAFInfo& aafInfo,
                            const char** failedCall) {
    return ReadFields(kPictureFields, reader, isRGBA, aafInfo, failedCall);
}

NCFRESULT ReadMPEG2Fields(AAFInfoDataContainerReader2& reader, AAFInfo& aafInfo,
                          const char** failedCall) {
    return ReadFields(kMPEG2Fields, reader, false, aafInfo, failedCall);
}
