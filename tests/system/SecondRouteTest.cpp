// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Files that the module opens by the movie wrapper: each type that it claims,
// stills, sound alone, movies that the header parser gives up, and what neither
// way opens. Whole movies go both ways, and the two descriptions are compared.

#include <algorithm>
#include <map>
#include <regex>
#include <set>

#include "host_interfaces/header_parser/QTParser.h"
#include "host_interfaces/media/MediaContainer.h"
#include "host_interfaces/media/PluginComponents.h"
#include "host_interfaces/quicktime/QuickTimeWrapper.h"
#include "reference_host/cliphost/AafTree.h"
#include "reference_host/cliphost/Describe.h"
#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/FrameReader.h"
#include "reference_host/cliphost/SoundReader.h"
#include "reference_host/util/text/HostText.h"
#include "tests/system/Facts.h"
#include "tests/system/OtherKinds.h"
#include "tests/system/SystemTest.h"

namespace {

std::filesystem::path TypeFile(const std::string& name) {
    const std::filesystem::path file = std::filesystem::path(CLIPHOST_TYPE_FILES) / name;
    EXPECT_TRUE(std::filesystem::exists(file))
        << file << " is missing: run scripts/make_test_movies.sh " << CLIPHOST_TYPE_FILES
        << " types";
    return file;
}

// Makes the header parser one that can't be created, so all take the second way.
void RefuseTheHeaderParser(cliphost::Session& session) {
    session.host().factory().SetRule([](const host::CreationCall& call) {
        return call.component == NCFCompID_QTParser ? NCF_E_OUTOFMEMORY : NCF_OK;
    });
}

// Whether a movie can't do without the wrapper.
bool CameByTheWrapper(cliphost::Session& session, const std::filesystem::path& file) {
    session.host().factory().SetRule([](const host::CreationCall& call) {
        return call.component == QTWrapper::CompID_QuickTimeWrapper ? NCF_E_OUTOFMEMORY : NCF_OK;
    });
    const auto description = cliphost::DescribeMovie(session, file);
    session.host().factory().SetRule({});
    return description.result == NMA_E_NOTINITIALIZED;
}

// The first picture, and that it is one: not flat.
void ExpectPicture(cliphost::Session& session, const std::filesystem::path& movie, int width,
                   int height) {
    cliphost::Essence essence(session, movie);
    const auto& track = essence.Track(std::nullopt, cliphost::TrackKind::Picture);
    cliphost::FrameReader reader(essence, track, "");
    EXPECT_EQ(reader.width(), width);
    EXPECT_EQ(reader.height(), height);
    ASSERT_EQ(reader.Read(0), NCF_OK);
    const cliphost::Picture picture = reader.ToPicture();
    ASSERT_FALSE(picture.samples.empty());
    const auto [least, most] = std::minmax_element(picture.samples.begin(), picture.samples.end());
    EXPECT_GT(*most - *least, picture.Most() / 2);
}

// A tenth of a second from the first sound track, and that it is not silent.
void ExpectSound(cliphost::Session& session, const std::filesystem::path& movie) {
    cliphost::Essence essence(session, movie);
    const auto& track = essence.Track(std::nullopt, cliphost::TrackKind::Sound);
    cliphost::SoundReader reader(essence, track);
    EXPECT_GT(reader.Count(), 4800u);
    const auto block = reader.Read(2400, 2400);
    EXPECT_FALSE(block.isSilence);
    ASSERT_GE(block.size, 2400u * 3u);
    EXPECT_TRUE(std::any_of(block.bytes, block.bytes + block.size,
                            [](unsigned char byte) { return byte != 0; }));
}

// --- the claimed types -----------------------------------------------------------

enum class Opens { kByHeader, kByWrapper, kNot };

struct ClaimedType {
    const char* extension;
    Opens opens;
    int width;  // 0 for no picture
    int height;
    bool hasSound;
    const char* rateAndLength;
    movies::Bytes (*make)() = nullptr;  // null: FFmpeg made it
};

void PrintTo(const ClaimedType& type, std::ostream* out) {
    *out << type.extension;
}

// Sound is 0.4 seconds long, where its container can say so; that is 10 frames
// of the host's 25, and no part of one counts. Pictures alone are 60 frames.
constexpr ClaimedType kTypes[] = {
    {"MOV", Opens::kByHeader, 64, 48, true, "25/1 x 10"},
    {"MP4", Opens::kByHeader, 64, 48, true, "25/1 x 10"},
    {"M4V", Opens::kByHeader, 64, 48, true, "25/1 x 10"},
    {"MPG", Opens::kByWrapper, 64, 48, true, "25/1 x 10"},
    {"MPE", Opens::kByWrapper, 64, 48, true, "25/1 x 10"},
    {"MPEG", Opens::kByWrapper, 64, 48, true, "25/1 x 10"},
    {"M2T", Opens::kByWrapper, 64, 48, true, "25/1 x 10"},
    {"3GP", Opens::kByHeader, 64, 48, true, "25/1 x 10"},
    {"3G2", Opens::kByHeader, 64, 48, true, "25/1 x 10"},
    {"QT", Opens::kByHeader, 64, 48, true, "25/1 x 10"},
    {"MOOV", Opens::kByHeader, 64, 48, true, "25/1 x 10"},
    {"MOVIE", Opens::kByHeader, 64, 48, true, "25/1 x 10"},
    {"AVI", Opens::kByWrapper, 64, 48, true, "25/1 x 10"},
    {"TXT", Opens::kNot, 0, 0, false, "", Letter},
    {"MP2", Opens::kByWrapper, 0, 0, true, "25/1 x 10"},
    {"MP3", Opens::kByWrapper, 0, 0, true, "25/1 x 10"},
    {"M4A", Opens::kByHeader, 0, 0, true, "25/1 x 10"},
    {"WAV", Opens::kByWrapper, 0, 0, true, "25/1 x 10"},
    {"AIFF", Opens::kByWrapper, 0, 0, true, "25/1 x 10"},
    {"AIF", Opens::kByWrapper, 0, 0, true, "25/1 x 10"},
    {"AU", Opens::kByWrapper, 0, 0, true, "25/1 x 10"},
    {"AAC", Opens::kByWrapper, 0, 0, true, "25/1 x 10"},
    {"MID", Opens::kNot, 0, 0, false, "", MidiSong},
    {"MPA", Opens::kByWrapper, 0, 0, true, "25/1 x 10"},
    {"GIF", Opens::kByWrapper, 64, 48, false, "25/1 x 10"},
    {"JPG", Opens::kByWrapper, 64, 48, false, "25/1 x 60"},
    {"JPEG", Opens::kByWrapper, 64, 48, false, "25/1 x 60"},
    {"JFIF", Opens::kByWrapper, 64, 48, false, "25/1 x 60"},
    {"TIF", Opens::kByWrapper, 64, 48, false, "25/1 x 60"},
    {"TIFF", Opens::kByWrapper, 64, 48, false, "25/1 x 60"},
    {"PNG", Opens::kByWrapper, 64, 48, false, "25/1 x 60"},
    {"BMP", Opens::kByWrapper, 64, 48, false, "25/1 x 60"},
    {"PSD", Opens::kByWrapper, 16, 8, false, "25/1 x 60", PhotoshopPicture},
    {"DV", Opens::kByWrapper, 720, 576, true, "25/1 x 10"},
};

class ClaimedTypes : public SystemTest, public testing::WithParamInterface<ClaimedType> {
protected:
    void SetUp() override {
        options.host.singleFrameDuration = 60;
        options.host.editorFrameRate = 25.0;
        Start();
    }
    std::filesystem::path File() {
        std::string name = std::string("type.") + GetParam().extension;
        std::transform(name.begin(), name.end(), name.begin(), [](char c) {
            return static_cast<char>(std::tolower(static_cast<unsigned char>(c)));
        });
        return GetParam().make ? Write(GetParam().make(), name) : TypeFile(name);
    }
};

TEST_P(ClaimedTypes, AreDescribedAndServed) {
    const ClaimedType& type = GetParam();
    const auto file = File();
    if (type.opens == Opens::kNot) {
        const auto description = cliphost::DescribeMovie(session(), file);
        EXPECT_EQ(description.result, NMA_E_NOTINITIALIZED);
        EXPECT_NE(LineOf(description.problem).find("can't be opened as another kind"),
                  std::string::npos)
            << LineOf(description.problem);
        return;
    }
    const auto description = cliphost::DescribeMovie(session(), file);
    ASSERT_TRUE(description.file) << LineOf(description.problem);
    const auto saved = folder() / "saved.aaf";
    session().aaf().Save(description.file.get(), saved);
    EXPECT_GT(std::filesystem::file_size(saved), 10000u);
    const cliphost::TreeNode tree = cliphost::ReadTree(description.file.get());
    EXPECT_EQ(RateAndLength(tree), type.rateAndLength);
    EXPECT_EQ(Pictures(tree).size(), type.width > 0 ? 1u : 0u);
    EXPECT_EQ(Sounds(tree).empty(), !type.hasSound);
    EXPECT_EQ(Column(tree, "Audio Format").empty(), !type.hasSound);
    if (type.width > 0) {
        ExpectPicture(session(), file, type.width, type.height);
    }
    if (type.hasSound) {
        ExpectSound(session(), file);
    }
}

TEST_P(ClaimedTypes, ComeByTheWayThatTheirKindHas) {
    if (GetParam().opens != Opens::kNot) {
        EXPECT_EQ(CameByTheWrapper(session(), File()), GetParam().opens == Opens::kByWrapper);
    }
}

INSTANTIATE_TEST_SUITE_P(All, ClaimedTypes, testing::ValuesIn(kTypes),
                         [](const auto& test) { return std::string(test.param.extension); });

class SecondRoute : public SystemTest {
protected:
    void SetUp() override {
        options.host.editorFrameRate = 25.0;
        Start();
    }
};

TEST_F(SecondRoute, IsTriedWithEveryTypeThatTheModuleClaims) {
    host::Ref<NMA::IMediaContainer3> container;
    ASSERT_EQ(session().host().Create(NMA::CompID_QuickTimeContainer, container), NCF_OK);
    ASSERT_EQ(container->GetFileTypeCount(), std::size(kTypes));
    for (ncfUInt32 i = 0; i < std::size(kTypes); ++i) {
        host::Ref<INCFString> extension, description, group;
        ASSERT_EQ(container->GetFileType(i, extension.Out(), description.Out(), group.Out()),
                  NCF_OK);
        EXPECT_EQ(host::text::ReadUtf8(extension.get()), kTypes[i].extension);
    }
}

// --- what is special about some ----------------------------------------------------

TEST_F(SecondRoute, GivesStillsTheLengthThatTheHostWants) {
    for (const ncfUInt32 wanted : {1u, 60u, 250u}) {
        options.host.singleFrameDuration = wanted;
        Start();
        EXPECT_EQ(RateAndLength(Describe(TypeFile("type.png"))),
                  "25/1 x " + std::to_string(wanted));
    }
    cliphost::Essence essence(session(), TypeFile("type.png"));
    const auto& track = essence.Track(std::nullopt, cliphost::TrackKind::Picture);
    cliphost::FrameReader reader(essence, track, "");
    EXPECT_EQ(reader.Count(), 1u);
}

TEST_F(SecondRoute, LoadsSoundWithoutPictureProperties) {
    const cliphost::TreeNode tree = Describe(TypeFile("type.wav"));
    EXPECT_EQ(SlotList(tree, kMasterMob), "3 sound, 4 sound");
    EXPECT_TRUE(Pictures(tree).empty());
    EXPECT_TRUE(Column(tree, "Video").empty());
    EXPECT_TRUE(Column(tree, "Image Aspect Ratio").empty());
    EXPECT_EQ(SoundLine(tree),
              "little-endian 2 x 48000/1 Hz 16 bit, 19200 samples, 1536000 a second, block 4");
}

TEST_F(SecondRoute, OpensFragmentedMovies) {
    const auto movie = TypeFile("fragmented.mp4");
    const cliphost::TreeNode tree = Describe(movie);
    EXPECT_EQ(RateAndLength(tree), "25/1 x 10");
    EXPECT_EQ(PictureLine(tree), "provider H.264 stored 64x48 shows 64x48 FullFrame 4/3");
    ExpectPicture(session(), movie, 64, 48);
    ExpectSound(session(), movie);
}

// The header parser gives up a movie whose length takes more than 32 bits; the
// tracks tell theirs.
TEST_F(SecondRoute, OpensMoviesWithAHeaderThatTheParserRefuses) {
    movies::VideoFormat format;
    format.codec = "raw ";
    format.width = 16;
    format.height = 8;
    movies::Track track = movies::VideoTrack(format, 10, 25, 1, 16 * 8 * 3);
    for (int i = 0; i < 10 * 16 * 8 * 3; ++i) {
        track.data.push_back(static_cast<std::uint8_t>(i % 48 * 5));
    }
    track.trackDuration = 240;
    movies::Movie movie;
    movie.tracks.push_back(track);
    movie.headerVersion = 1;
    movie.duration = std::uint64_t{1} << 33;
    const auto file = Write(movie, "long_header.mov");
    EXPECT_EQ(RateAndLength(Describe(file)), "25/1 x 10");
    EXPECT_TRUE(CameByTheWrapper(session(), file));
    ExpectPicture(session(), file, 16, 8);
}

TEST_F(SecondRoute, SaysInALineWhatNeitherWayOpens) {
    const auto description = cliphost::DescribeMovie(session(), Write(Letter(), "letter.avi"));
    EXPECT_EQ(description.result, NMA_E_NOTINITIALIZED);
    const std::string line = LineOf(description.problem);
    EXPECT_EQ(line.find('\n'), std::string::npos) << line;
    EXPECT_NE(line.find("and no movie of the QuickTime family begins with that"), std::string::npos)
        << line;
    EXPECT_EQ(description.problem.code, NMA_E_NOTINITIALIZED);
    EXPECT_EQ(description.problem.route, cliphost::route::kNone);
}

// --- one movie, both ways ----------------------------------------------------------

using Facts = std::map<std::string, std::string>;

// Mobs are named by the content, of which the two ways take different bytes.
std::string WithoutContent(const std::string& value) {
    static const std::regex id("(urn:smpte:umid:[0-9a-f.]{36})[0-9a-f.]{35}");
    return std::regex_replace(value, id, "$1content");
}

// Each fact of a tree under its path, such as "Mobs 0/Slots 1/EditRate".
void Collect(const cliphost::TreeNode& node, const std::string& path, Facts& facts) {
    facts[path] = node.title;
    for (const auto& fact : node.facts) {
        std::string key = path + "/" + fact.name;
        while (facts.count(key) > 0) {
            key += "'";
        }
        facts[key] = WithoutContent(fact.value);
    }
    for (const auto& branch : node.branches) {
        for (std::size_t i = 0; i < branch.nodes.size(); ++i) {
            Collect(branch.nodes[i], path + "/" + branch.name + " " + std::to_string(i), facts);
        }
    }
}

std::set<std::string> Differences(const Facts& first, const Facts& second) {
    std::set<std::string> differences;
    const auto valueIn = [](const Facts& facts, const std::string& key) {
        const auto found = facts.find(key);
        return found == facts.end() ? std::string("-") : found->second;
    };
    for (const Facts* const facts : {&first, &second}) {
        for (const auto& [key, value] : *facts) {
            if (valueIn(first, key) != valueIn(second, key)) {
                differences.insert(key + ": " + valueIn(first, key) + " -> " +
                                   valueIn(second, key));
            }
        }
    }
    return differences;
}

using Allowed = std::set<std::string>;

const std::string kPictureFacts = "/Mobs 1/EssenceDescription 0/FileDescriptors 0/";

// Without `colr` the header says nothing of colour; the wrapper asks the codec.
const Allowed kColourOfTheCodec = {
    kPictureFacts +
        "ColorPrimaries: - -> ColorPrimaries_SMPTE170M {04010101-0301-0000-060E-2B3404010106}",
    kPictureFacts +
        "TransferCharacteristic: - -> TransferCharacteristic_ITU709 "
        "{04010101-0102-0000-060E-2B3404010101}"};

// Without `fiel` the header leaves standard definition to be taken for fields;
// the wrapper asks the codec, which says that it is progressive.
const Allowed kFieldsOfTheCodec = {
    kPictureFacts + "DisplayHeight: 288 -> 576", kPictureFacts + "SampledHeight: 288 -> 576",
    kPictureFacts + "StoredHeight: 288 -> 576",
    kPictureFacts + "FrameLayout: SeparateFields (1) -> FullFrame (0)"};

// One picture lasts as long as the host wants.
const Allowed kLengthOfAStill = {
    "/Mobs 0/Slots 0/Segment 0/Length: 1 -> 60", kPictureFacts + "Length: 1 -> 60",
    "/Mobs 1/Slots 0/Segment 0/Length: 1 -> 60",
    "/Mobs 2/Slots 1/Segment 0/Components 1/Length: 1 -> 60",
    "/Mobs 2/Slots 1/Segment 0/Components 2/Length: 2159999 -> 2159940"};

struct BothWays {
    const char* movie;
    Allowed allowed;
};

void PrintTo(const BothWays& row, std::ostream* out) {
    *out << row.movie;
}

class OneMovieBothWays : public SystemTest, public testing::WithParamInterface<BothWays> {
protected:
    void SetUp() override {
        options.host.singleFrameDuration = 60;
        options.host.editorFrameRate = 25.0;
        Start();
    }
};

TEST_P(OneMovieBothWays, IsDescribedAlike) {
    const auto movie = MadeMovie(GetParam().movie);
    const cliphost::TreeNode header = Describe(movie);
    RefuseTheHeaderParser(session());
    const cliphost::TreeNode wrapper = Describe(movie);
    EXPECT_NE(Fact(Mob(header, kMasterMob), "MobID"), Fact(Mob(wrapper, kMasterMob), "MobID"));
    Facts byHeader, byWrapper;
    Collect(header, "", byHeader);
    Collect(wrapper, "", byWrapper);
    EXPECT_GT(byHeader.size(), 50u);
    EXPECT_EQ(Differences(byHeader, byWrapper), GetParam().allowed);
}

INSTANTIATE_TEST_SUITE_P(
    Movies, OneMovieBothWays,
    testing::Values(BothWays{"prores_hq_1080i.mov", {}}, BothWays{"prores_with_pcm.mov", {}},
                    BothWays{"dv_pal.mov", {}}, BothWays{"v210.mov", {}},
                    BothWays{"h264_bframes.mov", {}}, BothWays{"h264_with_aac.mov", {}},
                    BothWays{"h264_aspect.mov", kFieldsOfTheCodec}, BothWays{"h264_rec709.mov", {}},
                    BothWays{"three_sounds.mov", kColourOfTheCodec}, BothWays{"png_alpha.mov", {}},
                    BothWays{"timecode_2997_drop.mov", kColourOfTheCodec},
                    BothWays{"rotated_90.mov", kColourOfTheCodec},
                    BothWays{"one_picture.mov", kLengthOfAStill}, BothWays{"pcm_s24be.mov", {}},
                    BothWays{"mpeg2.mov", {}}, BothWays{"2vuy_ntsc.mov", {}}),
    [](const auto& test) { return std::filesystem::path(test.param.movie).stem().string(); });

}  // namespace
