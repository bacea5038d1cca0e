// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/MovieCodecs.h"

#include <algorithm>

#include "host_interfaces/quicktime/QuickTimeProperty.h"
#include "host_interfaces/quicktime/QuickTimeWrapper.h"
#include "reference_host/framework/String.h"
#include "reference_host/header_parser/Atom.h"
#include "text/Encodings.h"

namespace cliphost {
namespace {

using header_parser::Track;

constexpr ncfUInt32 kMostTracks = 10'000;
constexpr ncfUInt32 kFormatLPCM = 0x6C70636D;  // 'lpcm'
constexpr char kLinearName[] = "Linear PCM";   // whatever code a kind of it has

std::string Utf8Of(const host::String& text) {
    return encodings::ToUtf8Lossy(text.Text());
}

}  // namespace

MovieCodecs CodecReader::Read(const std::filesystem::path& movie,
                              const header_parser::HeaderReport& header) {
    return header.movie && header.WhyOfNoUse().empty() ? FromHeader(*header.movie)
                                                       : FromLibrary(movie);
}

std::string CodecReader::ReadFirst(const std::filesystem::path& movie) {
    const MovieCodecs codecs = Read(movie, header_parser::InspectHeaders(movie));
    const std::vector<TrackCodec>& tracks =
        codecs.pictures.empty() ? codecs.sounds : codecs.pictures;
    if (tracks.empty()) {
        return {};
    }
    return tracks[0].name.empty() ? tracks[0].code : tracks[0].name;
}

MovieCodecs CodecReader::FromHeader(const header_parser::Movie& movie) {
    MovieCodecs codecs;
    for (const Track& track : movie.tracks) {
        if (!track.video.empty()) {
            const header_parser::VideoDescription& first = track.video.front();
            codecs.pictures.push_back({header_parser::PlainNameOf(first.codec), NameOf(first.codec),
                                       first.depth, first.hasAlpha, first.width, first.height});
        } else if (!track.sound.empty()) {
            const header_parser::SoundDescription& first = track.sound.front();
            codecs.sounds.push_back({header_parser::PlainNameOf(first.codec),
                                     first.isLinear ? kLinearName : NameOf(first.codec),
                                     first.bits});
        }
    }
    return codecs;
}

MovieCodecs CodecReader::FromLibrary(const std::filesystem::path& movie) {
    MovieCodecs codecs;
    host::Ref<QTWrapper::IQuickTimeWrapper> wrapper;
    if (session_.host().Create(QTWrapper::CompID_QuickTimeWrapper, wrapper) < 0 ||
        wrapper->NewMovieFromFilePath(PathForModule(movie).get()) < 0) {
        return codecs;
    }
    ncfBool alpha = 0;
    const bool hasAlpha =
        wrapper->MovieContainsAlpha(QTWrapper::kAlphaCheckForImport, &alpha) >= 0 && alpha != 0;
    const ncfUInt32 last = std::min(wrapper->GetNumberOfTracks(), kMostTracks);
    for (ncfUInt32 track = 1; track <= last; ++track) {
        const bool isPicture = wrapper->IsVideoTrack(track) != 0;
        if (!isPicture && wrapper->IsAudioTrack(track) == 0) {
            continue;
        }
        TrackCodec codec;
        ncfUInt8 code[4] = {};
        if (wrapper->GetFourCCFromImageDescrptor(track, code) >= 0) {
            codec.code =
                header_parser::PlainNameOf(ncfUInt32{code[0]} << 24 | ncfUInt32{code[1]} << 16 |
                                           ncfUInt32{code[2]} << 8 | code[3]);
        }
        const auto name = host::MakeString(std::string_view());
        if (wrapper->GetCodecTypeName(track, name.get()) >= 0) {
            codec.name = Utf8Of(*name);
        }
        if (isPicture) {
            if (codecs.pictures.empty()) {
                codec.hasAlpha = hasAlpha;
                wrapper->GetMovieBox(&codec.width, &codec.height, nullptr, nullptr);
            }
            codecs.pictures.push_back(std::move(codec));
        } else {
            ncfUInt32 format = 0;
            wrapper->GetAudioInfoForTrack(track, nullptr, nullptr, &format, nullptr, nullptr,
                                          nullptr, &codec.bits, nullptr, nullptr);
            codec.name = format == kFormatLPCM ? kLinearName : codec.name;
            codecs.sounds.push_back(std::move(codec));
        }
    }
    return codecs;
}

std::string CodecReader::NameOf(ncfUInt32 code) {
    const auto [entry, isNew] = names_.try_emplace(code);
    if (isNew) {
        host::Ref<QuickTime::IQuickTimeProperty> property;
        const auto name = host::MakeString(std::string_view());
        if (session_.host().Create(QuickTime::CompID_QuickTimeProperty, property) >= 0 &&
            property->GetCodecName(code, name.get()) >= 0) {
            entry->second = Utf8Of(*name);
        }
    }
    return entry->second;
}

}  // namespace cliphost
