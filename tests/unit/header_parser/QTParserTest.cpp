// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/QTParser.h"

#include <gtest/gtest.h>

#include "reference_host/framework/Host.h"
#include "tests/unit/header_parser/ParsedMovie.h"

namespace {

using header_parser::QTParser;
using movies::Bytes;

TEST(QTParser, AnswersNothingUntilTheHeadersAreWhole) {
    const auto parser = host::MakeRef<QTParser>();
    ncfUInt64 wide = 42, other = 42;
    ncfUInt32 narrow = 42;
    ncfUInt8 byte = 42;
    ncfBool flag = 42;
    EXPECT_EQ(parser->GetCreationTime(&wide), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(parser->GetTimeScale(&narrow), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(parser->GetMovieDuration(&narrow), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(parser->GetVideoTrackCount(&narrow), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(parser->GetAudioTrackCount(&narrow), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(parser->GetTimeCodeTrackCount(&narrow), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(parser->GetOtherTrackCount(&narrow), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(parser->GetRecomendedReadPosition(&wide, &narrow), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(
        parser->GetTimeCodeInfo(&byte, &byte, &byte, &byte, &narrow, &narrow, &narrow, &narrow),
        NMA_E_NOTINITIALIZED);
    EXPECT_EQ(parser->IsMovieSelfContained(&flag), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(parser->GetMOOVAtom(&wide, &other), NMA_E_NOTINITIALIZED);
    auto* video = reinterpret_cast<IVideoTrackInfo*>(8);
    auto* track = reinterpret_cast<ITrackInfo*>(8);
    EXPECT_EQ(parser->GetVideoTrackInfo(0, &video), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(parser->GetOtherTrackInfo(0, &track), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(video, nullptr);
    EXPECT_EQ(track, nullptr);
    EXPECT_EQ(wide, 42u);
    EXPECT_EQ(narrow, 42u);
    EXPECT_EQ(byte, 42);
    EXPECT_EQ(flag, 42);
}

TEST(QTParser, RefusesNullOutputs) {
    const ParsedMovie parsed(PlainMovie());
    ncfUInt64 wide = 0;
    EXPECT_EQ(parsed->GetCreationTime(nullptr), NCF_E_POINTER);
    EXPECT_EQ(parsed->GetTimeScale(nullptr), NCF_E_POINTER);
    EXPECT_EQ(parsed->GetMovieDuration(nullptr), NCF_E_POINTER);
    EXPECT_EQ(parsed->GetVideoTrackCount(nullptr), NCF_E_POINTER);
    EXPECT_EQ(parsed->GetVideoTrackInfo(0, nullptr), NCF_E_POINTER);
    EXPECT_EQ(parsed->GetAudioTrackInfo(0, nullptr), NCF_E_POINTER);
    EXPECT_EQ(parsed->IsMovieSelfContained(nullptr), NCF_E_POINTER);
    EXPECT_EQ(parsed->GetMOOVAtom(nullptr, &wide), NCF_E_POINTER);
    EXPECT_EQ(parsed->GetMOOVAtom(&wide, nullptr), NCF_E_POINTER);
    EXPECT_EQ(parsed->ParseHeaders(nullptr, nullptr, 0), NCF_E_POINTER);
    const Bytes bytes(4);
    EXPECT_EQ(parsed->ParseHeaders(bytes.data() + 4, bytes.data(), 0), NCF_E_INVALIDARG);
}

TEST(QTParser, FindsNoTrackBeyondTheCount) {
    const ParsedMovie parsed(PlainMovie());
    auto* video = reinterpret_cast<IVideoTrackInfo*>(8);
    auto* sound = reinterpret_cast<IAudioTrackInfo*>(8);
    auto* track = reinterpret_cast<ITrackInfo*>(8);
    EXPECT_EQ(parsed->GetVideoTrackInfo(1, &video), NCF_E_NOTFOUND);
    EXPECT_EQ(parsed->GetVideoTrackInfo(0xFFFFFFFF, &video), NCF_E_NOTFOUND);
    EXPECT_EQ(parsed->GetAudioTrackInfo(0, &sound), NCF_E_NOTFOUND);
    EXPECT_EQ(parsed->GetTimeCodeTrackInfo(0, &track), NCF_E_NOTFOUND);
    EXPECT_EQ(video, nullptr);
    EXPECT_EQ(sound, nullptr);
    EXPECT_EQ(track, nullptr);
}

TEST(QTParser, AsksForTheNextRangeOnlyWhileItWantsOne) {
    movies::Movie movie = PlainMovie();
    movie.filler = 100000;
    const movies::MadeMovie made = movies::Build(movie);
    const auto parser = host::MakeRef<QTParser>();
    Bytes bytes = made.Range(0, 4096);
    ASSERT_EQ(parser->ParseHeaders(bytes.data(), bytes.data() + 4096, 0), QT_E_MOREDATA);
    ncfUInt64 position = 0;
    ncfUInt32 size = 0;
    ASSERT_EQ(parser->GetRecomendedReadPosition(&position, &size), NCF_OK);
    EXPECT_EQ(position, made.headerPosition);
    EXPECT_EQ(size, 4096u);
    EXPECT_EQ(parser->GetRecomendedReadPosition(nullptr, &size), NCF_E_POINTER);
    bytes = made.Range(position, size);
    ASSERT_EQ(parser->ParseHeaders(bytes.data(), bytes.data() + size, position), NCF_OK);
    EXPECT_EQ(parser->GetRecomendedReadPosition(&position, &size), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(parser->ParseHeaders(bytes.data(), bytes.data() + size, position), NCF_OK);
}

TEST(QTParser, KeepsAnsweringWithItsRefusal) {
    const Bytes bytes(4096, 'x');
    const auto parser = host::MakeRef<QTParser>();
    for (int i = 0; i < 2; ++i) {
        EXPECT_EQ(parser->ParseHeaders(bytes.data(), bytes.data() + 4096, 0), NCF_E_NOTSUPPORTED);
    }
    EXPECT_EQ(
        parser->WhyRefused().reason,
        "its first atom would be 'xxxx', and no movie of the QuickTime family begins with that");
}

TEST(QTParser, RefusesAnotherRangeThanItAskedForAlsoForTimecode) {
    movies::Movie movie = PlainMovie();
    movie.tracks.push_back(movies::TimecodeTrack(movies::TimecodeFormat(), 5, 25));
    movie.header = movies::Place::kBeforeMedia;
    movie.inHeader = {movies::Box("free").U8(1)};
    movie.filler = 100000;
    const Bytes bytes = movies::Build(movie).Range(0, 4096);
    const auto parser = host::MakeRef<QTParser>();
    ASSERT_EQ(parser->ParseHeaders(bytes.data(), bytes.data() + 4096, 0), QT_E_MOREDATA);
    EXPECT_EQ(parser->ParseHeaders(bytes.data(), bytes.data() + 4096, 0), NCF_E_INVALIDARG);
}

TEST(QTParser, DoesNotOfferTheColorFlags) {
    const ParsedMovie parsed(PlainMovie());
    void* flags = &flags;
    EXPECT_EQ(parsed->QueryInterface(IID_IQTParserColor, &flags), NCF_E_NOINTERFACE);
    EXPECT_EQ(flags, nullptr);
}

TEST(QTParser, IsMadeByTheHostUnderItsComponentId) {
    host::Host host;
    host.RegisterComponent(NCFCompID_QTParser, header_parser::QTParserMaker());
    host::Ref<IQTParser> parser;
    ASSERT_EQ(host.Create(NCFCompID_QTParser, parser), NCF_OK);
    const Bytes bytes = movies::Build(PlainMovie()).ToBytes();
    EXPECT_EQ(header_parser::ReadHeaders(*parser, bytes.data(), bytes.size()), NCF_OK);
    void* out = nullptr;
    EXPECT_EQ(
        host.factory().CreateComponent(NCFCompID_QTParser, host.unknown(), IID_IQTParser, &out),
        NCF_CLASS_E_NOAGGREGATION);
}

TEST(QTParser, LeavesNoObjectBehind) {
    const std::int64_t before = host::LiveObjectCount();
    {
        movies::Movie movie = PlainMovie();
        movie.tracks.push_back(movies::SoundTrack(movies::SoundFormat(), 4800));
        const ParsedMovie parsed(movie);
        EXPECT_TRUE(parsed.VideoDescription());
        EXPECT_TRUE(parsed.SoundDescription());
        EXPECT_TRUE(parsed.Samples());
        EXPECT_GT(host::LiveObjectCount(), before);
    }
    EXPECT_EQ(host::LiveObjectCount(), before);
}

TEST(QTParser, AnswersReservedOperationsAsNotImplemented) {
    movies::Movie movie = PlainMovie();
    movie.tracks.push_back(movies::SoundTrack(movies::SoundFormat(), 4800));
    const ParsedMovie parsed(movie);
    EXPECT_EQ(parsed->ReservedParser4(), NCF_E_NOTIMPL);
    EXPECT_EQ(parsed->ReservedParser9(), NCF_E_NOTIMPL);
    EXPECT_EQ(parsed.Video()->ReservedTrack3(), NCF_E_NOTIMPL);
    EXPECT_EQ(parsed.Video()->ReservedVideoTrack23(), NCF_E_NOTIMPL);
    EXPECT_EQ(parsed.VideoDescription()->ReservedVideoDescription4(), NCF_E_NOTIMPL);
    EXPECT_EQ(parsed.SoundDescription()->ReservedAudioDescription3(), NCF_E_NOTIMPL);
}

}  // namespace
