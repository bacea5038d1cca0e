// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The places of the operations of host_interfaces/header_parser/ in their tables, written
// down once more and called by number: modules that are built call by place.

#include "host_interfaces/header_parser/QTParser.h"
#include "host_interfaces/header_parser/SampleDescription.h"
#include "host_interfaces/header_parser/SampleTable.h"
#include "host_interfaces/header_parser/TrackInfo.h"
#include "tests/unit/host_interfaces/CallPlace.h"

// clang-format off
namespace {

struct PlacesIQTParser : PlaceFake<IQTParser> {
    NCFRESULT GetCreationTime(ncfUInt64*) override { return Ran<NCFRESULT>("GetCreationTime"); }
    NCFRESULT ReservedParser4() override { return Ran<NCFRESULT>("ReservedParser4"); }
    NCFRESULT GetTimeScale(ncfUInt32*) override { return Ran<NCFRESULT>("GetTimeScale"); }
    NCFRESULT GetMovieDuration(ncfUInt32*) override { return Ran<NCFRESULT>("GetMovieDuration"); }
    NCFRESULT ReservedParser7() override { return Ran<NCFRESULT>("ReservedParser7"); }
    NCFRESULT ReservedParser8() override { return Ran<NCFRESULT>("ReservedParser8"); }
    NCFRESULT ReservedParser9() override { return Ran<NCFRESULT>("ReservedParser9"); }
    NCFRESULT GetVideoTrackCount(ncfUInt32*) override { return Ran<NCFRESULT>("GetVideoTrackCount"); }
    NCFRESULT GetAudioTrackCount(ncfUInt32*) override { return Ran<NCFRESULT>("GetAudioTrackCount"); }
    NCFRESULT GetTimeCodeTrackCount(ncfUInt32*) override { return Ran<NCFRESULT>("GetTimeCodeTrackCount"); }
    NCFRESULT GetOtherTrackCount(ncfUInt32*) override { return Ran<NCFRESULT>("GetOtherTrackCount"); }
    NCFRESULT GetVideoTrackInfo(ncfUInt32, IVideoTrackInfo**) override { return Ran<NCFRESULT>("GetVideoTrackInfo"); }
    NCFRESULT GetAudioTrackInfo(ncfUInt32, IAudioTrackInfo**) override { return Ran<NCFRESULT>("GetAudioTrackInfo"); }
    NCFRESULT GetTimeCodeTrackInfo(ncfUInt32, ITrackInfo**) override { return Ran<NCFRESULT>("GetTimeCodeTrackInfo"); }
    NCFRESULT GetOtherTrackInfo(ncfUInt32, ITrackInfo**) override { return Ran<NCFRESULT>("GetOtherTrackInfo"); }
    NCFRESULT ParseHeaders(const ncfUInt8*, const ncfUInt8*, ncfUInt64) override { return Ran<NCFRESULT>("ParseHeaders"); }
    NCFRESULT GetRecomendedReadPosition(ncfUInt64*, ncfUInt32*) override { return Ran<NCFRESULT>("GetRecomendedReadPosition"); }
    NCFRESULT GetTimeCodeInfo(ncfUInt8*, ncfUInt8*, ncfUInt8*, ncfUInt8*, ncfUInt32*, ncfUInt32*, ncfUInt32*, ncfUInt32*) override { return Ran<NCFRESULT>("GetTimeCodeInfo"); }
    NCFRESULT IsMovieSelfContained(ncfBool*) override { return Ran<NCFRESULT>("IsMovieSelfContained"); }
    NCFRESULT GetMOOVAtom(ncfUInt64*, ncfUInt64*) override { return Ran<NCFRESULT>("GetMOOVAtom"); }
};

TEST(Places, OfIQTParser) {
    ExpectPlaces<PlacesIQTParser>({
        {3, "GetCreationTime"}, {4, "ReservedParser4"}, {5, "GetTimeScale"},
        {6, "GetMovieDuration"}, {7, "ReservedParser7"}, {8, "ReservedParser8"},
        {9, "ReservedParser9"}, {10, "GetVideoTrackCount"}, {11, "GetAudioTrackCount"},
        {12, "GetTimeCodeTrackCount"}, {13, "GetOtherTrackCount"}, {14, "GetVideoTrackInfo"},
        {15, "GetAudioTrackInfo"}, {16, "GetTimeCodeTrackInfo"}, {17, "GetOtherTrackInfo"},
        {18, "ParseHeaders"}, {19, "GetRecomendedReadPosition"}, {20, "GetTimeCodeInfo"},
        {21, "IsMovieSelfContained"}, {22, "GetMOOVAtom"},
    });
}

struct PlacesIQTParserColor : PlaceFake<IQTParserColor> {
    ncfUInt32 ColorFlagA() override { return Ran<ncfUInt32>("ColorFlagA"); }
    ncfUInt32 ColorFlagB() override { return Ran<ncfUInt32>("ColorFlagB"); }
};

TEST(Places, OfIQTParserColor) {
    ExpectPlaces<PlacesIQTParserColor>({
        {3, "ColorFlagA"}, {4, "ColorFlagB"},
    });
}

struct PlacesIVideoSampleDescription : PlaceFake<IVideoSampleDescription> {
    NCFRESULT GetDataFormat(ncfUInt32*) override { return Ran<NCFRESULT>("GetDataFormat"); }
    NCFRESULT ReservedVideoDescription4() override { return Ran<NCFRESULT>("ReservedVideoDescription4"); }
    NCFRESULT GetEncodedWidthAndHeight(ncfUInt16*, ncfUInt16*) override { return Ran<NCFRESULT>("GetEncodedWidthAndHeight"); }
    NCFRESULT ReservedVideoDescription6() override { return Ran<NCFRESULT>("ReservedVideoDescription6"); }
    NCFRESULT ReservedVideoDescription7() override { return Ran<NCFRESULT>("ReservedVideoDescription7"); }
    NCFRESULT ReservedVideoDescription8() override { return Ran<NCFRESULT>("ReservedVideoDescription8"); }
    NCFRESULT ReservedVideoDescription9() override { return Ran<NCFRESULT>("ReservedVideoDescription9"); }
    NCFRESULT HasAlpha(ncfSInt32*) override { return Ran<NCFRESULT>("HasAlpha"); }
    NCFRESULT ReservedVideoDescription11() override { return Ran<NCFRESULT>("ReservedVideoDescription11"); }
    NCFRESULT GetFieldInfo(ncfUInt32*, ncfUInt32*, ncfUInt32*) override { return Ran<NCFRESULT>("GetFieldInfo"); }
    NCFRESULT ReservedVideoDescription13() override { return Ran<NCFRESULT>("ReservedVideoDescription13"); }
    NCFRESULT ReservedVideoDescription14() override { return Ran<NCFRESULT>("ReservedVideoDescription14"); }
    NCFRESULT ReservedVideoDescription15() override { return Ran<NCFRESULT>("ReservedVideoDescription15"); }
    NCFRESULT ReservedVideoDescription16() override { return Ran<NCFRESULT>("ReservedVideoDescription16"); }
    NCFRESULT ReservedVideoDescription17() override { return Ran<NCFRESULT>("ReservedVideoDescription17"); }
    NCFRESULT GetVendor(ncfUInt32*) override { return Ran<NCFRESULT>("GetVendor"); }
    NCFRESULT GetImageAspectRatio(ncfUInt32*, ncfUInt32*) override { return Ran<NCFRESULT>("GetImageAspectRatio"); }
    NCFRESULT GetVideoColorSpaceDetails(ncfUInt32*) override { return Ran<NCFRESULT>("GetVideoColorSpaceDetails"); }
    NCFRESULT ReservedVideoDescription21() override { return Ran<NCFRESULT>("ReservedVideoDescription21"); }
    NCFRESULT ReservedVideoDescription22() override { return Ran<NCFRESULT>("ReservedVideoDescription22"); }
    NCFRESULT ReservedVideoDescription23() override { return Ran<NCFRESULT>("ReservedVideoDescription23"); }
    NCFRESULT GetNivoAlphaCodingCount(ncfUInt32*) override { return Ran<NCFRESULT>("GetNivoAlphaCodingCount"); }
    NCFRESULT GetNivoAlphaCoding(ncfUInt32, ncfUInt32*) override { return Ran<NCFRESULT>("GetNivoAlphaCoding"); }
    NCFRESULT GetNivoResolution(QTNivoResolution*) override { return Ran<NCFRESULT>("GetNivoResolution"); }
    NCFRESULT ReservedVideoDescription27() override { return Ran<NCFRESULT>("ReservedVideoDescription27"); }
    NCFRESULT ReservedVideoDescription28() override { return Ran<NCFRESULT>("ReservedVideoDescription28"); }
    NCFRESULT GetRIAttributes(INCFString**) override { return Ran<NCFRESULT>("GetRIAttributes"); }
    NCFRESULT GetCMAttributes(INCFString**) override { return Ran<NCFRESULT>("GetCMAttributes"); }
};

TEST(Places, OfIVideoSampleDescription) {
    ExpectPlaces<PlacesIVideoSampleDescription>({
        {3, "GetDataFormat"}, {4, "ReservedVideoDescription4"}, {5, "GetEncodedWidthAndHeight"},
        {6, "ReservedVideoDescription6"}, {7, "ReservedVideoDescription7"},
        {8, "ReservedVideoDescription8"}, {9, "ReservedVideoDescription9"}, {10, "HasAlpha"},
        {11, "ReservedVideoDescription11"}, {12, "GetFieldInfo"},
        {13, "ReservedVideoDescription13"}, {14, "ReservedVideoDescription14"},
        {15, "ReservedVideoDescription15"}, {16, "ReservedVideoDescription16"},
        {17, "ReservedVideoDescription17"}, {18, "GetVendor"}, {19, "GetImageAspectRatio"},
        {20, "GetVideoColorSpaceDetails"}, {21, "ReservedVideoDescription21"},
        {22, "ReservedVideoDescription22"}, {23, "ReservedVideoDescription23"},
        {24, "GetNivoAlphaCodingCount"}, {25, "GetNivoAlphaCoding"}, {26, "GetNivoResolution"},
        {27, "ReservedVideoDescription27"}, {28, "ReservedVideoDescription28"},
        {29, "GetRIAttributes"}, {30, "GetCMAttributes"},
    });
}

struct PlacesIAudioSampleDescription : PlaceFake<IAudioSampleDescription> {
    NCFRESULT ReservedAudioDescription3() override { return Ran<NCFRESULT>("ReservedAudioDescription3"); }
    NCFRESULT ReservedAudioDescription4() override { return Ran<NCFRESULT>("ReservedAudioDescription4"); }
    NCFRESULT GetChannelsPerFrame(ncfUInt32*) override { return Ran<NCFRESULT>("GetChannelsPerFrame"); }
    NCFRESULT GetBitsPerChannel(ncfUInt32*) override { return Ran<NCFRESULT>("GetBitsPerChannel"); }
    NCFRESULT GetSampleRate(double*) override { return Ran<NCFRESULT>("GetSampleRate"); }
    NCFRESULT IsConstantBitRate(ncfBool*) override { return Ran<NCFRESULT>("IsConstantBitRate"); }
    NCFRESULT IsLPCM(ncfBool*) override { return Ran<NCFRESULT>("IsLPCM"); }
    NCFRESULT GetBytesPerPacket(ncfUInt32*) override { return Ran<NCFRESULT>("GetBytesPerPacket"); }
    NCFRESULT IsLittleEndian(ncfBool*) override { return Ran<NCFRESULT>("IsLittleEndian"); }
};

TEST(Places, OfIAudioSampleDescription) {
    ExpectPlaces<PlacesIAudioSampleDescription>({
        {3, "ReservedAudioDescription3"}, {4, "ReservedAudioDescription4"},
        {5, "GetChannelsPerFrame"}, {6, "GetBitsPerChannel"}, {7, "GetSampleRate"},
        {8, "IsConstantBitRate"}, {9, "IsLPCM"}, {10, "GetBytesPerPacket"},
        {11, "IsLittleEndian"},
    });
}

struct PlacesIQTSampleTable : PlaceFake<IQTSampleTable> {
    NCFRESULT GetNumSamples(ncfUInt64*) override { return Ran<NCFRESULT>("GetNumSamples"); }
    NCFRESULT GetDataOffset(ncfUInt64, ncfUInt64*) override { return Ran<NCFRESULT>("GetDataOffset"); }
    NCFRESULT GetSampleFlags(ncfUInt64, ncfUInt32*) override { return Ran<NCFRESULT>("GetSampleFlags"); }
    NCFRESULT GetNextDiscontiguousDataAttributeChange(ncfUInt64, ncfUInt64*) override { return Ran<NCFRESULT>("GetNextDiscontiguousDataAttributeChange"); }
    NCFRESULT GetDataSizePerSample(ncfUInt64, ncfUInt32*) override { return Ran<NCFRESULT>("GetDataSizePerSample"); }
    NCFRESULT GetDisplayOffset(ncfUInt64, ncfSInt64*) override { return Ran<NCFRESULT>("GetDisplayOffset"); }
    NCFRESULT GetDecodeDuration(ncfUInt64, ncfSInt64*) override { return Ran<NCFRESULT>("GetDecodeDuration"); }
    NCFRESULT GetMaxDataSizeInBytes(ncfUInt32*) override { return Ran<NCFRESULT>("GetMaxDataSizeInBytes"); }
    NCFRESULT GetHasOutOfOrderFrameDependencies(ncfBool*) override { return Ran<NCFRESULT>("GetHasOutOfOrderFrameDependencies"); }
    NCFRESULT GetChunkFromTheMiddle(ncfUInt64*, ncfUInt64*) override { return Ran<NCFRESULT>("GetChunkFromTheMiddle"); }
    NCFRESULT DisplayTimeToFrameNum(ncfUInt64, ncfUInt64*) override { return Ran<NCFRESULT>("DisplayTimeToFrameNum"); }
};

TEST(Places, OfIQTSampleTable) {
    ExpectPlaces<PlacesIQTSampleTable>({
        {3, "GetNumSamples"}, {4, "GetDataOffset"}, {5, "GetSampleFlags"},
        {6, "GetNextDiscontiguousDataAttributeChange"}, {7, "GetDataSizePerSample"},
        {8, "GetDisplayOffset"}, {9, "GetDecodeDuration"}, {10, "GetMaxDataSizeInBytes"},
        {11, "GetHasOutOfOrderFrameDependencies"}, {12, "GetChunkFromTheMiddle"},
        {13, "DisplayTimeToFrameNum"},
    });
}

struct PlacesIVideoTrackInfo : PlaceFake<IVideoTrackInfo> {
    NCFRESULT ReservedTrack3() override { return Ran<NCFRESULT>("ReservedTrack3"); }
    NCFRESULT ReservedTrack4() override { return Ran<NCFRESULT>("ReservedTrack4"); }
    NCFRESULT ReservedTrack5() override { return Ran<NCFRESULT>("ReservedTrack5"); }
    NCFRESULT ReservedTrack6() override { return Ran<NCFRESULT>("ReservedTrack6"); }
    NCFRESULT ReservedTrack7() override { return Ran<NCFRESULT>("ReservedTrack7"); }
    NCFRESULT GetTrackId(ncfUInt32*) override { return Ran<NCFRESULT>("GetTrackId"); }
    NCFRESULT GetTrackDuration(ncfUInt32*) override { return Ran<NCFRESULT>("GetTrackDuration"); }
    NCFRESULT IsTrackLinear(ncfBool*, ncfBool*, ncfSInt64*, ncfUInt32*) override { return Ran<NCFRESULT>("IsTrackLinear"); }
    NCFRESULT TrackTimeToMediaTime(ncfUInt64, ncfSInt64*) override { return Ran<NCFRESULT>("TrackTimeToMediaTime"); }
    NCFRESULT ReservedTrack12() override { return Ran<NCFRESULT>("ReservedTrack12"); }
    NCFRESULT ReservedTrack13() override { return Ran<NCFRESULT>("ReservedTrack13"); }
    NCFRESULT GetMediaTS(ncfUInt32*) override { return Ran<NCFRESULT>("GetMediaTS"); }
    NCFRESULT GetMediaDuration(ncfUInt32*) override { return Ran<NCFRESULT>("GetMediaDuration"); }
    NCFRESULT GetSampleTable(IQTSampleTable**) override { return Ran<NCFRESULT>("GetSampleTable"); }
    NCFRESULT GetSampleDescriptionCount(ncfUInt32*) override { return Ran<NCFRESULT>("GetSampleDescriptionCount"); }
    NCFRESULT ReservedTrack18() override { return Ran<NCFRESULT>("ReservedTrack18"); }
    NCFRESULT ReservedTrack19() override { return Ran<NCFRESULT>("ReservedTrack19"); }
    NCFRESULT ReservedTrack20() override { return Ran<NCFRESULT>("ReservedTrack20"); }
    NCFRESULT ReservedTrack21() override { return Ran<NCFRESULT>("ReservedTrack21"); }
    NCFRESULT GetTrackMatrix(float*) override { return Ran<NCFRESULT>("GetTrackMatrix"); }
    NCFRESULT ReservedVideoTrack23() override { return Ran<NCFRESULT>("ReservedVideoTrack23"); }
    NCFRESULT GetVideoSampleDescription(ncfUInt32, IVideoSampleDescription**) override { return Ran<NCFRESULT>("GetVideoSampleDescription"); }
};

TEST(Places, OfIVideoTrackInfo) {
    ExpectPlaces<PlacesIVideoTrackInfo>({
        {3, "ReservedTrack3"}, {4, "ReservedTrack4"}, {5, "ReservedTrack5"},
        {6, "ReservedTrack6"}, {7, "ReservedTrack7"}, {8, "GetTrackId"}, {9, "GetTrackDuration"},
        {10, "IsTrackLinear"}, {11, "TrackTimeToMediaTime"}, {12, "ReservedTrack12"},
        {13, "ReservedTrack13"}, {14, "GetMediaTS"}, {15, "GetMediaDuration"},
        {16, "GetSampleTable"}, {17, "GetSampleDescriptionCount"}, {18, "ReservedTrack18"},
        {19, "ReservedTrack19"}, {20, "ReservedTrack20"}, {21, "ReservedTrack21"},
        {22, "GetTrackMatrix"}, {23, "ReservedVideoTrack23"}, {24, "GetVideoSampleDescription"},
    });
}

struct PlacesIAudioTrackInfo : PlaceFake<IAudioTrackInfo> {
    NCFRESULT ReservedTrack3() override { return Ran<NCFRESULT>("ReservedTrack3"); }
    NCFRESULT ReservedTrack4() override { return Ran<NCFRESULT>("ReservedTrack4"); }
    NCFRESULT ReservedTrack5() override { return Ran<NCFRESULT>("ReservedTrack5"); }
    NCFRESULT ReservedTrack6() override { return Ran<NCFRESULT>("ReservedTrack6"); }
    NCFRESULT ReservedTrack7() override { return Ran<NCFRESULT>("ReservedTrack7"); }
    NCFRESULT GetTrackId(ncfUInt32*) override { return Ran<NCFRESULT>("GetTrackId"); }
    NCFRESULT GetTrackDuration(ncfUInt32*) override { return Ran<NCFRESULT>("GetTrackDuration"); }
    NCFRESULT IsTrackLinear(ncfBool*, ncfBool*, ncfSInt64*, ncfUInt32*) override { return Ran<NCFRESULT>("IsTrackLinear"); }
    NCFRESULT TrackTimeToMediaTime(ncfUInt64, ncfSInt64*) override { return Ran<NCFRESULT>("TrackTimeToMediaTime"); }
    NCFRESULT ReservedTrack12() override { return Ran<NCFRESULT>("ReservedTrack12"); }
    NCFRESULT ReservedTrack13() override { return Ran<NCFRESULT>("ReservedTrack13"); }
    NCFRESULT GetMediaTS(ncfUInt32*) override { return Ran<NCFRESULT>("GetMediaTS"); }
    NCFRESULT GetMediaDuration(ncfUInt32*) override { return Ran<NCFRESULT>("GetMediaDuration"); }
    NCFRESULT GetSampleTable(IQTSampleTable**) override { return Ran<NCFRESULT>("GetSampleTable"); }
    NCFRESULT GetSampleDescriptionCount(ncfUInt32*) override { return Ran<NCFRESULT>("GetSampleDescriptionCount"); }
    NCFRESULT ReservedTrack18() override { return Ran<NCFRESULT>("ReservedTrack18"); }
    NCFRESULT ReservedTrack19() override { return Ran<NCFRESULT>("ReservedTrack19"); }
    NCFRESULT ReservedTrack20() override { return Ran<NCFRESULT>("ReservedTrack20"); }
    NCFRESULT ReservedTrack21() override { return Ran<NCFRESULT>("ReservedTrack21"); }
    NCFRESULT HasConstantSampleRate(ncfUInt32*) override { return Ran<NCFRESULT>("HasConstantSampleRate"); }
    NCFRESULT GetAudioSampleDescription(ncfUInt32, IAudioSampleDescription**) override { return Ran<NCFRESULT>("GetAudioSampleDescription"); }
};

TEST(Places, OfIAudioTrackInfo) {
    ExpectPlaces<PlacesIAudioTrackInfo>({
        {3, "ReservedTrack3"}, {4, "ReservedTrack4"}, {5, "ReservedTrack5"},
        {6, "ReservedTrack6"}, {7, "ReservedTrack7"}, {8, "GetTrackId"}, {9, "GetTrackDuration"},
        {10, "IsTrackLinear"}, {11, "TrackTimeToMediaTime"}, {12, "ReservedTrack12"},
        {13, "ReservedTrack13"}, {14, "GetMediaTS"}, {15, "GetMediaDuration"},
        {16, "GetSampleTable"}, {17, "GetSampleDescriptionCount"}, {18, "ReservedTrack18"},
        {19, "ReservedTrack19"}, {20, "ReservedTrack20"}, {21, "ReservedTrack21"},
        {22, "HasConstantSampleRate"}, {23, "GetAudioSampleDescription"},
    });
}

}  // namespace
// clang-format on
