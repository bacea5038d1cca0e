// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/unit/quicktime/AskEverything.h"

#include <vector>

#include "reference_host/framework/HostPath.h"
#include "reference_host/framework/String.h"
#include "reference_host/quicktime/QuickTimeProperty.h"
#include "reference_host/quicktime/QuickTimeWrapper.h"

namespace quicktime_tests {
namespace {

constexpr ncfUInt32 kMostPictureBytes = 1u << 24;
constexpr ncfUInt32 kMostTracks = 8;
constexpr ncfUInt32 kUyvy = 0x32767579;
constexpr std::uint8_t kMark = 0xA5;

// Whether nothing was written behind the room that was given.
bool IsMarked(const std::vector<std::uint8_t>& bytes, std::size_t from) {
    for (std::size_t i = from; i < bytes.size(); ++i) {
        if (bytes[i] != kMark) {
            return false;
        }
    }
    return true;
}

const char* AskPictures(QTWrapper::IQuickTimeWrapper& wrapper) {
    host::Ref<QTWrapper::IQTVideoReader> reader;
    if (wrapper.GetQTVideoReader(reader.Out()) < 0 || reader->InitQT(0) < 0 ||
        reader->SetOutputPixelFormat(kUyvy, 0, 0) < 0) {
        return nullptr;
    }
    const ncfUInt32 size = reader->GetFrameBufferSize(0xFFFFFFFF, 0, 0);
    if (size > kMostPictureBytes) {
        return nullptr;
    }
    std::vector<std::uint8_t> room(std::size_t{size} + 64, kMark);
    for (const ncfUInt64 number : {0ull, 3ull, 1ull, ~0ull}) {
        reader->ReadFrame(number, room.data(), 0, 0, 0);
        if (!IsMarked(room, size)) {
            return "a picture was written past its size";
        }
    }
    reader->ReleaseQT();
    return nullptr;
}

const char* AskSound(QTWrapper::IQuickTimeWrapper& wrapper, ncfUInt32 track) {
    host::Ref<QTWrapper::IQTAudioReader> reader;
    ncfUInt32 channels = 0;
    if (wrapper.GetQTAudioReader(reader.Out()) < 0 ||
        reader->SetParams(track, 3, 1, 48000.0, channels) < 0) {
        return nullptr;
    }
    if (channels == 0 || channels > 1024) {
        return "sound of no channels, or of more than there may be";
    }
    constexpr std::size_t kRoom = 6000;
    std::vector<std::uint8_t> room(kRoom + 64, kMark);
    for (const ncfUInt64 sample : {ncfUInt64{0}, ncfUInt64{700}, ~ncfUInt64{0}}) {
        ncfUInt64 count = kRoom;
        reader->ReadSamples(track, sample, &count, room.data(), kRoom, 0, 0);
        if (!IsMarked(room, kRoom)) {
            return "sound was written past its room";
        }
    }
    return nullptr;
}

const char* AskTable(QTWrapper::IQTWSampleTable& table, ncfUInt32 track) {
    ncfUInt64 count = 0;
    if (table.GetNumSamples(track, &count) < 0) {
        return "no samples are counted of a track that there is";
    }
    const ncfUInt32 most = table.GetMaxDataSize(track);
    table.HasOutOfOrderFrameDependencies(track);
    for (const ncfUInt64 sample : {ncfUInt64{0}, ncfUInt64{1}, count / 2, count, count + 1}) {
        ncfUInt64 place = 0, next = 0;
        ncfUInt32 size = 0;
        ncfSInt64 offset = 0, duration = 0;
        QTWrapper::QTWSamplePropertyFlags_t flags{};
        const bool isThere = sample >= 1 && sample <= count;
        table.GetDataOffset(track, sample, &place);
        table.GetDisplayOffset(track, sample, &offset);
        table.GetDecodeDuration(track, sample, &duration);
        if ((table.GetSampleFlags(track, sample, &flags) == NCF_OK) != isThere ||
            (table.GetDataSizePerSample(track, sample, &size) == NCF_OK) != isThere) {
            return "a sample that there is not, or none that there is";
        }
        if (size > most) {
            return "a sample above the largest";
        }
        if (table.GetNextDiscontiguousDataAttributeChange(track, sample, &next) == NCF_OK &&
            (next <= sample || next > count + 1)) {
            return "a run of samples that ends outside of the track";
        }
    }
    return nullptr;
}

const char* AskTrack(QTWrapper::IQuickTimeWrapper& wrapper, QTWrapper::IQTWSampleTable& table,
                     ncfUInt32 track) {
    const int kinds = (wrapper.IsVideoTrack(track) != 0) + (wrapper.IsAudioTrack(track) != 0) +
                      (wrapper.IsTimeCodeTrack(track) != 0);
    if (kinds > 1) {
        return "a track of two kinds";
    }
    const auto name = host::MakeString(std::string_view(""));
    ncfUInt8 bytes[4] = {};
    ncfUInt32 a = 0, b = 0, c = 0, d = 0, e = 0, f = 0;
    ncfUInt8 big = 0, constant = 0;
    double rate = 0.0;
    wrapper.GetCodecTypeName(track, name.get());
    wrapper.GetFourCCFromImageDescrptor(track, bytes);
    wrapper.GetFieldLayoutForTrack(track, &a);
    wrapper.GetImageDescriptionCount(track);
    wrapper.GetResolutionId(track);
    wrapper.GetVendor(track, &a);
    wrapper.GetTrackDuration(track);
    if (wrapper.GetTimeCodeInfoForTrack(track, bytes, bytes + 1, bytes + 2, bytes + 3, &a, &b, &c,
                                        &d) == NCF_OK &&
        (a == 0 || b == 0 || c > 1 || (d & 0xFF) == 0)) {
        return "a timecode that can't be counted with";
    }
    if (wrapper.GetAudioInfoForTrack(track, &a, &rate, &b, &c, &d, &e, &f, &big, &constant) ==
            NCF_OK &&
        (a == 0 || a > 1024 || !(rate >= 1.0 && rate <= 1e9))) {
        return "sound whose numbers make no sense";
    }
    if (wrapper.IsAudioTrack(track)) {
        if (const char* const problem = AskSound(wrapper, track)) {
            return problem;
        }
    }
    return wrapper.GetDescribedTrackCount() > 0 && kinds == 1 ? AskTable(table, track) : nullptr;
}

const char* AskMovie(QTWrapper::IQuickTimeWrapper& wrapper) {
    ncfUInt32 a = 0, b = 0, c = 0, d = 0;
    ncfBool x = 0, y = 0;
    wrapper.PreparePixelFormat(kUyvy);
    wrapper.QueryVideoDescBufferDetails(&a, &b);
    wrapper.GetCodecColorSpaceInfo(&x, &y);
    wrapper.MovieHasOneFrame();
    wrapper.MovieHasMultipleVideoTracks(0, 0);
    wrapper.MovieHasAudio();
    wrapper.GetMovieCreationTime();
    wrapper.MovieIsSelfContained(0, 0, 0);
    wrapper.MovieContainsAlpha(QTWrapper::kAlphaCheckForImport, &x);
    wrapper.MovieContainsAlpha(QTWrapper::kAlphaCheckForQTNMA, &x);
    wrapper.QTWSetMovieBox(0, 0, 48, 64);
    if (wrapper.GetMovieTimeScale() == 0) {
        return "a movie without units of time";
    }
    if (wrapper.GetMovieBox(&a, &b, &c, &d) == NCF_OK && (a == 0 || b == 0 || c == 0 || d == 0)) {
        return "a box of no size";
    }
    ncfUInt32 track = 0;
    if (wrapper.GetFirstVideoTrack(&track) && !wrapper.IsVideoTrack(track)) {
        return "a first picture track that is none";
    }
    ncfSInt32 num = 0, den = 0;
    ncfUInt64 length = 0;
    std::vector<ncfUInt64> lengths(wrapper.GetNumberOfTracks());
    for (const ncfBool byHeader : {0, 1}) {
        const NCFRESULT result = wrapper.DetermineMovieEditRateAndLength(
            0.0, 25.0, 60, &num, &den, &length, lengths.data(),
            static_cast<ncfUInt32>(lengths.size()), byHeader);
        if (result == NCF_OK && (num <= 0 || den <= 0)) {
            return "a rate that is none";
        }
    }
    wrapper.MovieTrackDurationIssues(25, 1, length, &x, &y);
    host::Ref<QTWrapper::IQTWSampleTable> table;
    if (wrapper.GetSampleTable(table.Out()) < 0) {
        return "no sample table";
    }
    for (ncfUInt32 i = 0; i <= wrapper.GetNumberOfTracks() && i < kMostTracks; ++i) {
        if (const char* const problem = AskTrack(wrapper, *table, i)) {
            return problem;
        }
    }
    return AskPictures(wrapper);
}

void AskProperty(INCFString* path) {
    const auto property = host::MakeRef<host::QuickTimeProperty>();
    host::Ref<INCFBuffer> codes;
    ncfUInt32 value = 0;
    property->CreateMovie(path);
    property->GetCodecPixelFormats(codes.Out(), &value);
    property->GetCodecStorageType(&value);
    property->DoesCodecSupportRGB_CCIR(&value);
}

}  // namespace

const char* AskEverything(const std::filesystem::path& path) {
    const auto text = host::ModulePath(path);
    const auto wrapper = host::MakeRef<host::QuickTimeWrapper>();
    const bool isOpen = wrapper->NewMovieFromFilePath(text.get()) == NCF_OK;
    AskProperty(text.get());
    if (!isOpen) {
        return wrapper->GetNumberOfTracks() == 0 ? nullptr : "tracks of a movie that is not open";
    }
    return AskMovie(*wrapper);
}

}  // namespace quicktime_tests
