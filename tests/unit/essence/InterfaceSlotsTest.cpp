// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Places of the operations in the tables that cross to the host.

#include <gtest/gtest.h>

#include "host_interfaces/media/SampleMapping.h"
#include "tests/unit/aaf_library/model/InterfaceSlots.h"

namespace {

using namespace NMA;

// clang-format off
const SlotRow kSlots[] = {
    {"ISampleProvider::Setup", 3, SlotOf(&ISampleProvider::Setup)},
    {"ISampleProvider::ProviderUnsupportedOperation", 4, SlotOf(&ISampleProvider::ProviderUnsupportedOperation)},
    {"ISampleProvider::ProvideSampleRange", 5, SlotOf(&ISampleProvider::ProvideSampleRange)},
    {"ISampleProvider::ProviderNoOperationA", 6, SlotOf(&ISampleProvider::ProviderNoOperationA)},
    {"ISampleProvider::ProviderNoOperationB", 7, SlotOf(&ISampleProvider::ProviderNoOperationB)},
    {"ISampleProvider::Cleanup", 8, SlotOf(&ISampleProvider::Cleanup)},
    {"IUncompressedImageProvider::GetNumberOfImageFormats", 3, SlotOf(&IUncompressedImageProvider::GetNumberOfImageFormats)},
    {"IUncompressedImageProvider::GetImageFormat", 4, SlotOf(&IUncompressedImageProvider::GetImageFormat)},
    {"IUncompressedImageProvider::ImageProviderUnsupportedOperation", 5, SlotOf(&IUncompressedImageProvider::ImageProviderUnsupportedOperation)},
    {"IUncompressedImageProvider::SetWorkingImageFormat", 6, SlotOf(&IUncompressedImageProvider::SetWorkingImageFormat)},
    {"IUncompressedImageProvider::ImageProviderNoOperationA", 7, SlotOf(&IUncompressedImageProvider::ImageProviderNoOperationA)},
    {"IUncompressedImageProvider::ImageProviderNoOperationB", 8, SlotOf(&IUncompressedImageProvider::ImageProviderNoOperationB)},
    {"IUncompressedImageProvider::GetWorkingImageSize", 9, SlotOf(&IUncompressedImageProvider::GetWorkingImageSize)},
    {"IUncompressedImageProvider::GetWorkingImageBufferRequirements", 10, SlotOf(&IUncompressedImageProvider::GetWorkingImageBufferRequirements)},
    {"IUncompressedAudioProvider::GetNumberOfAudioFormats", 3, SlotOf(&IUncompressedAudioProvider::GetNumberOfAudioFormats)},
    {"IUncompressedAudioProvider::GetAudioFormat", 4, SlotOf(&IUncompressedAudioProvider::GetAudioFormat)},
    {"IUncompressedAudioProvider::AudioProviderUnsupportedOperation", 5, SlotOf(&IUncompressedAudioProvider::AudioProviderUnsupportedOperation)},
    {"IUncompressedAudioProvider::SetWorkingAudioFormat", 6, SlotOf(&IUncompressedAudioProvider::SetWorkingAudioFormat)},
    {"ISampleMapping::GetNumberOfTracks", 3, SlotOf(&ISampleMapping::GetNumberOfTracks)},
    {"ISampleMapping::GetNumberOfChannels", 4, SlotOf(&ISampleMapping::GetNumberOfChannels)},
    {"ISampleMapping::GetNumberOfSamples", 5, SlotOf(&ISampleMapping::GetNumberOfSamples)},
    {"ISampleMapping::GetSampleStride", 6, SlotOf(&ISampleMapping::GetSampleStride)},
    {"ISampleMapping::GetSampleSize", 7, SlotOf(&ISampleMapping::GetSampleSize)},
    {"ISampleMapping::GetSamplePosition", 8, SlotOf(&ISampleMapping::GetSamplePosition)},
    {"ISampleMapping::GetSampleTemporalOffset", 9, SlotOf(&ISampleMapping::GetSampleTemporalOffset)},
    {"ISampleMapping::GetSampleProperties", 10, SlotOf(&ISampleMapping::GetSampleProperties)},
    {"ISampleMapping::GetSampleDependency", 11, SlotOf(&ISampleMapping::GetSampleDependency)},
    {"ISampleMapping::GetNumberOfEncodedUnits", 12, SlotOf(&ISampleMapping::GetNumberOfEncodedUnits)},
    {"ISampleMapping::GetEncodedUnitStride", 13, SlotOf(&ISampleMapping::GetEncodedUnitStride)},
    {"ISampleMapping::GetEncodedUnitPosition", 14, SlotOf(&ISampleMapping::GetEncodedUnitPosition)},
    {"ISampleMapping::GetEncodedUnitSize", 15, SlotOf(&ISampleMapping::GetEncodedUnitSize)},
    {"ISampleMapping::GetEncodedUnitSizeInSamples", 16, SlotOf(&ISampleMapping::GetEncodedUnitSizeInSamples)},
    {"ISampleMapping::GetEncodedUnitFirstSample", 17, SlotOf(&ISampleMapping::GetEncodedUnitFirstSample)},
    {"ISampleMapping::GetEncodedUnitContainingSample", 18, SlotOf(&ISampleMapping::GetEncodedUnitContainingSample)},
    {"ISampleMapping::GetNumberOfContiguousSamples", 19, SlotOf(&ISampleMapping::GetNumberOfContiguousSamples)},
    {"ISampleMapping::GetNumberOfContiguousBytes", 20, SlotOf(&ISampleMapping::GetNumberOfContiguousBytes)},
    {"ISampleMapping::GetNumberOfContiguousEncodedUnits", 21, SlotOf(&ISampleMapping::GetNumberOfContiguousEncodedUnits)},
    {"ISampleMapping::RegisterSampleRangeHint", 22, SlotOf(&ISampleMapping::RegisterSampleRangeHint)},
    {"ISampleMapping::UnregisterSampleRangeHint", 23, SlotOf(&ISampleMapping::UnregisterSampleRangeHint)},
    {"ISampleMapping::SetStorageCallback", 24, SlotOf(&ISampleMapping::SetStorageCallback)},
    {"INCFAVBuffer::GetBuffer", 3, SlotOf(&INCFAVBuffer::GetBuffer)},
    {"INCFAVBuffer::GetSampleRange", 4, SlotOf(&INCFAVBuffer::GetSampleRange)},
    {"INCFBuffer::Allocate", 3, SlotOf(&INCFBuffer::Allocate)},
    {"INCFBuffer::GetBufferPointer", 4, SlotOf(&INCFBuffer::GetBufferPointer)},
    {"INCFBuffer::SetComplete", 5, SlotOf(&INCFBuffer::SetComplete)},
};
// clang-format on

TEST(SampleMappingInterfaces, HaveTheirOperationsInTheirPlaces) {
    for (const SlotRow& row : kSlots) {
        EXPECT_EQ(row.declared, row.published) << row.operation;
    }
}

TEST(SampleMappingInterfaces, HaveTheirIds) {
    EXPECT_TRUE(IID_ISampleMapping == ncfGuid("E0D63190-0469-4807-92CE-5C22152F84EB"));
    EXPECT_TRUE(IID_ISampleProvider == ncfGuid("933EEA30-24C0-4733-B51D-E37A811DFFE5"));
    EXPECT_TRUE(IID_IUncompressedImageProvider == ncfGuid("1E1675DC-95E7-45CB-A9F0-7D6326273E70"));
    EXPECT_TRUE(IID_IUncompressedAudioProvider == ncfGuid("6F2EAEF7-2DFD-47B8-AA14-38E4DF57982E"));
}

}  // namespace
