// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Clips over made movies, read with the host's own header parser.

#include "reference_host/framework/ObjectCount.h"
#include "reference_host/header_parser/QTParser.h"
#include "reference_host/movie_writer/Movie.h"
#include "reference_host/util/Ref.h"
#include "reference_host/xml/XmlDocument.h"
#include "source/clips/LoadMedia.h"
#include "tests/support/TestFolder.h"
#include "tests/unit/clips/ClipFixture.h"

namespace {

using namespace movies;

class ClipsOfMovies : public testing::Test {
protected:
    ClipsOfMovies() {
        host = std::make_unique<FakeHost>();
        NMAInitialize(host->factory());
        host->maker(NCFCompID_QTParser, [](const GUID& iid, void** out) {
            return host::MakeRef<header_parser::QTParser>()->QueryInterface(iid, out);
        });
        host->maker(kCLSID_XmlDocument, [](const GUID& iid, void** out) {
            return host::MakeRef<host::XmlDocument>()->QueryInterface(iid, out);
        });
        video = VideoTrack(VideoFormat(), 100, 25, 1);
        sound = SoundTrack(SoundFormat(), 192000);
        timecode = TimecodeTrack(TimecodeFormat(), 90000, 100);
    }
    ~ClipsOfMovies() override {
        clip.reset();
        NMATerminate();
        host.reset();
        EXPECT_EQ(LiveFakes(), 0);
        EXPECT_EQ(host::LiveObjectCount(), objectsBefore);
    }
    NCFRESULT Load(const std::vector<Track>& tracks) {
        movie.tracks = tracks;
        return Load(Build(movie));
    }
    NCFRESULT Load(const MadeMovie& made) {
        EXPECT_TRUE(made.WriteTo(path));
        return LoadPath();
    }
    NCFRESULT Load(const Bytes& bytes) {
        std::ofstream file(path, std::ios::binary | std::ios::trunc);
        file.write(reinterpret_cast<const char*>(bytes.data()),
                   static_cast<std::streamsize>(bytes.size()));
        file.close();
        return LoadPath();
    }
    NCFRESULT LoadPath() {
        return LoadMedia(HostText(path.u8string()), NCFSmartPtr<INCFConsole>(&host->console()),
                         NCFSmartPtr<INCFComponentFactory>(host->factory()), clip);
    }
    Rational Rate() {
        Rational rate;
        EXPECT_EQ(clip->SetEditRate(EditorSettings()), NCF_OK);
        EXPECT_EQ(clip->GetEditRate(&rate), NCF_OK);
        return rate;
    }
    ncfUInt64 Length() {
        ncfUInt64 length = 0;
        EXPECT_EQ(clip->SetMovieLength(EditorSettings()), NCF_OK);
        EXPECT_EQ(clip->GetMovieLength(&length), NCF_OK);
        return length;
    }
    std::vector<ncfUInt8> Content() {
        ByteVector content;
        EXPECT_EQ(clip->GetContentForHash(content), NCF_OK);
        return {content.begin(), content.end()};
    }

    const std::int64_t objectsBefore = host::LiveObjectCount();
    const TestFolder folder;
    const std::filesystem::path path = folder / "movie.mov";
    std::unique_ptr<FakeHost> host;
    Movie movie;
    Track video;
    Track sound;
    Track timecode;
    std::tr1::shared_ptr<BaseClip> clip;
};

}  // namespace

TEST_F(ClipsOfMovies, AreLoadedFromHeadersInFrontAndBehind) {
    for (const Place place : {Place::kBeforeMedia, Place::kBehindMedia}) {
        movie.header = place;
        ASSERT_EQ(Load({video, sound, timecode}), NCF_OK);
        ncfUInt32 count = 0;
        EXPECT_EQ(clip->GetTrackCount(&count), NCF_OK);
        EXPECT_EQ(count, 3u);
        EXPECT_EQ(Rate(), (Rational{25, 1}));
        EXPECT_EQ(Length(), 100u);
        ncfUInt32 width = 0;
        ncfUInt32 height = 0;
        EXPECT_EQ(clip->GetEncodedWidthAndHeight(&width, &height), NCF_OK);
        EXPECT_EQ(width, 1920u);
        EXPECT_EQ(height, 1080u);
    }
}

TEST_F(ClipsOfMovies, AreLoadedFromCompressedHeaders) {
    movie.compressed = true;
    ASSERT_EQ(Load({video}), NCF_OK);
    EXPECT_EQ(Rate(), (Rational{25, 1}));
    EXPECT_EQ(Length(), 100u);
}

TEST_F(ClipsOfMovies, TellColourFieldsAndRatioOfThePicture) {
    VideoFormat format;
    format.codec = "apcn";
    format.width = 720;
    format.height = 576;
    format.fields = std::make_pair(2u, 14u);
    format.nclc = std::array<unsigned, 3>{5, 1, 6};
    format.pixelAspect = std::make_pair(16u, 15u);
    ASSERT_EQ(Load({VideoTrack(format, 100, 25, 1)}), NCF_OK);
    ncfUInt32 value = 0;
    ncfUInt32 denominator = 0;
    EXPECT_EQ(clip->GetColorSpace(&value), NCF_OK);
    EXPECT_EQ(value, ncfUInt32{CS_YCbCr_601});
    EXPECT_EQ(clip->GetTemporalFieldOrder(&value), NCF_OK);
    EXPECT_EQ(value, ncfUInt32{kBottomFieldFirst});
    EXPECT_EQ(clip->GetNMAFrameLayout(&value), NCF_OK);
    EXPECT_EQ(value, 1u);
    EXPECT_EQ(clip->GetImageAspectRatio(&value, &denominator), NCF_OK);
    EXPECT_EQ(value, 4u);
    EXPECT_EQ(denominator, 3u);
    GeometryDetails geometry;
    clip->GetGeometryDetails(&geometry);
    EXPECT_EQ(geometry.source.width, (Rational{1200, 1}));
    EXPECT_EQ(geometry.source.height, (Rational{900, 1}));
}

TEST_F(ClipsOfMovies, TakeColourFromTheUserAtom) {
    VideoFormat format;
    format.colorText =
        "<ColorSpaceDescriptor><Name>Film</Name><TransferCharacteristicUID>"
        "0E170000-0001-0101-060E-2B340401010C</TransferCharacteristicUID></ColorSpaceDescriptor>";
    format.resolutionId = 10950;
    ASSERT_EQ(Load({VideoTrack(format, 100, 25, 1)}), NCF_OK);
    ColorDetails color;
    clip->GetColorDetails(&color);
    EXPECT_TRUE(color.hasVendorMetadata);
    EXPECT_EQ(TextOf(color.name.inArg()), "Film");
    ncfUInt32 id = 0;
    EXPECT_EQ(clip->GetNivoResolution(&id), NCF_OK);
    EXPECT_EQ(id, 10950u);
}

TEST_F(ClipsOfMovies, SwapTheBoundsOfRotatedMovies) {
    video.matrix = kRotated90;
    ASSERT_EQ(Load({video}), NCF_OK);
    GeometryDetails geometry;
    clip->GetGeometryDetails(&geometry);
    EXPECT_EQ(geometry.source.width, (Rational{900, 1}));
    video.matrix = kRotated270;
    ASSERT_EQ(Load({video}), NCF_OK);
    clip->GetGeometryDetails(&geometry);
    EXPECT_EQ(geometry.source.width, (Rational{1600, 1})) << "only one way round counts";
}

TEST_F(ClipsOfMovies, TellSoundAndTimecode) {
    ASSERT_EQ(Load({video, sound, timecode}), NCF_OK);
    ncfUInt32 id = 0;
    ASSERT_EQ(clip->GetAudioTrackQTId(0, id), NCF_OK);
    AudioTrackMetadata info;
    EXPECT_EQ(clip->GetAudioTrackMetadata(id, &info), NCF_OK);
    EXPECT_EQ(info.channelsPerFrame, 2u);
    EXPECT_EQ(info.sampleRate, 48000.0);
    EXPECT_EQ(info.formatID, kFormatLPCM);
    EXPECT_EQ(info.bitsPerChannel, 16u);
    EXPECT_EQ(info.bytesPerPacket, 4u);
    EXPECT_EQ(info.isBigEndian, 0);
    EXPECT_EQ(info.isConstantBitRate, 1);
    ncfUInt64 samples = 0;
    EXPECT_EQ(clip->IsAudioSampleProviderMedia(id, &samples), 1);
    ASSERT_EQ(clip->GetTimecodeTrackQTId(0, id), NCF_OK);
    TimeCodeTrackMetadata tc;
    EXPECT_EQ(clip->GetTimeCodeTrackMetadata(id, &tc), NCF_OK);
    EXPECT_EQ(tc.hours, 1);
    EXPECT_EQ(tc.minutes, 0);
    EXPECT_EQ(tc.numFrames, 25u);
}

TEST_F(ClipsOfMovies, ProvideSoundThatAnEditShortens) {
    sound.edits = {{1200, 0, 1.0}};  // 2 of 4 seconds
    ASSERT_EQ(Load({video, sound}), NCF_OK);
    ncfUInt64 samples = 0;
    EXPECT_EQ(clip->IsAudioSampleProviderMedia(2, &samples), 0);
    EXPECT_EQ(host->console().count(2,
                                    "The audio track length doesn't match corresponding media "
                                    "length."),
              1);
}

TEST_F(ClipsOfMovies, AreNotSelfContainedWithExternalMedia) {
    video.dataReferences[0].selfContained = false;
    ASSERT_EQ(Load({video}), NCF_OK);
    EXPECT_EQ(clip->IsSelfContained(), 0);
    const MadeMovie made = Build(movie);
    EXPECT_EQ(Content(), made.Range(made.headerPosition, made.headerSize));
}

TEST_F(ClipsOfMovies, TakeTheirIdentityFromHeaderAndMiddleChunks) {
    video.data.resize(100000);
    for (std::size_t i = 0; i < video.data.size(); ++i) {
        video.data[i] = static_cast<ncfUInt8>(i % 241);
    }
    ASSERT_EQ(Load({video}), NCF_OK);
    const MadeMovie made = Build(movie);
    // 100 frames of 1000 bytes, ten to a chunk: the middle one is number 5.
    Bytes expected = made.Range(made.headerPosition, made.headerSize);
    expected.insert(expected.end(), video.data.begin() + 50000, video.data.begin() + 60000);
    EXPECT_EQ(Content(), expected);
}

TEST_F(ClipsOfMovies, AreNotMadeOfMoviesWithoutPictureAndSound) {
    EXPECT_EQ(Load({timecode}), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(host->console().count(1, "Movie doesn't contain any video/audio tracks!\n"), 1);
    ASSERT_TRUE(clip);
    EXPECT_FALSE(clip->IsLoaded());
}

TEST_F(ClipsOfMovies, AreNotMadeOfForeignFiles) {
    const RecordingNMALog lines(1);
    for (const std::string& text : {std::string("RIFF....AVI LIST"), std::string(1, '\0'),
                                    std::string(20000, '\0'), std::string(5000, 'x')}) {
        EXPECT_EQ(Load(Bytes(text.begin(), text.end())), NMA_E_NOTINITIALIZED);
    }
}

// A failed clip may be kept and asked: it answers with failures, by code or by
// a thrown one, and never crashes.
TEST_F(ClipsOfMovies, AnswerWithFailuresWhenTheyFailed) {
    EXPECT_EQ(Load(Bytes(5000, 'x')), NMA_E_NOTINITIALIZED);
    ASSERT_TRUE(clip);
    ncfUInt32 number = 0;
    ncfUInt64 wide = 0;
    ByteVector content;
    AudioTrackMetadata info;
    EXPECT_LT(clip->GetVideoTrackCount(&number), 0);
    EXPECT_LT(clip->GetTrackCount(&number), 0);
    EXPECT_LT(clip->GetDataFormat(&number), 0);
    EXPECT_LT(clip->GetContentForHash(content), 0);
    EXPECT_LT(clip->SetEditRate(EditorSettings()), 0);
    EXPECT_LT(clip->SetMovieLength(EditorSettings()), 0);
    EXPECT_LT(clip->GetNumSamples(1, &wide), 0);
    EXPECT_LT(clip->GetAudioTrackMetadata(1, &info), 0);
    EXPECT_LT(clip->GetCreationTime(&wide), 0);
    EXPECT_LT(clip->IsSelfContained(), 0);
}

TEST_F(ClipsOfMovies, SurviveBeingCutAtEveryByteOfTheirHeader) {
    const RecordingNMALog lines(1);
    movie.header = Place::kBeforeMedia;
    movie.tracks = {video, timecode};
    const MadeMovie made = Build(movie);
    const Bytes whole = made.ToBytes();
    const std::size_t end = made.headerPosition + made.headerSize;
    for (std::size_t length = 1; length < end; ++length) {
        const NCFRESULT result =
            Load(Bytes(whole.begin(), whole.begin() + static_cast<std::ptrdiff_t>(length)));
        // The reader shows zeros behind the end, so a header whose last bytes
        // are zero may still be whole.
        EXPECT_TRUE(result == NMA_E_NOTINITIALIZED || result == NCF_OK) << length;
        if (length < made.headerPosition + 200) {
            EXPECT_EQ(result, NMA_E_NOTINITIALIZED) << length;
        }
    }
}

TEST_F(ClipsOfMovies, SurviveTurnedBitsInTheirHeader) {
    const RecordingNMALog lines(1);
    movie.header = Place::kBeforeMedia;
    movie.tracks = {video, sound};
    const MadeMovie made = Build(movie);
    const Bytes whole = made.Range(0, made.headerPosition + made.headerSize + 4096);
    for (std::size_t at = 0; at < made.headerPosition + made.headerSize; at += 3) {
        Bytes broken = whole;
        broken[at] ^= 0xFF;
        const NCFRESULT result = Load(broken);
        EXPECT_TRUE(result == NMA_E_NOTINITIALIZED || result == NCF_OK) << at;
        if (result == NCF_OK) {
            ByteVector content;
            clip->GetContentForHash(content);
            clip->SetEditRate(EditorSettings());
            clip->SetMovieLength(EditorSettings());
            ncfUInt64 samples = 0;
            clip->ObtainAudioTrackLength(2, &samples);
        }
    }
}
