// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>

#include "reference_host/header_parser/QTParser.h"
#include "reference_host/movie_writer/Movie.h"
#include "reference_host/util/Ref.h"

// A movie that went through the parser, asked through its interfaces alone.
class ParsedMovie {
public:
    explicit ParsedMovie(const movies::Movie& movie,
                         const header_parser::ParserLimits& limits = {});
    explicit ParsedMovie(const movies::MadeMovie& made,
                         const header_parser::ParserLimits& limits = {});
    explicit ParsedMovie(const movies::Bytes& bytes,
                         const header_parser::ParserLimits& limits = {});

    NCFRESULT Result() const { return result_; }
    std::string Reason() const { return parser_->WhyRefused().reason; }
    ncfUInt32 Passes() const { return passes_; }
    header_parser::QTParser* operator->() const { return parser_.get(); }
    header_parser::QTParser& Parser() const { return *parser_; }

    // Null when there is none at that place.
    host::Ref<IVideoTrackInfo> Video(ncfUInt32 index = 0) const;
    host::Ref<IAudioTrackInfo> Sound(ncfUInt32 index = 0) const;
    host::Ref<ITrackInfo> Timecode(ncfUInt32 index = 0) const;
    host::Ref<ITrackInfo> Other(ncfUInt32 index = 0) const;
    host::Ref<IVideoSampleDescription> VideoDescription(ncfUInt32 index = 0) const;
    host::Ref<IAudioSampleDescription> SoundDescription(ncfUInt32 index = 0) const;
    // Of the first video track, else of the first sound track.
    host::Ref<IQTSampleTable> Samples() const;

private:
    host::Ref<header_parser::QTParser> parser_;
    NCFRESULT result_ = NCF_OK;
    ncfUInt32 passes_ = 0;
};

// A small movie without a defect: 30 frames of video in chunks of 10, at 30 frames a
// second, movie time scale 600.
movies::Movie PlainMovie();

// What an operation with a single output gives. A failure throws, and so fails
// the test.
template <typename Value, typename Class, typename Object>
Value Ask(const Object& object, NCFRESULT (Class::*operation)(Value*)) {
    Value value{};
    const NCFRESULT result = ((*object).*operation)(&value);
    if (result != NCF_OK) {
        throw result;
    }
    return value;
}

// The same for an operation on one sample.
template <typename Value, typename Class, typename Object>
Value AskSample(const Object& object, NCFRESULT (Class::*operation)(ncfUInt64, Value*),
                ncfUInt64 sample) {
    Value value{};
    const NCFRESULT result = ((*object).*operation)(sample, &value);
    if (result != NCF_OK) {
        throw result;
    }
    return value;
}
