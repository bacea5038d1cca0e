// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/CodedAlone.h"

#include <algorithm>

#include "reference_host/quicktime/CodecNames.h"
#include "reference_host/quicktime/MovieFile.h"

namespace host {
namespace {

using header_parser::Code;

// Codecs without other pictures that the library doesn't mark as such.
constexpr AVCodecID kIntraCodecs[] = {AV_CODEC_ID_PNG, AV_CODEC_ID_CFHD};

// Forms of codecs that have other pictures elsewhere: IMX, and AVC-Intra.
constexpr ncfUInt32 kIntraCodes[] = {
    Code("mx3n"), Code("mx3p"), Code("mx4n"), Code("mx4p"), Code("mx5n"), Code("mx5p"),
    Code("ai12"), Code("ai13"), Code("ai15"), Code("ai16"), Code("ai1p"), Code("ai1q"),
    Code("ai52"), Code("ai53"), Code("ai55"), Code("ai56"), Code("ai5p"), Code("ai5q")};

// The description of an H.264 stream begins with a version, the profile, and what is promised of
// it; in the profiles above the high one that bit promises pictures that stand alone.
bool IsIntraProfile(const AVCodecParameters& form) {
    constexpr int kHigh10 = 110, kHigh422 = 122, kHigh444 = 244;
    constexpr unsigned kIntraBit = 0x10;
    if (form.codec_id != AV_CODEC_ID_H264 || form.extradata_size < 3 || form.extradata[0] != 1) {
        return false;
    }
    const int profile = form.extradata[1];
    return (form.extradata[2] & kIntraBit) != 0 &&
           (profile == kHigh10 || profile == kHigh422 || profile == kHigh444);
}

template <typename Value, std::size_t kCount>
bool IsOneOf(const Value (&values)[kCount], Value value) {
    return std::find(std::begin(values), std::end(values), value) != std::end(values);
}

}  // namespace

bool IsCodedAlone(const AVCodecParameters& form) {
    const AVCodecDescriptor* const codec = avcodec_descriptor_get(form.codec_id);
    return (codec && (codec->props & AV_CODEC_PROP_INTRA_ONLY) != 0) ||
           IsOneOf(kIntraCodecs, form.codec_id) ||
           IsOneOf(kIntraCodes, CodeOfTag(form.codec_tag)) || IsIntraProfile(form);
}

bool AreCodedAlone(const std::filesystem::path& movie) {
    std::string ignored;
    const auto file = MovieFile::Open(movie, ignored);
    const AVStream* const stream = file ? file->FindTrack(file->FirstVideo()) : nullptr;
    return stream && IsCodedAlone(*stream->codecpar);
}

}  // namespace host
