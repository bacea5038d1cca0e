// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The places of the operations of host_interfaces/quicktime/ in their tables, written
// down once more and called by number: modules that are built call by place.

#include "host_interfaces/quicktime/QuickTimeProperty.h"
#include "host_interfaces/quicktime/QuickTimeWrapper.h"
#include "host_interfaces/quicktime/Readers.h"
#include "host_interfaces/quicktime/SampleTable.h"
#include "tests/unit/host_interfaces/CallPlace.h"

// clang-format off
namespace {

struct PlacesIQuickTimeProperty : PlaceFake<QuickTime::IQuickTimeProperty> {
    NCFRESULT CreateMovie(INCFString*) override { return Ran<NCFRESULT>("CreateMovie"); }
    NCFRESULT GetCodecPixelFormats(INCFBuffer**, ncfUInt32*) override { return Ran<NCFRESULT>("GetCodecPixelFormats"); }
    NCFRESULT GetCodecName(ncfUInt32, INCFString*) override { return Ran<NCFRESULT>("GetCodecName"); }
    NCFRESULT GetCodecStorageType(ncfUInt32*) override { return Ran<NCFRESULT>("GetCodecStorageType"); }
    NCFRESULT DoesCodecSupportRGB_CCIR(ncfUInt32*) override { return Ran<NCFRESULT>("DoesCodecSupportRGB_CCIR"); }
};

TEST(Places, OfIQuickTimeProperty) {
    ExpectPlaces<PlacesIQuickTimeProperty>({
        {3, "CreateMovie"}, {4, "GetCodecPixelFormats"}, {5, "GetCodecName"},
        {6, "GetCodecStorageType"}, {7, "DoesCodecSupportRGB_CCIR"},
    });
}

struct PlacesIQuickTimeWrapper : PlaceFake<QTWrapper::IQuickTimeWrapper> {
    NCFRESULT PreparePixelFormat(ncfUInt32) override { return Ran<NCFRESULT>("PreparePixelFormat"); }
    NCFRESULT GetSampleTable(QTWrapper::IQTWSampleTable**) override { return Ran<NCFRESULT>("GetSampleTable"); }
    NCFRESULT GetQTAudioReader(QTWrapper::IQTAudioReader**) override { return Ran<NCFRESULT>("GetQTAudioReader"); }
    NCFRESULT GetQTVideoReader(QTWrapper::IQTVideoReader**) override { return Ran<NCFRESULT>("GetQTVideoReader"); }
    NCFRESULT QueryVideoDescBufferDetails(ncfUInt32*, ncfUInt32*) override { return Ran<NCFRESULT>("QueryVideoDescBufferDetails"); }
    NCFRESULT GetCodecColorSpaceInfo(ncfBool*, ncfBool*) override { return Ran<NCFRESULT>("GetCodecColorSpaceInfo"); }
    ncfBool MovieHasOneFrame() override { return Ran<ncfBool>("MovieHasOneFrame"); }
    ncfUInt32 GetResolutionId(ncfUInt32) override { return Ran<ncfUInt32>("GetResolutionId"); }
    NCFRESULT GetCodecTypeName(ncfUInt32, INCFString*) override { return Ran<NCFRESULT>("GetCodecTypeName"); }
    NCFRESULT MovieTrackDurationIssues(ncfSInt32, ncfSInt32, ncfUInt64, ncfBool*, ncfBool*) override { return Ran<NCFRESULT>("MovieTrackDurationIssues"); }
    ncfBool MovieHasMultipleVideoTracks(ncfUInt32, ncfUInt32) override { return Ran<ncfBool>("MovieHasMultipleVideoTracks"); }
    ncfBool GetFirstVideoTrack(ncfUInt32*) override { return Ran<ncfBool>("GetFirstVideoTrack"); }
    ncfBool GetFieldLayoutForTrack(ncfUInt32, ncfUInt32*) override { return Ran<ncfBool>("GetFieldLayoutForTrack"); }
    NCFRESULT GetFourCCFromImageDescrptor(ncfUInt32, ncfUInt8*) override { return Ran<NCFRESULT>("GetFourCCFromImageDescrptor"); }
    ncfUInt32 GetImageDescriptionCount(ncfUInt32) override { return Ran<ncfUInt32>("GetImageDescriptionCount"); }
    NCFRESULT MovieContainsAlpha(ncfUInt32, ncfBool*) override { return Ran<NCFRESULT>("MovieContainsAlpha"); }
    NCFRESULT GetAudioInfoForTrack(ncfUInt32, ncfUInt32*, double*, ncfUInt32*, ncfUInt32*, ncfUInt32*, ncfUInt32*, ncfUInt32*, ncfUInt8*, ncfUInt8*) override { return Ran<NCFRESULT>("GetAudioInfoForTrack"); }
    NCFRESULT GetMovieBox(ncfUInt32*, ncfUInt32*, ncfUInt32*, ncfUInt32*) override { return Ran<NCFRESULT>("GetMovieBox"); }
    ncfUInt64 GetMovieCreationTime() override { return Ran<ncfUInt64>("GetMovieCreationTime"); }
    ncfUInt32 GetDescribedTrackCount() override { return Ran<ncfUInt32>("GetDescribedTrackCount"); }
    ncfUInt32 MovieIsSelfContained(ncfUInt32, ncfUInt32, ncfUInt32) override { return Ran<ncfUInt32>("MovieIsSelfContained"); }
    NCFRESULT GetTimeCodeInfoForTrack(ncfUInt32, ncfUInt8*, ncfUInt8*, ncfUInt8*, ncfUInt8*, ncfUInt32*, ncfUInt32*, ncfUInt32*, ncfUInt32*) override { return Ran<NCFRESULT>("GetTimeCodeInfoForTrack"); }
    ncfBool IsVideoTrack(ncfUInt32) override { return Ran<ncfBool>("IsVideoTrack"); }
    ncfBool IsAudioTrack(ncfUInt32) override { return Ran<ncfBool>("IsAudioTrack"); }
    ncfBool IsTimeCodeTrack(ncfUInt32) override { return Ran<ncfBool>("IsTimeCodeTrack"); }
    ncfUInt32 GetNumberOfTracks() override { return Ran<ncfUInt32>("GetNumberOfTracks"); }
    ncfBool MovieHasAudio() override { return Ran<ncfBool>("MovieHasAudio"); }
    NCFRESULT NewMovieFromFilePath(INCFString*) override { return Ran<NCFRESULT>("NewMovieFromFilePath"); }
    NCFRESULT DetermineMovieEditRateAndLength(double, double, ncfUInt32, ncfSInt32*, ncfSInt32*, ncfUInt64*, ncfUInt64*, ncfUInt32, ncfBool) override { return Ran<NCFRESULT>("DetermineMovieEditRateAndLength"); }
    NCFRESULT QTWSetMovieBox(ncfSInt16, ncfSInt16, ncfSInt16, ncfSInt16) override { return Ran<NCFRESULT>("QTWSetMovieBox"); }
    NCFRESULT GetVendor(ncfUInt32, ncfUInt32*) override { return Ran<NCFRESULT>("GetVendor"); }
    ncfUInt64 GetTrackDuration(ncfUInt32) override { return Ran<ncfUInt64>("GetTrackDuration"); }
    ncfUInt32 GetMovieTimeScale() override { return Ran<ncfUInt32>("GetMovieTimeScale"); }
};

TEST(Places, OfIQuickTimeWrapper) {
    ExpectPlaces<PlacesIQuickTimeWrapper>({
        {3, "PreparePixelFormat"}, {4, "GetSampleTable"}, {5, "GetQTAudioReader"},
        {6, "GetQTVideoReader"}, {7, "QueryVideoDescBufferDetails"},
        {8, "GetCodecColorSpaceInfo"}, {9, "MovieHasOneFrame"}, {10, "GetResolutionId"},
        {11, "GetCodecTypeName"}, {12, "MovieTrackDurationIssues"},
        {13, "MovieHasMultipleVideoTracks"}, {14, "GetFirstVideoTrack"},
        {15, "GetFieldLayoutForTrack"}, {16, "GetFourCCFromImageDescrptor"},
        {17, "GetImageDescriptionCount"}, {18, "MovieContainsAlpha"},
        {19, "GetAudioInfoForTrack"}, {20, "GetMovieBox"}, {21, "GetMovieCreationTime"},
        {22, "GetDescribedTrackCount"}, {23, "MovieIsSelfContained"},
        {24, "GetTimeCodeInfoForTrack"}, {25, "IsVideoTrack"}, {26, "IsAudioTrack"},
        {27, "IsTimeCodeTrack"}, {28, "GetNumberOfTracks"}, {29, "MovieHasAudio"},
        {30, "NewMovieFromFilePath"}, {31, "DetermineMovieEditRateAndLength"},
        {32, "QTWSetMovieBox"}, {33, "GetVendor"}, {34, "GetTrackDuration"},
        {35, "GetMovieTimeScale"},
    });
}

struct PlacesIQTVideoReader : PlaceFake<QTWrapper::IQTVideoReader> {
    NCFRESULT SetOutputPixelFormat(ncfUInt32, ncfUInt32, ncfUInt32) override { return Ran<NCFRESULT>("SetOutputPixelFormat"); }
    NCFRESULT ReadFrame(ncfUInt64, void*, ncfUInt32, ncfUInt32, ncfUInt32) override { return Ran<NCFRESULT>("ReadFrame"); }
    ncfUInt32 GetFrameBufferSize(ncfUInt32, ncfUInt64, ncfUInt32) override { return Ran<ncfUInt32>("GetFrameBufferSize"); }
    NCFRESULT InitQT(ncfUInt32) override { return Ran<NCFRESULT>("InitQT"); }
    NCFRESULT ReservedVideoReaderOperation() override { return Ran<NCFRESULT>("ReservedVideoReaderOperation"); }
    NCFRESULT ReleaseQT() override { return Ran<NCFRESULT>("ReleaseQT"); }
};

TEST(Places, OfIQTVideoReader) {
    ExpectPlaces<PlacesIQTVideoReader>({
        {3, "SetOutputPixelFormat"}, {4, "ReadFrame"}, {5, "GetFrameBufferSize"}, {6, "InitQT"},
        {7, "ReservedVideoReaderOperation"}, {8, "ReleaseQT"},
    });
}

struct PlacesIQTAudioReader : PlaceFake<QTWrapper::IQTAudioReader> {
    NCFRESULT ReservedAudioReaderOperation() override { return Ran<NCFRESULT>("ReservedAudioReaderOperation"); }
    NCFRESULT SetParams(ncfUInt32, ncfUInt32, ncfUInt8, double, ncfUInt32&) override { return Ran<NCFRESULT>("SetParams"); }
    NCFRESULT ReadSamples(ncfUInt32, ncfUInt64, ncfUInt64*, void*, ncfUInt64, ncfUInt8, ncfUInt8) override { return Ran<NCFRESULT>("ReadSamples"); }
};

TEST(Places, OfIQTAudioReader) {
    ExpectPlaces<PlacesIQTAudioReader>({
        {3, "ReservedAudioReaderOperation"}, {4, "SetParams"}, {5, "ReadSamples"},
    });
}

struct PlacesIQTWSampleTable : PlaceFake<QTWrapper::IQTWSampleTable> {
    NCFRESULT GetNumSamples(ncfUInt32, ncfUInt64*) override { return Ran<NCFRESULT>("GetNumSamples"); }
    NCFRESULT GetDataOffset(ncfUInt32, ncfUInt64, ncfUInt64*) override { return Ran<NCFRESULT>("GetDataOffset"); }
    NCFRESULT GetSampleFlags(ncfUInt32, ncfUInt64, QTWrapper::QTWSamplePropertyFlags_t*) override { return Ran<NCFRESULT>("GetSampleFlags"); }
    NCFRESULT GetNextDiscontiguousDataAttributeChange(ncfUInt32, ncfUInt64, ncfUInt64*) override { return Ran<NCFRESULT>("GetNextDiscontiguousDataAttributeChange"); }
    NCFRESULT GetDataSizePerSample(ncfUInt32, ncfUInt64, ncfUInt32*) override { return Ran<NCFRESULT>("GetDataSizePerSample"); }
    NCFRESULT GetDisplayOffset(ncfUInt32, ncfUInt64, ncfSInt64*) override { return Ran<NCFRESULT>("GetDisplayOffset"); }
    NCFRESULT GetDecodeDuration(ncfUInt32, ncfUInt64, ncfSInt64*) override { return Ran<NCFRESULT>("GetDecodeDuration"); }
    ncfUInt32 GetMaxDataSize(ncfUInt32) override { return Ran<ncfUInt32>("GetMaxDataSize"); }
    ncfBool HasOutOfOrderFrameDependencies(ncfUInt32) override { return Ran<ncfBool>("HasOutOfOrderFrameDependencies"); }
};

TEST(Places, OfIQTWSampleTable) {
    ExpectPlaces<PlacesIQTWSampleTable>({
        {3, "GetNumSamples"}, {4, "GetDataOffset"}, {5, "GetSampleFlags"},
        {6, "GetNextDiscontiguousDataAttributeChange"}, {7, "GetDataSizePerSample"},
        {8, "GetDisplayOffset"}, {9, "GetDecodeDuration"}, {10, "GetMaxDataSize"},
        {11, "HasOutOfOrderFrameDependencies"},
    });
}

}  // namespace
// clang-format on
