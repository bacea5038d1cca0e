// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The places of the operations of host_interfaces/quicktime/ in their tables.

#include "host_interfaces/quicktime/QuickTimeProperty.h"
#include "host_interfaces/quicktime/QuickTimeWrapper.h"
#include "host_interfaces/quicktime/Readers.h"
#include "host_interfaces/quicktime/SampleTable.h"
#include "tests/support/Slots.h"

namespace {

// clang-format off
const SlotRow kQuickTimeSlots[] = {
    {"IQuickTimeProperty::CreateMovie", 3, SlotOf(&QuickTime::IQuickTimeProperty::CreateMovie)},
    {"IQuickTimeProperty::GetCodecPixelFormats", 4, SlotOf(&QuickTime::IQuickTimeProperty::GetCodecPixelFormats)},
    {"IQuickTimeProperty::GetCodecName", 5, SlotOf(&QuickTime::IQuickTimeProperty::GetCodecName)},
    {"IQuickTimeProperty::GetCodecStorageType", 6, SlotOf(&QuickTime::IQuickTimeProperty::GetCodecStorageType)},
    {"IQuickTimeProperty::DoesCodecSupportRGB_CCIR", 7, SlotOf(&QuickTime::IQuickTimeProperty::DoesCodecSupportRGB_CCIR)},
    {"IQuickTimeWrapper::PreparePixelFormat", 3, SlotOf(&QTWrapper::IQuickTimeWrapper::PreparePixelFormat)},
    {"IQuickTimeWrapper::GetSampleTable", 4, SlotOf(&QTWrapper::IQuickTimeWrapper::GetSampleTable)},
    {"IQuickTimeWrapper::GetQTAudioReader", 5, SlotOf(&QTWrapper::IQuickTimeWrapper::GetQTAudioReader)},
    {"IQuickTimeWrapper::GetQTVideoReader", 6, SlotOf(&QTWrapper::IQuickTimeWrapper::GetQTVideoReader)},
    {"IQuickTimeWrapper::QueryVideoDescBufferDetails", 7, SlotOf(&QTWrapper::IQuickTimeWrapper::QueryVideoDescBufferDetails)},
    {"IQuickTimeWrapper::GetCodecColorSpaceInfo", 8, SlotOf(&QTWrapper::IQuickTimeWrapper::GetCodecColorSpaceInfo)},
    {"IQuickTimeWrapper::MovieHasOneFrame", 9, SlotOf(&QTWrapper::IQuickTimeWrapper::MovieHasOneFrame)},
    {"IQuickTimeWrapper::GetResolutionId", 10, SlotOf(&QTWrapper::IQuickTimeWrapper::GetResolutionId)},
    {"IQuickTimeWrapper::GetCodecTypeName", 11, SlotOf(&QTWrapper::IQuickTimeWrapper::GetCodecTypeName)},
    {"IQuickTimeWrapper::MovieTrackDurationIssues", 12, SlotOf(&QTWrapper::IQuickTimeWrapper::MovieTrackDurationIssues)},
    {"IQuickTimeWrapper::MovieHasMultipleVideoTracks", 13, SlotOf(&QTWrapper::IQuickTimeWrapper::MovieHasMultipleVideoTracks)},
    {"IQuickTimeWrapper::GetFirstVideoTrack", 14, SlotOf(&QTWrapper::IQuickTimeWrapper::GetFirstVideoTrack)},
    {"IQuickTimeWrapper::GetFieldLayoutForTrack", 15, SlotOf(&QTWrapper::IQuickTimeWrapper::GetFieldLayoutForTrack)},
    {"IQuickTimeWrapper::GetFourCCFromImageDescrptor", 16, SlotOf(&QTWrapper::IQuickTimeWrapper::GetFourCCFromImageDescrptor)},
    {"IQuickTimeWrapper::GetImageDescriptionCount", 17, SlotOf(&QTWrapper::IQuickTimeWrapper::GetImageDescriptionCount)},
    {"IQuickTimeWrapper::MovieContainsAlpha", 18, SlotOf(&QTWrapper::IQuickTimeWrapper::MovieContainsAlpha)},
    {"IQuickTimeWrapper::GetAudioInfoForTrack", 19, SlotOf(&QTWrapper::IQuickTimeWrapper::GetAudioInfoForTrack)},
    {"IQuickTimeWrapper::GetMovieBox", 20, SlotOf(&QTWrapper::IQuickTimeWrapper::GetMovieBox)},
    {"IQuickTimeWrapper::GetMovieCreationTime", 21, SlotOf(&QTWrapper::IQuickTimeWrapper::GetMovieCreationTime)},
    {"IQuickTimeWrapper::GetDescribedTrackCount", 22, SlotOf(&QTWrapper::IQuickTimeWrapper::GetDescribedTrackCount)},
    {"IQuickTimeWrapper::MovieIsSelfContained", 23, SlotOf(&QTWrapper::IQuickTimeWrapper::MovieIsSelfContained)},
    {"IQuickTimeWrapper::GetTimeCodeInfoForTrack", 24, SlotOf(&QTWrapper::IQuickTimeWrapper::GetTimeCodeInfoForTrack)},
    {"IQuickTimeWrapper::IsVideoTrack", 25, SlotOf(&QTWrapper::IQuickTimeWrapper::IsVideoTrack)},
    {"IQuickTimeWrapper::IsAudioTrack", 26, SlotOf(&QTWrapper::IQuickTimeWrapper::IsAudioTrack)},
    {"IQuickTimeWrapper::IsTimeCodeTrack", 27, SlotOf(&QTWrapper::IQuickTimeWrapper::IsTimeCodeTrack)},
    {"IQuickTimeWrapper::GetNumberOfTracks", 28, SlotOf(&QTWrapper::IQuickTimeWrapper::GetNumberOfTracks)},
    {"IQuickTimeWrapper::MovieHasAudio", 29, SlotOf(&QTWrapper::IQuickTimeWrapper::MovieHasAudio)},
    {"IQuickTimeWrapper::NewMovieFromFilePath", 30, SlotOf(&QTWrapper::IQuickTimeWrapper::NewMovieFromFilePath)},
    {"IQuickTimeWrapper::DetermineMovieEditRateAndLength", 31, SlotOf(&QTWrapper::IQuickTimeWrapper::DetermineMovieEditRateAndLength)},
    {"IQuickTimeWrapper::QTWSetMovieBox", 32, SlotOf(&QTWrapper::IQuickTimeWrapper::QTWSetMovieBox)},
    {"IQuickTimeWrapper::GetVendor", 33, SlotOf(&QTWrapper::IQuickTimeWrapper::GetVendor)},
    {"IQuickTimeWrapper::GetTrackDuration", 34, SlotOf(&QTWrapper::IQuickTimeWrapper::GetTrackDuration)},
    {"IQuickTimeWrapper::GetMovieTimeScale", 35, SlotOf(&QTWrapper::IQuickTimeWrapper::GetMovieTimeScale)},
    {"IQTVideoReader::SetOutputPixelFormat", 3, SlotOf(&QTWrapper::IQTVideoReader::SetOutputPixelFormat)},
    {"IQTVideoReader::ReadFrame", 4, SlotOf(&QTWrapper::IQTVideoReader::ReadFrame)},
    {"IQTVideoReader::GetFrameBufferSize", 5, SlotOf(&QTWrapper::IQTVideoReader::GetFrameBufferSize)},
    {"IQTVideoReader::InitQT", 6, SlotOf(&QTWrapper::IQTVideoReader::InitQT)},
    {"IQTVideoReader::ReservedVideoReaderOperation", 7, SlotOf(&QTWrapper::IQTVideoReader::ReservedVideoReaderOperation)},
    {"IQTVideoReader::ReleaseQT", 8, SlotOf(&QTWrapper::IQTVideoReader::ReleaseQT)},
    {"IQTAudioReader::ReservedAudioReaderOperation", 3, SlotOf(&QTWrapper::IQTAudioReader::ReservedAudioReaderOperation)},
    {"IQTAudioReader::SetParams", 4, SlotOf(&QTWrapper::IQTAudioReader::SetParams)},
    {"IQTAudioReader::ReadSamples", 5, SlotOf(&QTWrapper::IQTAudioReader::ReadSamples)},
    {"IQTWSampleTable::GetNumSamples", 3, SlotOf(&QTWrapper::IQTWSampleTable::GetNumSamples)},
    {"IQTWSampleTable::GetDataOffset", 4, SlotOf(&QTWrapper::IQTWSampleTable::GetDataOffset)},
    {"IQTWSampleTable::GetSampleFlags", 5, SlotOf(&QTWrapper::IQTWSampleTable::GetSampleFlags)},
    {"IQTWSampleTable::GetNextDiscontiguousDataAttributeChange", 6, SlotOf(&QTWrapper::IQTWSampleTable::GetNextDiscontiguousDataAttributeChange)},
    {"IQTWSampleTable::GetDataSizePerSample", 7, SlotOf(&QTWrapper::IQTWSampleTable::GetDataSizePerSample)},
    {"IQTWSampleTable::GetDisplayOffset", 8, SlotOf(&QTWrapper::IQTWSampleTable::GetDisplayOffset)},
    {"IQTWSampleTable::GetDecodeDuration", 9, SlotOf(&QTWrapper::IQTWSampleTable::GetDecodeDuration)},
    {"IQTWSampleTable::GetMaxDataSize", 10, SlotOf(&QTWrapper::IQTWSampleTable::GetMaxDataSize)},
    {"IQTWSampleTable::HasOutOfOrderFrameDependencies", 11, SlotOf(&QTWrapper::IQTWSampleTable::HasOutOfOrderFrameDependencies)},
};
// clang-format on

TEST(QuickTimeInterfaces, HaveTheirOperationsInTheirPlaces) {
    ExpectPublishedPlaces(kQuickTimeSlots);
}

}  // namespace
