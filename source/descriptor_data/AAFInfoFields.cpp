// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/descriptor_data/AAFInfoFields.h"

namespace {

using Reader = AAFInfoDataContainerReader2;

// What it means that an entry is silent on a field.
enum class Silence {
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

// clang-format off
constexpr Field kPictureFields[] = {
    {kContainerLabelGetter,
     [](Reader& r, AAFInfo& i) { return r.GetEssenceContainerLabelFromVCID(&i.essenceContainerLabel); },
     Silence::kFails},
    {"GetFrameLayoutFromVCID",
     [](Reader& r, AAFInfo& i) { return r.GetFrameLayoutFromVCID(&i.frameLayout); },
     Silence::kFails},
    {"GetStoredWidthFromVCID",
     [](Reader& r, AAFInfo& i) { return r.GetStoredWidthFromVCID(&i.storedWidth); },
     Silence::kFails},
    {"GetStoredHeightFromVCID",
     [](Reader& r, AAFInfo& i) { return r.GetStoredHeightFromVCID(&i.storedHeight); },
     Silence::kFails},
    {"GetSampledWidthFromVCID",
     [](Reader& r, AAFInfo& i) { return r.GetSampledWidthFromVCID(&i.sampledWidth); },
     Silence::kKeepsDefault, [](AAFInfo& i) { i.sampledWidth = i.storedWidth; }},
    {"GetDisplayWidthFromVCID",
     [](Reader& r, AAFInfo& i) { return r.GetDisplayWidthFromVCID(&i.displayWidth); },
     Silence::kKeepsDefault, [](AAFInfo& i) { i.displayWidth = i.storedWidth; }},
    {"GetDisplayHeightFromVCID",
     [](Reader& r, AAFInfo& i) { return r.GetDisplayHeightFromVCID(&i.displayHeight); },
     Silence::kKeepsDefault, [](AAFInfo& i) { i.displayHeight = i.storedHeight; }},
    {"GetDisplayYOffsetFromVCID",
     [](Reader& r, AAFInfo& i) { return r.GetDisplayYOffsetFromVCID(&i.displayYOffset); },
     Silence::kKeepsDefault},
    {"GetAspectRatioFromVCID",
     [](Reader& r, AAFInfo& i) { return r.GetAspectRatioFromVCID(&i.aspectNumerator, &i.aspectDenominator); },
     Silence::kFails},
    {"GetImageStartOffsetFromVCID",
     [](Reader& r, AAFInfo& i) { return r.GetImageStartOffsetFromVCID(&i.ImageStartOffset); },
     Silence::kKeepsDefault},
    {"GetImageAlignmentOffsetFromVCID",
     [](Reader& r, AAFInfo& i) { return r.GetImageAlignmentOffsetFromVCID(&i.imageAlignmentOffset); },
     Silence::kKeepsDefault},
    {"GetPictureEssenceCodingFromVCID",
     [](Reader& r, AAFInfo& i) { return r.GetPictureEssenceCodingFromVCID(&i.pictureEssenceCoding); },
     Silence::kFails},
    {"GetComponentDepthFromVCID",
     [](Reader& r, AAFInfo& i) { return r.GetComponentDepthFromVCID(&i.componentDepth); },
     Silence::kKeepsDefaultInRGBA},
    {"GetVideoLineMapFromVCID",
     [](Reader& r, AAFInfo& i) { return r.GetVideoLineMapFromVCID(&i.videoLineMapVect); },
     Silence::kFails},
    {"GetHorizontalSubsamplingFromVCID",
     [](Reader& r, AAFInfo& i) { return r.GetHorizontalSubsamplingFromVCID(&i.horizontalSubsampling); },
     Silence::kKeepsDefaultInRGBA},
    {"GetVerticalSubsamplingFromVCID",
     [](Reader& r, AAFInfo& i) { return r.GetVerticalSubsamplingFromVCID(&i.verticalSubsampling); },
     Silence::kKeepsDefaultInRGBA},
    {"GetColorSitingFromVCID",
     [](Reader& r, AAFInfo& i) { return r.GetColorSitingFromVCID(&i.colorSiting); },
     Silence::kKeepsDefaultInRGBA},
    {"GetBlackRefLevelFromVCID",
     [](Reader& r, AAFInfo& i) { return r.GetBlackRefLevelFromVCID(&i.blackRefLevel); },
     Silence::kFails},
    {"GetWhiteRefLevelFromVCID",
     [](Reader& r, AAFInfo& i) { return r.GetWhiteRefLevelFromVCID(&i.whiteRefLevel); },
     Silence::kFails},
    {"GetColorRangeFromVCID",
     [](Reader& r, AAFInfo& i) { return r.GetColorRangeFromVCID(&i.colorRange); },
     Silence::kKeepsDefaultInRGBA},
    {"GetAVCSliceCounter",
     [](Reader& r, AAFInfo& i) { return r.GetAVCSliceCounter(&i.sliceCounter); },
     Silence::kKeepsDefault},
};

constexpr Field kMPEG2Fields[] = {
    {"GetBitRateFromVCID",
     [](Reader& r, AAFInfo& i) { return r.GetBitRateFromVCID(&i.bitRate); }, Silence::kFails},
    {"GetProfileAndLevelFromVCID",
     [](Reader& r, AAFInfo& i) { return r.GetProfileAndLevelFromVCID(&i.levelAndProfile); },
     Silence::kFails},
    {"GetMaxGOPFromVCID",
     [](Reader& r, AAFInfo& i) { return r.GetMaxGOPFromVCID(&i.maxGOP); }, Silence::kFails},
};
// clang-format on

bool MayBeSilent(const Field& field, bool isRGBA) {
    return field.silence == Silence::kKeepsDefault ||
           (field.silence == Silence::kKeepsDefaultInRGBA && isRGBA);
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
