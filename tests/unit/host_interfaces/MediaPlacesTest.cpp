// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The places of the operations of host_interfaces/media/ in their tables.

#include "host_interfaces/media/AAFClips.h"
#include "host_interfaces/media/MediaContainer.h"
#include "host_interfaces/media/MediaVolume.h"
#include "host_interfaces/media/SampleMapping.h"
#include "host_interfaces/media/Sequences.h"
#include "tests/support/Slots.h"

namespace {

// clang-format off
const SlotRow kMediaSlots[] = {
    {"IAAFClips::GetCount", 3, SlotOf(&NMA::IAAFClips::GetCount)},
    {"IAAFClips::GetMetadata", 4, SlotOf(&NMA::IAAFClips::GetMetadata)},
    {"IAAFClips::GetClipPath", 5, SlotOf(&NMA::IAAFClips::GetClipPath)},
    {"IMediaContainer3::IsContainerSupported", 3, SlotOf(&NMA::IMediaContainer3::IsContainerSupported)},
    {"IMediaContainer3::ContainerFlag", 4, SlotOf(&NMA::IMediaContainer3::ContainerFlag)},
    {"IMediaContainer3::ContainerUnsupportedA", 5, SlotOf(&NMA::IMediaContainer3::ContainerUnsupportedA)},
    {"IMediaContainer3::GetAAFMasterClips", 6, SlotOf(&NMA::IMediaContainer3::GetAAFMasterClips)},
    {"IMediaContainer3::SetFilePath", 7, SlotOf(&NMA::IMediaContainer3::SetFilePath)},
    {"IMediaContainer3::GetSampleMapping", 8, SlotOf(&NMA::IMediaContainer3::GetSampleMapping)},
    {"IMediaContainer3::ContainerUnsupportedB", 9, SlotOf(&NMA::IMediaContainer3::ContainerUnsupportedB)},
    {"IMediaContainer3::GetCapabilities", 10, SlotOf(&NMA::IMediaContainer3::GetCapabilities)},
    {"IMediaContainer3::GetFileTypeCount", 11, SlotOf(&NMA::IMediaContainer3::GetFileTypeCount)},
    {"IMediaContainer3::GetFileType", 12, SlotOf(&NMA::IMediaContainer3::GetFileType)},
    {"IVolumeInfo2::GetSerialNumber", 3, SlotOf(&NMA::IVolumeInfo2::GetSerialNumber)},
    {"IVolumeInfo2::GetLabel", 4, SlotOf(&NMA::IVolumeInfo2::GetLabel)},
    {"IVolumeInfo2::GetType", 5, SlotOf(&NMA::IVolumeInfo2::GetType)},
    {"IVolumeInfo2::GetModificationDate", 6, SlotOf(&NMA::IVolumeInfo2::GetModificationDate)},
    {"IVolumeInfo2::VolumeQueryA", 7, SlotOf(&NMA::IVolumeInfo2::VolumeQueryA)},
    {"IVolumeInfo2::VolumeQueryB", 8, SlotOf(&NMA::IVolumeInfo2::VolumeQueryB)},
    {"IVolumeInfo2::VolumeQueryC", 9, SlotOf(&NMA::IVolumeInfo2::VolumeQueryC)},
    {"IVolumeInfo2::VolumeQueryD", 10, SlotOf(&NMA::IVolumeInfo2::VolumeQueryD)},
    {"IVolumeInfo2::GetVolumeName", 11, SlotOf(&NMA::IVolumeInfo2::GetVolumeName)},
    {"IMediaFormat::FormatFlagA", 3, SlotOf(&NMA::IMediaFormat::FormatFlagA)},
    {"IMediaFormat::FormatFlagB", 4, SlotOf(&NMA::IMediaFormat::FormatFlagB)},
    {"IMediaFormat::FormatFlagC", 5, SlotOf(&NMA::IMediaFormat::FormatFlagC)},
    {"IMediaFormat::FormatFlagD", 6, SlotOf(&NMA::IMediaFormat::FormatFlagD)},
    {"IMediaFormat::FormatUnsupportedA", 7, SlotOf(&NMA::IMediaFormat::FormatUnsupportedA)},
    {"IMediaFormat::FormatUnsupportedB", 8, SlotOf(&NMA::IMediaFormat::FormatUnsupportedB)},
    {"IMediaFormat::GetAAFClips", 9, SlotOf(&NMA::IMediaFormat::GetAAFClips)},
    {"IMediaVolume::IsMediaVolume", 3, SlotOf(&NMA::IMediaVolume::IsMediaVolume)},
    {"IMediaVolume::GetVolumeInfo", 4, SlotOf(&NMA::IMediaVolume::GetVolumeInfo)},
    {"IMediaVolume::GetMediaFormat", 5, SlotOf(&NMA::IMediaVolume::GetMediaFormat)},
    {"IMediaVolume::GetContainerComponentId", 6, SlotOf(&NMA::IMediaVolume::GetContainerComponentId)},
    {"ISequences::GetSequenceCount", 3, SlotOf(&NMA::ISequences::GetSequenceCount)},
    {"ISequences::GetSequence", 4, SlotOf(&NMA::ISequences::GetSequence)},
    {"IAAFSequences::GetAAFSequenceCount", 3, SlotOf(&NMA::IAAFSequences::GetAAFSequenceCount)},
    {"IAAFSequences::GetAAFSequence", 4, SlotOf(&NMA::IAAFSequences::GetAAFSequence)},
    {"ISampleProvider::Setup", 3, SlotOf(&NMA::ISampleProvider::Setup)},
    {"ISampleProvider::ProviderUnsupportedOperation", 4, SlotOf(&NMA::ISampleProvider::ProviderUnsupportedOperation)},
    {"ISampleProvider::ProvideSampleRange", 5, SlotOf(&NMA::ISampleProvider::ProvideSampleRange)},
    {"ISampleProvider::ProviderNoOperationA", 6, SlotOf(&NMA::ISampleProvider::ProviderNoOperationA)},
    {"ISampleProvider::ProviderNoOperationB", 7, SlotOf(&NMA::ISampleProvider::ProviderNoOperationB)},
    {"ISampleProvider::Cleanup", 8, SlotOf(&NMA::ISampleProvider::Cleanup)},
    {"IUncompressedImageProvider::GetNumberOfImageFormats", 3, SlotOf(&NMA::IUncompressedImageProvider::GetNumberOfImageFormats)},
    {"IUncompressedImageProvider::GetImageFormat", 4, SlotOf(&NMA::IUncompressedImageProvider::GetImageFormat)},
    {"IUncompressedImageProvider::ImageProviderUnsupportedOperation", 5, SlotOf(&NMA::IUncompressedImageProvider::ImageProviderUnsupportedOperation)},
    {"IUncompressedImageProvider::SetWorkingImageFormat", 6, SlotOf(&NMA::IUncompressedImageProvider::SetWorkingImageFormat)},
    {"IUncompressedImageProvider::ImageProviderNoOperationA", 7, SlotOf(&NMA::IUncompressedImageProvider::ImageProviderNoOperationA)},
    {"IUncompressedImageProvider::ImageProviderNoOperationB", 8, SlotOf(&NMA::IUncompressedImageProvider::ImageProviderNoOperationB)},
    {"IUncompressedImageProvider::GetWorkingImageSize", 9, SlotOf(&NMA::IUncompressedImageProvider::GetWorkingImageSize)},
    {"IUncompressedImageProvider::GetWorkingImageBufferRequirements", 10, SlotOf(&NMA::IUncompressedImageProvider::GetWorkingImageBufferRequirements)},
    {"IUncompressedAudioProvider::GetNumberOfAudioFormats", 3, SlotOf(&NMA::IUncompressedAudioProvider::GetNumberOfAudioFormats)},
    {"IUncompressedAudioProvider::GetAudioFormat", 4, SlotOf(&NMA::IUncompressedAudioProvider::GetAudioFormat)},
    {"IUncompressedAudioProvider::AudioProviderUnsupportedOperation", 5, SlotOf(&NMA::IUncompressedAudioProvider::AudioProviderUnsupportedOperation)},
    {"IUncompressedAudioProvider::SetWorkingAudioFormat", 6, SlotOf(&NMA::IUncompressedAudioProvider::SetWorkingAudioFormat)},
    {"ISampleMapping::GetNumberOfTracks", 3, SlotOf(&NMA::ISampleMapping::GetNumberOfTracks)},
    {"ISampleMapping::GetNumberOfChannels", 4, SlotOf(&NMA::ISampleMapping::GetNumberOfChannels)},
    {"ISampleMapping::GetNumberOfSamples", 5, SlotOf(&NMA::ISampleMapping::GetNumberOfSamples)},
    {"ISampleMapping::GetSampleStride", 6, SlotOf(&NMA::ISampleMapping::GetSampleStride)},
    {"ISampleMapping::GetSampleSize", 7, SlotOf(&NMA::ISampleMapping::GetSampleSize)},
    {"ISampleMapping::GetSamplePosition", 8, SlotOf(&NMA::ISampleMapping::GetSamplePosition)},
    {"ISampleMapping::GetSampleTemporalOffset", 9, SlotOf(&NMA::ISampleMapping::GetSampleTemporalOffset)},
    {"ISampleMapping::GetSampleProperties", 10, SlotOf(&NMA::ISampleMapping::GetSampleProperties)},
    {"ISampleMapping::GetSampleDependency", 11, SlotOf(&NMA::ISampleMapping::GetSampleDependency)},
    {"ISampleMapping::GetNumberOfEncodedUnits", 12, SlotOf(&NMA::ISampleMapping::GetNumberOfEncodedUnits)},
    {"ISampleMapping::GetEncodedUnitStride", 13, SlotOf(&NMA::ISampleMapping::GetEncodedUnitStride)},
    {"ISampleMapping::GetEncodedUnitPosition", 14, SlotOf(&NMA::ISampleMapping::GetEncodedUnitPosition)},
    {"ISampleMapping::GetEncodedUnitSize", 15, SlotOf(&NMA::ISampleMapping::GetEncodedUnitSize)},
    {"ISampleMapping::GetEncodedUnitSizeInSamples", 16, SlotOf(&NMA::ISampleMapping::GetEncodedUnitSizeInSamples)},
    {"ISampleMapping::GetEncodedUnitFirstSample", 17, SlotOf(&NMA::ISampleMapping::GetEncodedUnitFirstSample)},
    {"ISampleMapping::GetEncodedUnitContainingSample", 18, SlotOf(&NMA::ISampleMapping::GetEncodedUnitContainingSample)},
    {"ISampleMapping::GetNumberOfContiguousSamples", 19, SlotOf(&NMA::ISampleMapping::GetNumberOfContiguousSamples)},
    {"ISampleMapping::GetNumberOfContiguousBytes", 20, SlotOf(&NMA::ISampleMapping::GetNumberOfContiguousBytes)},
    {"ISampleMapping::GetNumberOfContiguousEncodedUnits", 21, SlotOf(&NMA::ISampleMapping::GetNumberOfContiguousEncodedUnits)},
    {"ISampleMapping::RegisterSampleRangeHint", 22, SlotOf(&NMA::ISampleMapping::RegisterSampleRangeHint)},
    {"ISampleMapping::UnregisterSampleRangeHint", 23, SlotOf(&NMA::ISampleMapping::UnregisterSampleRangeHint)},
    {"ISampleMapping::SetStorageCallback", 24, SlotOf(&NMA::ISampleMapping::SetStorageCallback)},
};
// clang-format on

TEST(MediaInterfaces, HaveTheirOperationsInTheirPlaces) {
    ExpectPublishedPlaces(kMediaSlots);
}

}  // namespace
