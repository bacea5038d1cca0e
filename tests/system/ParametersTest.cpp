// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Parameters of real movies through the built module: what is shown, what
// changes frames and formats, what can be saved and applied, and what is not.

#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <fstream>

#include "host_interfaces/media/MediaContainer.h"
#include "host_interfaces/media/PluginComponents.h"
#include "host_interfaces/media/SampleMapping.h"
#include "reference_host/cliphost/ClipParameters.h"
#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/ParameterFile.h"
#include "reference_host/framework/SampleRequest.h"
#include "tests/system/ParameterDocuments.h"
#include "tests/system/SystemTest.h"

namespace {

using namespace parameter_documents;
using cliphost::ClipParameters;
using cliphost::ParameterXml;
using Numbers = std::vector<ncfUInt32>;

// Interlaced, upper field first, decoded to 8-bit and deeper formats.
constexpr char kInterlaced[] = "prores_4444_1080i.mov";

// A picture format on offer, as much of it as parameters change.
struct Format {
    ncfUInt32 pixels;
    ncfUInt32 order;
    ncfUInt32 layout;
};
bool operator==(const Format& left, const Format& right) {
    return left.pixels == right.pixels && left.order == right.order && left.layout == right.layout;
}
std::ostream& operator<<(std::ostream& out, const Format& format) {
    return out << format.pixels << "/" << format.order << "/" << format.layout;
}

class Parameters : public SystemTest {
protected:
    // A mapping of a movie made by FFmpeg, and its parameters.
    void Open(const std::string& movie) {
        CloseMovie();
        file_ = MadeMovie(movie);
        ASSERT_EQ(session().host().Create(NMA::CompID_QuickTimeContainer, container), NCF_OK);
        const auto path = cliphost::PathForModule(file_);
        ASSERT_EQ(container->SetFilePath(path.get()), NCF_OK);
        parameters.emplace(session(), file_, *container);
        MapAnew();
    }
    // A mapping that has made nothing yet.
    void MapAnew() { ASSERT_EQ(container->GetSampleMapping(mapping.Out()), NCF_OK); }
    void CloseMovie() {
        parameters.reset();
        mapping.Reset();
        container.Reset();
    }
    void TearDown() override {
        CloseMovie();
        SystemTest::TearDown();
    }

    // Values for the very mapping that is asked for formats and frames.
    void HandToMapping(const std::string& xml) {
        host::Ref<INCFParametersXML> own;
        ASSERT_EQ(host::Query(mapping.get(), own), NCF_OK);
        const auto text = host::MakeString(xml);
        EXPECT_EQ(own->SetParameterValuesXML(text.get()), NCF_OK);
    }

    // Order, layout, levels: now, or by default.
    Numbers Now() { return NumbersOf(&cliphost::ClipParameter::value); }
    Numbers Defaults() { return NumbersOf(&cliphost::ClipParameter::defaultValue); }

    std::vector<Format> Formats() {
        std::vector<Format> formats;
        host::Ref<NMA::IUncompressedImageProvider> pictures;
        EXPECT_EQ(host::Query(mapping.get(), pictures), NCF_OK);
        ncfUInt32 count = 0;
        EXPECT_EQ(pictures->GetNumberOfImageFormats(0, &count), NCF_OK);
        for (ncfUInt32 i = 0; i < count; ++i) {
            Format format{};
            ncfUInt32 ignored = 0;
            EXPECT_EQ(pictures->GetImageFormat(0, i, &format.pixels, &ignored, &ignored, &ignored,
                                               &ignored, &format.order, &format.layout, &ignored),
                      NCF_OK);
            formats.push_back(format);
        }
        return formats;
    }
    // The first frame in a format.
    movies::Bytes Frame(ncfUInt32 format) {
        host::Ref<NMA::IUncompressedImageProvider> pictures;
        host::Ref<NMA::ISampleProvider> provider;
        EXPECT_EQ(host::Query(mapping.get(), pictures), NCF_OK);
        EXPECT_EQ(host::Query(mapping.get(), provider), NCF_OK);
        EXPECT_EQ(pictures->SetWorkingImageFormat(0, format), NCF_OK);
        EXPECT_EQ(provider->Setup(0), NCF_OK);
        const auto request = host::MakeRef<host::SampleRequest>();
        request->Ask(0, 0, 1);
        EXPECT_EQ(provider->ProvideSampleRange(request.get(), 0), NCF_OK);
        EXPECT_EQ(provider->Cleanup(0), NCF_OK);
        ncfUInt16 alignment = 0;
        ncfUInt64 size = 0;
        EXPECT_EQ(pictures->GetWorkingImageBufferRequirements(0, &alignment, &size), NCF_OK);
        const auto* const first = request->buffer().bytes();
        return first ? movies::Bytes(first, first + size) : movies::Bytes();
    }
    ncfUInt32 FrameHeight() {
        host::Ref<NMA::IUncompressedImageProvider> pictures;
        EXPECT_EQ(host::Query(mapping.get(), pictures), NCF_OK);
        ncfUInt32 width = 0;
        ncfUInt32 height = 0;
        EXPECT_EQ(pictures->SetWorkingImageFormat(0, 0), NCF_OK);
        EXPECT_EQ(pictures->GetWorkingImageSize(0, &width, &height), NCF_OK);
        return height;
    }
    // The failure's message, empty without one.
    std::string Refusal(const std::string& xml) {
        try {
            parameters->Apply(xml, "given.xml");
        } catch (const cliphost::Failure& failure) {
            EXPECT_EQ(failure.status(), cliphost::kExitCaller);
            return failure.what();
        }
        return {};
    }
    std::filesystem::path WriteText(const std::string& text, const std::string& name) {
        return Write(movies::Bytes(text.begin(), text.end()), name);
    }

    std::filesystem::path file_;
    host::Ref<NMA::IMediaContainer3> container;
    host::Ref<NMA::ISampleMapping> mapping;  // asked for formats and frames
    std::optional<ClipParameters> parameters;

private:
    Numbers NumbersOf(std::optional<ncfUInt32> cliphost::ClipParameter::*which) {
        Numbers numbers;
        for (const cliphost::ClipParameter& parameter : parameters->List()) {
            numbers.push_back((parameter.*which).value_or(0xDEADBEEF));
        }
        return numbers;
    }
};

// --- what is shown ---------------------------------------------------------------------

TEST_F(Parameters, AreThreeWithTheirChoicesAndWhatTheFileSays) {
    Open(kInterlaced);
    const auto list = parameters->List();
    ASSERT_EQ(list.size(), 3u);
    EXPECT_EQ(list[0].info.name, "Field Ordering In File");
    EXPECT_EQ(list[0].info.label, "Field Ordering");
    ASSERT_EQ(list[0].info.choices.size(), 3u);
    EXPECT_EQ(list[0].info.choices[1].text, "Interlaced - Odd (upper field first) ordered");
    EXPECT_EQ(list[0].info.defaultValue, 512u);
    EXPECT_EQ(list[1].info.name, "Field Layout");
    EXPECT_EQ(list[2].info.name, "Level Remapping");
    EXPECT_EQ(list[2].info.label, "GFX-Video Level");
    EXPECT_EQ(Now(), (Numbers{8192, 1, 16}));
    EXPECT_EQ(Defaults(), (Numbers{512, 1, 16}));
    EXPECT_EQ(parameters->SetName(), "Default Settings");
}

TEST_F(Parameters, FollowTheFieldsOfEachMovie) {
    const std::pair<const char*, ncfUInt32> kMovies[] = {
        {"prores_4444_1080i.mov", 512},
        {"prores_4444_486i.mov", 4096},
        {"h264_rec709.mov", 256},
        {"pcm_s16le.mov", 8192},
    };
    for (const auto& [movie, order] : kMovies) {
        Open(movie);
        EXPECT_EQ(Defaults(), (Numbers{order, 1, 16})) << movie;
    }
}

// --- what follows a change --------------------------------------------------------------

TEST_F(Parameters, ChangeTheOrderAndLayoutOfTheFormats) {
    Open(kInterlaced);
    const std::vector<Format> before = Formats();
    ASSERT_FALSE(before.empty());
    for (const Format& format : before) {
        EXPECT_EQ(format.order, 512u);
        EXPECT_EQ(format.layout, 256u);
    }
    const struct {
        std::vector<std::string> assignments;
        ncfUInt32 order;
        ncfUInt32 layout;
    } kChanges[] = {
        {{"Field Ordering=Progressive"}, 256, 256},
        {{"Field Ordering In File=Interlaced - Even (lower field first) ordered"}, 4096, 256},
        {{"Field Layout=Split"}, 512, 512},
        {{"Field Layout=Split", "Field Ordering=4096"}, 4096, 512},
        {{"Field Layout=Merged", "Field Ordering=512"}, 512, 256},
        {{"Field Layout=split", "field ordering=progressive"}, 256, 256},
    };
    for (const auto& change : kChanges) {
        SCOPED_TRACE(change.assignments[0]);
        Open(kInterlaced);
        parameters->Assign(change.assignments);
        const std::vector<Format> formats = Formats();
        ASSERT_EQ(formats.size(), before.size());
        for (std::size_t i = 0; i < formats.size(); ++i) {
            EXPECT_EQ(formats[i], (Format{before[i].pixels, change.order, change.layout}));
        }
    }
}

TEST_F(Parameters, ChangeTheOrderAndLayoutOfProgressiveMovies) {
    for (const char* const movie : {"h264_rec709.mov", CLIPHOST_TYPE_FILES "/fragmented.mp4"}) {
        const struct {
            std::vector<std::string> assignments;
            ncfUInt32 order;
            ncfUInt32 layout;
        } kChanges[] = {
            {{}, 256, 256},
            {{"Field Ordering=512"}, 512, 256},
            {{"Field Ordering=4096", "Field Layout=Split"}, 4096, 512},
            {{"Field Ordering=Progressive", "Field Layout=Split"}, 256, 256},
            {{"Field Layout=Split"}, 256, 512},
        };
        for (const auto& change : kChanges) {
            SCOPED_TRACE(movie + std::string(" ") +
                         (change.assignments.empty() ? "as it is" : change.assignments[0]));
            Open(movie);
            parameters->Assign(change.assignments);
            const std::vector<Format> formats = Formats();
            ASSERT_FALSE(formats.empty());
            for (const Format& format : formats) {
                EXPECT_EQ(format, (Format{format.pixels, change.order, change.layout}));
            }
        }
    }
}

TEST_F(Parameters, ChangeTheHeightOfWhatIsDelivered) {
    Open(kInterlaced);
    const ncfUInt32 field = FrameHeight();
    Open(kInterlaced);
    parameters->Assign({"Field Ordering=Progressive"});
    EXPECT_EQ(FrameHeight(), 2 * field);
}

// A mapping works its formats out before the clip works out its fields: what it
// has made stays, and what comes of the new fields is added a change later.
TEST_F(Parameters, OfAMappingThatHasFormatsAddFormatsOneChangeLater) {
    Open(kInterlaced);
    const std::vector<Format> before = Formats();
    ASSERT_FALSE(before.empty());
    EXPECT_EQ(before.back().order, 512u);
    const std::string progressive =
        DocumentXml(std::string("<parameterSet id='") + kSet +
                    "'><parameter id='6CAEDE80-2DE0-4E2F-9F5D-904B7A2C2F4A'>"
                    "<valueUInt32>256</valueUInt32></parameter></parameterSet>");
    HandToMapping(progressive);
    EXPECT_EQ(Formats(), before);
    HandToMapping(progressive);
    const std::vector<Format> after = Formats();
    ASSERT_EQ(after.size(), 2 * before.size());
    EXPECT_TRUE(std::equal(before.begin(), before.end(), after.begin()))
        << "what was handed out stays where it was";
    EXPECT_EQ(after.back().order, 256u);
    HandToMapping(progressive);
    EXPECT_EQ(Formats(), after) << "nothing new a third time";
}

TEST_F(Parameters, ExpandAndCompressTheLevelsOfFrames) {
    for (const char* const movie : {"png.mov", "h264_rec709.mov"}) {
        SCOPED_TRACE(movie);
        // 7 is no choice: the picture comes through the same format, and no
        // level is touched.
        Open(movie);
        parameters->Assign({"Level Remapping=7"});
        ASSERT_EQ(Formats().at(0).pixels, 8u);
        const movies::Bytes plain = Frame(0);
        ASSERT_FALSE(plain.empty());
        Open(movie);
        parameters->Assign({"Level Remapping=Expand video levels to graphic levels"});
        const movies::Bytes expanded = Frame(0);
        Open(movie);
        parameters->Assign({"GFX-Video Level=compress"});
        const movies::Bytes compressed = Frame(0);
        ASSERT_EQ(expanded.size(), plain.size());
        ASSERT_EQ(compressed.size(), plain.size());
        int wrong = 0;
        int changed = 0;
        for (std::size_t i = 0; i < plain.size(); ++i) {
            if (i % 4 == 3) {
                wrong += plain[i] != 255 || expanded[i] != 255 || compressed[i] != 255;
                continue;
            }
            const double x = plain[i];
            const auto up = static_cast<int>(
                std::min(255.0, std::max(0.0, std::floor((x - 16) * 255 / 219 + 0.5))));
            const auto down = static_cast<int>(std::floor(x * 219 / 255 + 0.5)) + 16;
            wrong += expanded[i] != up || compressed[i] != down;
            changed += expanded[i] != plain[i];
        }
        EXPECT_EQ(wrong, 0);
        EXPECT_GT(changed, 0) << "a movie without any level to change proves nothing";
    }
}

TEST_F(Parameters, LevelsReachAMappingThatServesAlready) {
    Open("h264_rec709.mov");
    const std::vector<Format> before = Formats();
    ASSERT_EQ(before.size(), 1u);
    EXPECT_EQ(before[0].pixels, 2u);
    const movies::Bytes untouched = Frame(0);
    HandToMapping(DocumentXml(SetXml(kSet, "", 1)));
    const std::vector<Format> after = Formats();
    ASSERT_EQ(after.size(), 2u);
    EXPECT_EQ(after[1].pixels, 8u) << "the tables work on this one";
    EXPECT_EQ(Frame(0), untouched) << "and not on that";
    EXPECT_FALSE(Frame(1).empty());
}

// --- back, saved, and applied --------------------------------------------------------------

TEST_F(Parameters, GoBackToWhatTheFileSays) {
    Open(kInterlaced);
    parameters->Assign({"Field Ordering=4096", "Field Layout=Split", "Level Remapping=2"});
    EXPECT_EQ(Now(), (Numbers{4096, 3, 2}));
    EXPECT_EQ(parameters->SetName(), "Custom");
    parameters->Reset();
    EXPECT_EQ(Now(), (Numbers{512, 1, 16}));
    EXPECT_EQ(parameters->SetName(), "Default Settings");
    EXPECT_EQ(parameters->List()[0].info.defaultValue, 512u) << "the order is detected again";
    EXPECT_EQ(Formats().front().order, 512u);
    EXPECT_EQ(Formats().front().layout, 256u);
}

TEST_F(Parameters, AreSavedAndAppliedToAFreshMapping) {
    Open(kInterlaced);
    parameters->Assign({"Field Ordering=4096", "Level Remapping=Compress"});
    const std::string saved = parameters->Xml(ParameterXml::kValues);
    const std::filesystem::path file = WriteText(saved, "saved.xml");
    CloseMovie();
    Start();
    Open("prores_4444_576i.mov");
    EXPECT_EQ(Now(), (Numbers{8192, 1, 16}));
    parameters->Apply(cliphost::ReadParameterFile(file), file);
    EXPECT_EQ(Now(), (Numbers{4096, 1, 2}));
    EXPECT_EQ(parameters->SetName(), "Custom");
    EXPECT_EQ(parameters->Xml(ParameterXml::kValues), saved) << "nothing is lost on the way";
    EXPECT_EQ(Formats().front().order, 4096u);
}

TEST_F(Parameters, OfASoundMovieAreKeptThoughNothingFollows) {
    Open("pcm_s16le.mov");
    parameters->Assign({"Level Remapping=Expand", "Field Layout=Split"});
    EXPECT_EQ(Now(), (Numbers{8192, 3, 1}));
}

// --- documents that others wrote ---------------------------------------------------------

TEST_F(Parameters, AreTakenFromTheSetInUseAlone) {
    Open(kInterlaced);
    const std::string sets = SetXml(kSet, "", 1) + SetXml(kOtherSet, "", 2, "Other");
    EXPECT_EQ(Refusal(DocumentXml(sets)), "");
    EXPECT_EQ(Now()[2], 16u) << "none of two sets is in use";
    EXPECT_EQ(parameters->SetName(), "Default Settings");
    EXPECT_EQ(Refusal(DocumentXml(InUse(kOtherSet) + sets)), "");
    EXPECT_EQ(Now()[2], 2u);
    EXPECT_EQ(parameters->SetName(), "Other");
    EXPECT_EQ(Refusal(DocumentXml(InUse(kSet) + sets)), "");
    EXPECT_EQ(Now()[2], 1u);
    EXPECT_EQ(parameters->SetName(), "Mine");
}

TEST_F(Parameters, OfAReadOnlySetGiveTheirNameAndNoValue) {
    Open(kInterlaced);
    EXPECT_EQ(Refusal(DocumentXml(SetXml(kSet, "readOnly='true'", 1))), "");
    EXPECT_EQ(Now()[2], 16u);
    EXPECT_EQ(parameters->SetName(), "Mine");
}

// The module gives no document of values for such a set.
TEST_F(Parameters, OfASetWhoseIdentifierIsZeroAreShownAndReset) {
    constexpr char kZero[] = "00000000-0000-0000-0000-000000000000";
    Open(kInterlaced);
    EXPECT_EQ(Refusal(DocumentXml(SetXml(kZero, "", 1))), "");
    EXPECT_THROW(parameters->Xml(ParameterXml::kValues), cliphost::Failure);
    EXPECT_EQ(Now()[2], 1u);
    EXPECT_EQ(parameters->SetName(), "Mine");
    parameters->Reset();
    EXPECT_EQ(Now(), (Numbers{512, 1, 16}));
    EXPECT_EQ(parameters->SetName(), "Default Settings");
    EXPECT_EQ(Formats().front().order, 512u);
}

TEST_F(Parameters, OfOtherComponentsAndUnknownOnesChangeNothing) {
    Open(kInterlaced);
    EXPECT_EQ(Refusal(DocumentXml(SetXml(kSet, "", 1), kSet)), "");
    EXPECT_EQ(Now(), (Numbers{8192, 1, 16}));
    EXPECT_EQ(Refusal(DocumentXml(
                  std::string("<parameterSet id='") + kSet + "'><parameter id='" + kOtherSet +
                  "'><valueUInt32>1</valueUInt32></parameter><parameter id='" + kSet +
                  "'><valueDouble>0.5</valueDouble></parameter></parameterSet>")),
              "");
    EXPECT_EQ(Now(), (Numbers{8192, 1, 16}));
    EXPECT_EQ(Refusal("<ncfComponents/>"), "");
    EXPECT_EQ(Now(), (Numbers{8192, 1, 16}));
}

TEST_F(Parameters, OfHostileDocumentsChangeNothing) {
    Open(kInterlaced);
    const auto repeated = [](const std::string& text, int times) {
        std::string all;
        for (int i = 0; i < times; ++i) {
            all += text;
        }
        return all;
    };
    std::string bomb = "<!DOCTYPE ncfComponents [<!ENTITY a 'ha'>";
    for (char c = 'b'; c <= 'z'; ++c) {
        bomb += std::string("<!ENTITY ") + c + " '" +
                repeated(std::string("&") + static_cast<char>(c - 1) + ";", 10) + "'>";
    }
    const std::string good = SetXml(kSet, "", 1);
    const std::pair<std::string, const char*> kDocuments[] = {
        {"", "no element found"},
        {"no XML at all", "syntax error"},
        {DocumentXml(good).substr(0, 300), "unclosed token"},
        {bomb + "]>" + DocumentXml(good + "<x>&z;</x>"), "document type declaration"},
        {DocumentXml(repeated("<track>", 5000) + repeated("</track>", 5000) + good), "levels"},
        {DocumentXml(good + "<x>" + std::string(4 << 20, 'x') + "</x>"), "too large"},
        {DocumentXml(SetXml(kSet, "", 1, std::string(100000, 'n').c_str())), "too long"},
        {DocumentXml(good + SetXml("not-an-id", "", 1)), "no identifier"},
        {DocumentXml(good + "<parameterSet/>"), "has no id"},
        {"<html>" + good + "</html>", "ncfComponents"},
        {DocumentXml(good + "<\xFF\xFE/>"), "not well-formed"},
    };
    for (const auto& [xml, words] : kDocuments) {
        const std::string refusal = Refusal(xml);
        EXPECT_NE(refusal.find(words), std::string::npos)
            << refusal << "\n  for " << xml.substr(0, 80);
        EXPECT_EQ(refusal.find("given.xml: the module refuses it: "), 0u) << refusal;
        EXPECT_LT(refusal.size(), 700u);
        EXPECT_EQ(Now(), (Numbers{8192, 1, 16})) << xml.substr(0, 80);
    }
    EXPECT_EQ(parameters->SetName(), "Default Settings");
    EXPECT_EQ(Refusal(DocumentXml(good)), "") << "the clip works on";
    EXPECT_EQ(Now()[2], 1u);
}

// --- files -----------------------------------------------------------------------------------

std::string Wide(const std::string& text, bool big) {
    std::string bytes = big ? "\xFE\xFF" : "\xFF\xFE";
    for (const char c : text) {
        bytes += big ? std::string({'\0', c}) : std::string({c, '\0'});
    }
    return bytes;
}

TEST_F(Parameters, ComeFromFilesInUtf8AndUtf16) {
    const std::string xml = DocumentXml(SetXml(kSet, "", 1));
    const std::string claims = "<?xml version='1.0' encoding='UTF-8'?>" + xml;
    for (const std::string& bytes :
         {xml, "\xEF\xBB\xBF" + xml, Wide(xml, false), Wide(xml, true)}) {
        EXPECT_EQ(cliphost::ReadParameterFile(WriteText(bytes, "a.xml")), xml);
    }
    EXPECT_EQ(cliphost::ReadParameterFile(WriteText(claims, "a.xml")), claims);
    // What the bytes are is known; what the text claims doesn't count then.
    EXPECT_EQ(cliphost::ReadParameterFile(WriteText(Wide(claims, true), "a.xml")), claims);
}

TEST_F(Parameters, OfFilesInOtherEncodingsAreRefused) {
    const std::string xml = DocumentXml(SetXml(kSet, "", 1));
    const std::string lone = Wide(xml, false) + std::string("\x00\xD8", 2);
    const std::string carried = Wide(xml, false) + std::string("\x80\xDC", 2);
    const std::pair<std::string, const char*> kFiles[] = {
        {"<?xml version='1.0' encoding='ISO-8859-1'?>" + xml, "iso-8859-1; save it as UTF-8"},
        {"<?xml version=\"1.0\" encoding=\"UTF-16\"?>" + xml, "utf-16; save it as UTF-8"},
        {Wide(xml, false) + "x", "UTF-16"},
        {lone, "UTF-16"},
        {carried, "UTF-16"},
        {std::string(3 << 20, ' '), "too large"},
    };
    for (const auto& [bytes, words] : kFiles) {
        const auto file = WriteText(bytes, "a.xml");
        try {
            cliphost::ReadParameterFile(file);
            ADD_FAILURE() << words;
        } catch (const cliphost::Failure& failure) {
            EXPECT_EQ(failure.status(), cliphost::kExitCaller);
            EXPECT_NE(std::string(failure.what()).find(words), std::string::npos) << failure.what();
            EXPECT_NE(std::string(failure.what()).find("a.xml"), std::string::npos);
        }
    }
    EXPECT_THROW(cliphost::ReadParameterFile(folder() / "missing.xml"), cliphost::Failure);
    EXPECT_THROW(cliphost::ReadParameterFile(folder()), cliphost::Failure);
    EXPECT_THROW(cliphost::ReadParameterFile("/dev/zero"), cliphost::Failure);
}

}  // namespace
