// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The places of the operations of host_interfaces/media/ in their tables, written
// down once more and called by number: modules that are built call by place.

#include "host_interfaces/media/AAFClips.h"
#include "host_interfaces/media/MediaContainer.h"
#include "host_interfaces/media/MediaVolume.h"
#include "host_interfaces/media/Sequences.h"
#include "tests/unit/host_interfaces/CallPlace.h"

// clang-format off
namespace {

struct PlacesIAAFClips : PlaceFake<NMA::IAAFClips> {
    ncfSInt32 GetCount() override { return Ran<ncfSInt32>("GetCount"); }
    NCFRESULT GetMetadata(ncfSInt32, IAAFFile**) override { return Ran<NCFRESULT>("GetMetadata"); }
    NCFRESULT GetClipPath(ncfSInt32, INCFString*) override { return Ran<NCFRESULT>("GetClipPath"); }
};

TEST(Places, OfIAAFClips) {
    ExpectPlaces<PlacesIAAFClips>({
        {3, "GetCount"}, {4, "GetMetadata"}, {5, "GetClipPath"},
    });
}

struct PlacesIMediaContainer3 : PlaceFake<NMA::IMediaContainer3> {
    NCFRESULT IsContainerSupported() override { return Ran<NCFRESULT>("IsContainerSupported"); }
    NCFRESULT ContainerFlag() override { return Ran<NCFRESULT>("ContainerFlag"); }
    NCFRESULT ContainerUnsupportedA(void*, void*, void*) override { return Ran<NCFRESULT>("ContainerUnsupportedA"); }
    NCFRESULT GetAAFMasterClips(NMA::IAAFClips**) override { return Ran<NCFRESULT>("GetAAFMasterClips"); }
    NCFRESULT SetFilePath(INCFString*) override { return Ran<NCFRESULT>("SetFilePath"); }
    NCFRESULT GetSampleMapping(NMA::ISampleMapping**) override { return Ran<NCFRESULT>("GetSampleMapping"); }
    NCFRESULT ContainerUnsupportedB(void*) override { return Ran<NCFRESULT>("ContainerUnsupportedB"); }
    NCFRESULT GetCapabilities(ncfUInt32*) override { return Ran<NCFRESULT>("GetCapabilities"); }
    ncfUInt32 GetFileTypeCount() override { return Ran<ncfUInt32>("GetFileTypeCount"); }
    NCFRESULT GetFileType(ncfUInt32, INCFString**, INCFString**, INCFString**) override { return Ran<NCFRESULT>("GetFileType"); }
};

TEST(Places, OfIMediaContainer3) {
    ExpectPlaces<PlacesIMediaContainer3>({
        {3, "IsContainerSupported"}, {4, "ContainerFlag"}, {5, "ContainerUnsupportedA"},
        {6, "GetAAFMasterClips"}, {7, "SetFilePath"}, {8, "GetSampleMapping"},
        {9, "ContainerUnsupportedB"}, {10, "GetCapabilities"}, {11, "GetFileTypeCount"},
        {12, "GetFileType"},
    });
}

struct PlacesIVolumeInfo2 : PlaceFake<NMA::IVolumeInfo2> {
    NCFRESULT GetSerialNumber(ncfUInt32*) override { return Ran<NCFRESULT>("GetSerialNumber"); }
    NCFRESULT GetLabel(INCFString**) override { return Ran<NCFRESULT>("GetLabel"); }
    NCFRESULT GetType(ncfUInt32*) override { return Ran<NCFRESULT>("GetType"); }
    NCFRESULT GetModificationDate(ncfUInt32*) override { return Ran<NCFRESULT>("GetModificationDate"); }
    NCFRESULT VolumeQueryA(void*) override { return Ran<NCFRESULT>("VolumeQueryA"); }
    NCFRESULT VolumeQueryB() override { return Ran<NCFRESULT>("VolumeQueryB"); }
    NCFRESULT VolumeQueryC() override { return Ran<NCFRESULT>("VolumeQueryC"); }
    NCFRESULT VolumeQueryD() override { return Ran<NCFRESULT>("VolumeQueryD"); }
    NCFRESULT GetVolumeName(INCFString**) override { return Ran<NCFRESULT>("GetVolumeName"); }
};

TEST(Places, OfIVolumeInfo2) {
    ExpectPlaces<PlacesIVolumeInfo2>({
        {3, "GetSerialNumber"}, {4, "GetLabel"}, {5, "GetType"}, {6, "GetModificationDate"},
        {7, "VolumeQueryA"}, {8, "VolumeQueryB"}, {9, "VolumeQueryC"}, {10, "VolumeQueryD"},
        {11, "GetVolumeName"},
    });
}

struct PlacesIMediaFormat : PlaceFake<NMA::IMediaFormat> {
    ncfBool FormatFlagA() override { return Ran<ncfBool>("FormatFlagA"); }
    ncfBool FormatFlagB() override { return Ran<ncfBool>("FormatFlagB"); }
    ncfBool FormatFlagC() override { return Ran<ncfBool>("FormatFlagC"); }
    ncfBool FormatFlagD() override { return Ran<ncfBool>("FormatFlagD"); }
    NCFRESULT FormatUnsupportedA(void*) override { return Ran<NCFRESULT>("FormatUnsupportedA"); }
    NCFRESULT FormatUnsupportedB(void*) override { return Ran<NCFRESULT>("FormatUnsupportedB"); }
    NCFRESULT GetAAFClips(NMA::IAAFClips**) override { return Ran<NCFRESULT>("GetAAFClips"); }
};

TEST(Places, OfIMediaFormat) {
    ExpectPlaces<PlacesIMediaFormat>({
        {3, "FormatFlagA"}, {4, "FormatFlagB"}, {5, "FormatFlagC"}, {6, "FormatFlagD"},
        {7, "FormatUnsupportedA"}, {8, "FormatUnsupportedB"}, {9, "GetAAFClips"},
    });
}

struct PlacesIMediaVolume : PlaceFake<NMA::IMediaVolume> {
    NCFRESULT IsMediaVolume(INCFString*) override { return Ran<NCFRESULT>("IsMediaVolume"); }
    NCFRESULT GetVolumeInfo(INCFString*, NMA::IVolumeInfo**) override { return Ran<NCFRESULT>("GetVolumeInfo"); }
    NCFRESULT GetMediaFormat(INCFString*, NMA::IMediaFormat**) override { return Ran<NCFRESULT>("GetMediaFormat"); }
    NCFRESULT GetContainerComponentId(GUID*) override { return Ran<NCFRESULT>("GetContainerComponentId"); }
};

TEST(Places, OfIMediaVolume) {
    ExpectPlaces<PlacesIMediaVolume>({
        {3, "IsMediaVolume"}, {4, "GetVolumeInfo"}, {5, "GetMediaFormat"},
        {6, "GetContainerComponentId"},
    });
}

struct PlacesISequences : PlaceFake<NMA::ISequences> {
    NCFRESULT GetSequenceCount() override { return Ran<NCFRESULT>("GetSequenceCount"); }
    NCFRESULT GetSequence(ncfSInt32, INCFUnknown**) override { return Ran<NCFRESULT>("GetSequence"); }
};

TEST(Places, OfISequences) {
    ExpectPlaces<PlacesISequences>({
        {3, "GetSequenceCount"}, {4, "GetSequence"},
    });
}

struct PlacesIAAFSequences : PlaceFake<NMA::IAAFSequences> {
    NCFRESULT GetAAFSequenceCount() override { return Ran<NCFRESULT>("GetAAFSequenceCount"); }
    NCFRESULT GetAAFSequence(ncfSInt32, INCFUnknown**) override { return Ran<NCFRESULT>("GetAAFSequence"); }
};

TEST(Places, OfIAAFSequences) {
    ExpectPlaces<PlacesIAAFSequences>({
        {3, "GetAAFSequenceCount"}, {4, "GetAAFSequence"},
    });
}

}  // namespace
// clang-format on
