// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "tests/unit/header_parser/VisitEverything.h"

#include <cmath>
#include <cstdio>
#include <cstdlib>

#include "reference_host/util/Ref.h"

namespace {

void Demand(bool condition, const char* promise) {
    if (!condition) {
        std::fprintf(stderr, "broken promise: %s\n", promise);
        std::abort();
    }
}

void VisitSample(IQTSampleTable& table, ncfUInt64 sample, ncfUInt64 count) {
    ncfUInt64 position = 0, next = 0;
    ncfUInt32 flags = 0, bytes = 0, largest = 0;
    ncfSInt64 offset = 0, duration = 0;
    const NCFRESULT expected = sample >= 1 && sample <= count ? NCF_OK : NCF_E_INVALIDARG;
    Demand(table.GetDataOffset(sample, &position) == expected, "offset of a sample");
    Demand(table.GetSampleFlags(sample, &flags) == expected, "flags of a sample");
    Demand(table.GetDataSizePerSample(sample, &bytes) == expected, "size of a sample");
    Demand(table.GetDisplayOffset(sample, &offset) == expected, "display offset of a sample");
    Demand(table.GetDecodeDuration(sample, &duration) == expected, "duration of a sample");
    Demand(table.GetNextDiscontiguousDataAttributeChange(sample, &next) == expected, "next change");
    table.GetMaxDataSizeInBytes(&largest);
    if (expected == NCF_OK) {
        Demand(flags >= 1 && flags <= 3, "flags are 1 to 3");
        Demand(next > sample && next <= count + 1, "the next change lies behind the sample");
        Demand(bytes <= largest, "no sample is larger than the largest");
        Demand(position + bytes <= INT64_MAX, "a sample lies within a file");
        Demand(duration >= 0, "durations are not negative");
    }
}

void VisitTable(IQTSampleTable& table) {
    ncfUInt64 count = 0, position = 0, size = 0, shown = 0;
    ncfBool outOfOrder = 0;
    Demand(table.GetNumSamples(&count) == NCF_OK, "number of samples");
    for (const ncfUInt64 sample : {ncfUInt64{0}, ncfUInt64{1}, ncfUInt64{2}, count / 3, count / 2,
                                   count - 1, count, count + 1, ~ncfUInt64{0}}) {
        VisitSample(table, sample, count);
    }
    table.GetHasOutOfOrderFrameDependencies(&outOfOrder);
    const NCFRESULT chunk = table.GetChunkFromTheMiddle(&position, &size);
    Demand(chunk == (count == 0 ? NMA_E_NODATA : NCF_OK), "a track with samples has a chunk");
    for (const ncfUInt64 time :
         {ncfUInt64{0}, ncfUInt64{1}, ncfUInt64{1000}, ncfUInt64{1} << 31, ~ncfUInt64{0}}) {
        if (table.DisplayTimeToFrameNum(time, &shown) == NCF_OK) {
            Demand(shown >= 1 && shown <= count, "what is shown is a sample");
        }
    }
}

void VisitTrack(ITrackInfo& track) {
    ncfUInt32 id = 0, duration = 0, scale = 0, mediaScale = 0, mediaDuration = 0, count = 0;
    ncfBool linear = 0, proportional = 0;
    ncfSInt64 offset = 0, mediaTime = 0;
    Demand(track.GetTrackId(&id) == NCF_OK && id != 0, "track ids are not 0");
    track.GetTrackDuration(&duration);
    Demand(track.IsTrackLinear(&linear, &proportional, &offset, &scale) == NCF_OK && scale > 0,
           "time scales are above 0");
    Demand(!linear || proportional, "a linear track is proportional");
    Demand(track.GetMediaTS(&mediaScale) == NCF_OK && mediaScale > 0, "time scales are above 0");
    track.GetMediaDuration(&mediaDuration);
    track.GetSampleDescriptionCount(&count);
    for (const ncfUInt64 time :
         {ncfUInt64{0}, ncfUInt64{duration} / 2, ncfUInt64{duration}, ~ncfUInt64{0}}) {
        const NCFRESULT expected = time < duration ? NCF_OK : NMA_E_NODATA;
        Demand(track.TrackTimeToMediaTime(time, &mediaTime) == expected, "media time of a track");
        Demand(mediaTime >= -1, "media times are -1 or more");
    }
    host::Ref<IQTSampleTable> table;
    Demand(track.GetSampleTable(table.Out()) == NCF_OK, "every track has a sample table");
    VisitTable(*table);
}

void VisitPicture(IVideoSampleDescription& description) {
    ncfUInt32 code = 0, vendor = 0, above = 0, below = 0, coding = 0, count = 0;
    ncfUInt32 fields = 0, topFirst = 0, split = 0, codes[3] = {};
    ncfUInt16 width = 0, height = 0;
    ncfSInt32 alpha = 0;
    QTNivoResolution resolution{};
    host::Ref<INCFString> text;
    description.GetDataFormat(&code);
    description.GetEncodedWidthAndHeight(&width, &height);
    description.HasAlpha(&alpha);
    description.GetVendor(&vendor);
    description.GetVideoColorSpaceDetails(codes);
    description.GetNivoResolution(&resolution);
    description.GetRIAttributes(text.Out());
    description.GetCMAttributes(text.Out());
    if (description.GetFieldInfo(&fields, &topFirst, &split) == NCF_OK) {
        Demand(fields == 1 || fields == 2, "a frame has one or two fields");
    }
    if (description.GetImageAspectRatio(&above, &below) == NCF_OK) {
        Demand(above > 0 && below > 0, "the aspect is a ratio of positive numbers");
    }
    description.GetNivoAlphaCodingCount(&count);
    for (ncfUInt32 i = 0; i < count && i < 100; ++i) {
        Demand(description.GetNivoAlphaCoding(i, &coding) == NCF_OK, "listed codings are there");
    }
    Demand(description.GetNivoAlphaCoding(count, &coding) == NCF_E_NOTFOUND, "no more codings");
}

void VisitSound(IAudioSampleDescription& description) {
    ncfUInt32 channels = 0, bits = 0, bytes = 0;
    double rate = 0;
    ncfBool constant = 0, linear = 0, little = 0;
    description.GetChannelsPerFrame(&channels);
    description.GetBitsPerChannel(&bits);
    description.GetSampleRate(&rate);
    description.IsConstantBitRate(&constant);
    description.IsLPCM(&linear);
    description.GetBytesPerPacket(&bytes);
    description.IsLittleEndian(&little);
    Demand(std::isfinite(rate) && rate >= 1 && rate <= 1e9, "sample rates are in range");
    Demand(!linear || (channels > 0 && bits > 0 && bytes > 0), "linear sound has a layout");
}

}  // namespace

void VisitEverything(IQTParser& parser) {
    ncfUInt64 number = 0, other = 0;
    ncfUInt32 value = 0, count = 0;
    ncfBool flag = 0;
    Demand(parser.GetCreationTime(&number) == NCF_OK, "creation time");
    Demand(parser.GetTimeScale(&value) == NCF_OK && value > 0, "time scales are above 0");
    Demand(parser.GetMovieDuration(&value) == NCF_OK, "movie duration");
    Demand(parser.IsMovieSelfContained(&flag) == NCF_OK, "self contained or not");
    Demand(parser.GetMOOVAtom(&number, &other) == NCF_OK && other >= 8, "the movie atom");
    ncfUInt8 h = 0, m = 0, s = 0, f = 0;
    ncfUInt32 scale = 0, duration = 0, drop = 0, frames = 0;
    if (parser.GetTimeCodeInfo(&h, &m, &s, &f, &scale, &duration, &drop, &frames) == NCF_OK) {
        Demand((frames & 0xFF) != 0 && drop <= 1, "timecode can be counted with");
        Demand(h < 24 && m < 60 && s < 60 && f < frames, "a start is an address of a day");
    }
    host::Ref<IVideoTrackInfo> video;
    for (ncfUInt32 i = 0; parser.GetVideoTrackInfo(i, video.Out()) == NCF_OK; ++i) {
        VisitTrack(*video);
        float matrix[9] = {};
        video->GetTrackMatrix(matrix);
        video->GetSampleDescriptionCount(&count);
        host::Ref<IVideoSampleDescription> description;
        for (ncfUInt32 k = 0; k < count; ++k) {
            Demand(video->GetVideoSampleDescription(k, description.Out()) == NCF_OK,
                   "counted descriptions are there");
            VisitPicture(*description);
        }
    }
    host::Ref<IAudioTrackInfo> sound;
    for (ncfUInt32 i = 0; parser.GetAudioTrackInfo(i, sound.Out()) == NCF_OK; ++i) {
        VisitTrack(*sound);
        const NCFRESULT varies = sound->HasConstantSampleRate(nullptr);
        Demand(varies == 0 || varies == 1, "constant or not");
        sound->GetSampleDescriptionCount(&count);
        host::Ref<IAudioSampleDescription> description;
        for (ncfUInt32 k = 0; k < count; ++k) {
            Demand(sound->GetAudioSampleDescription(k, description.Out()) == NCF_OK,
                   "counted descriptions are there");
            VisitSound(*description);
        }
    }
    host::Ref<ITrackInfo> track;
    for (ncfUInt32 i = 0; parser.GetTimeCodeTrackInfo(i, track.Out()) == NCF_OK; ++i) {
        VisitTrack(*track);
    }
    for (ncfUInt32 i = 0; parser.GetOtherTrackInfo(i, track.Out()) == NCF_OK; ++i) {
        VisitTrack(*track);
    }
}
