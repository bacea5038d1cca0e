// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The places of the clip's operations in its table, written down once more: other
// parts of the system call them by place.

#include <gtest/gtest.h>

#include "source/clips/BaseClip.h"
#include "tests/support/Slots.h"

namespace {

// The destructor counts as one, although the compilers in use give it two entries.
template <class Operation>
std::size_t ClipSlotOf(Operation operation) {
    return SlotOf(operation) - 1;
}

// clang-format off
const SlotRow kSlots[] = {
    {"BaseClip::SetFieldLayoutDetails", 1, ClipSlotOf(&BaseClip::SetFieldLayoutDetails)},
    {"BaseClip::GetNMAFrameLayout", 2, ClipSlotOf(&BaseClip::GetNMAFrameLayout)},
    {"BaseClip::GetDataFormat", 3, ClipSlotOf(&BaseClip::GetDataFormat)},
    {"BaseClip::GetVendor", 4, ClipSlotOf(&BaseClip::GetVendor)},
    {"BaseClip::GetNivoResolution", 5, ClipSlotOf(&BaseClip::GetNivoResolution)},
    {"BaseClip::GetTrackCount", 6, ClipSlotOf(&BaseClip::GetTrackCount)},
    {"BaseClip::GetVideoTrackQTId", 7, ClipSlotOf(&BaseClip::GetVideoTrackQTId)},
    {"BaseClip::GetAudioTrackQTId", 8, ClipSlotOf(&BaseClip::GetAudioTrackQTId)},
    {"BaseClip::GetTimecodeTrackQTId", 9, ClipSlotOf(&BaseClip::GetTimecodeTrackQTId)},
    {"BaseClip::GetTrackType", 10, ClipSlotOf(&BaseClip::GetTrackType)},
    {"BaseClip::GetTimeCodeTrackMetadata", 11, ClipSlotOf(&BaseClip::GetTimeCodeTrackMetadata)},
    {"BaseClip::GetAudioTrackMetadata", 12, ClipSlotOf(&BaseClip::GetAudioTrackMetadata)},
    {"BaseClip::IsAudioLPCM", 13, ClipSlotOf(&BaseClip::IsAudioLPCM)},
    {"BaseClip::GetEditRate", 14, ClipSlotOf(&BaseClip::GetEditRate)},
    {"BaseClip::GetMovieLength", 15, ClipSlotOf(&BaseClip::GetMovieLength)},
    {"BaseClip::GetCreationTime", 16, ClipSlotOf(&BaseClip::GetCreationTime)},
    {"BaseClip::GetCodecName", 17, ClipSlotOf(&BaseClip::GetCodecName)},
    {"BaseClip::GetContentForHash", 18, ClipSlotOf(&BaseClip::GetContentForHash)},
    {"BaseClip::IsSelfContained", 19, ClipSlotOf(&BaseClip::IsSelfContained)},
    {"BaseClip::IsVideoSampleProviderMedia", 20, ClipSlotOf(&BaseClip::IsVideoSampleProviderMedia)},
    {"BaseClip::HasOneFrame", 21, ClipSlotOf(&BaseClip::HasOneFrame)},
    {"BaseClip::IsMultiFormatMovie", 22, ClipSlotOf(&BaseClip::IsMultiFormatMovie)},
    {"BaseClip::GetFileName", 23, ClipSlotOf(&BaseClip::GetFileName)},
    {"BaseClip::SetEditRate", 24, ClipSlotOf(&BaseClip::SetEditRate)},
    {"BaseClip::SetMovieLength", 25, ClipSlotOf(&BaseClip::SetMovieLength)},
    {"BaseClip::GetEncodedWidthAndHeight", 26, ClipSlotOf(&BaseClip::GetEncodedWidthAndHeight)},
    {"BaseClip::GetImageAspectRatio", 27, ClipSlotOf(&BaseClip::GetImageAspectRatio)},
    {"BaseClip::GetColorSpace", 28, ClipSlotOf(&BaseClip::GetColorSpace)},
    {"BaseClip::GetTemporalFieldOrder", 29, ClipSlotOf(&BaseClip::GetTemporalFieldOrder)},
    {"BaseClip::GetFrameBufferLayout", 30, ClipSlotOf(&BaseClip::GetFrameBufferLayout)},
    {"BaseClip::GetBufferLineOrientation", 31, ClipSlotOf(&BaseClip::GetBufferLineOrientation)},
    {"BaseClip::GetTimeCodeTrackCount", 32, ClipSlotOf(&BaseClip::GetTimeCodeTrackCount)},
    {"BaseClip::GetVideoTrackCount", 33, ClipSlotOf(&BaseClip::GetVideoTrackCount)},
    {"BaseClip::GetAudioTrackCount", 34, ClipSlotOf(&BaseClip::GetAudioTrackCount)},
    {"BaseClip::GetNumSamples", 35, ClipSlotOf(&BaseClip::GetNumSamples)},
    {"BaseClip::GetDataOffset", 36, ClipSlotOf(&BaseClip::GetDataOffset)},
    {"BaseClip::GetSampleFlags", 37, ClipSlotOf(&BaseClip::GetSampleFlags)},
    {"BaseClip::GetNextDiscontiguousDataAttributeChange", 38, ClipSlotOf(&BaseClip::GetNextDiscontiguousDataAttributeChange)},
    {"BaseClip::GetDataSizePerSample", 39, ClipSlotOf(&BaseClip::GetDataSizePerSample)},
    {"BaseClip::GetDisplayOffset", 40, ClipSlotOf(&BaseClip::GetDisplayOffset)},
    {"BaseClip::GetDecodeDuration", 41, ClipSlotOf(&BaseClip::GetDecodeDuration)},
    {"BaseClip::GetMaxDataSizeInBytes", 42, ClipSlotOf(&BaseClip::GetMaxDataSizeInBytes)},
    {"BaseClip::GetHasOutOfOrderFrameDependencies", 43, ClipSlotOf(&BaseClip::GetHasOutOfOrderFrameDependencies)},
    {"BaseClip::IsAudioSampleProviderMedia", 44, ClipSlotOf(&BaseClip::IsAudioSampleProviderMedia)},
    {"BaseClip::GetColorDetails", 45, ClipSlotOf(&BaseClip::GetColorDetails)},
    {"BaseClip::GetGeometryDetails", 46, ClipSlotOf(&BaseClip::GetGeometryDetails)},
    {"BaseClip::LoadClipImpl", 47, ClipSlotOf(&BaseClip::LoadClipImpl)},
    {"BaseClip::SetColorSpaceImpl", 48, ClipSlotOf(&BaseClip::SetColorSpaceImpl)},
    {"BaseClip::SetGeometryImpl", 49, ClipSlotOf(&BaseClip::SetGeometryImpl)},
    {"BaseClip::SetEditRateImpl", 50, ClipSlotOf(&BaseClip::SetEditRateImpl)},
    {"BaseClip::SetMovieLengthImpl", 51, ClipSlotOf(&BaseClip::SetMovieLengthImpl)},
    {"BaseClip::GetEncodedWidthAndHeightImpl", 52, ClipSlotOf(&BaseClip::GetEncodedWidthAndHeightImpl)},
    {"BaseClip::GetImageAspectRatioImpl", 53, ClipSlotOf(&BaseClip::GetImageAspectRatioImpl)},
    {"BaseClip::GetTimeCodeTrackCountImpl", 54, ClipSlotOf(&BaseClip::GetTimeCodeTrackCountImpl)},
    {"BaseClip::GetVideoTrackCountImpl", 55, ClipSlotOf(&BaseClip::GetVideoTrackCountImpl)},
    {"BaseClip::GetAudioTrackCountImpl", 56, ClipSlotOf(&BaseClip::GetAudioTrackCountImpl)},
    {"BaseClip::CalculateAudioTrackLengthInSamples", 57, ClipSlotOf(&BaseClip::CalculateAudioTrackLengthInSamples)},
};
// clang-format on

TEST(BaseClip, KeepsItsOperationsInTheirPlaces) {
    ExpectPublishedPlaces(kSlots);
}

}  // namespace
