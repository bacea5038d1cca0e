// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/clips/LoadMedia.h"

#include "tests/unit/clips/OtherClipFixture.h"

namespace {

// A string over one of the host's, which refuses one operation.
class StubbornString : public FakeObject<INCFString> {
public:
    explicit StubbornString(const std::string& text) : text_(HostText(text)) {}

    NCFRESULT toUtf32 = NCF_OK;
    NCFRESULT back = NCF_OK;
    NCFRESULT raw = NCF_OK;
    NCFRESULT search = NCF_OK;
    ncfSInt32 wrongPlace = -1;  // what the search says instead
    std::string Text() const { return TextOf(text_.inArg()); }

    ncfUInt32 GetEncoding() override { return text_->GetEncoding(); }
    ncfUInt32 GetLength() override { return text_->GetLength(); }
    ncfBool IsEmpty() override { return text_->IsEmpty(); }
    NCFRESULT Assign(INCFString*) override { return NCF_E_NOTIMPL; }
    NCFRESULT AssignUTF8(ncfUInt32, const ncfUTF8*, ncfUInt32) override { return NCF_E_NOTIMPL; }
    NCFRESULT AssignUTF16(ncfUInt32, const ncfUTF16*, ncfUInt32) override { return NCF_E_NOTIMPL; }
    NCFRESULT AssignWCHAR(ncfUInt32, const ncfWCHAR*, ncfUInt32) override { return NCF_E_NOTIMPL; }
    NCFRESULT ConvertTo(ncfUInt32 encoding) override {
        const NCFRESULT result = encoding == kNCFUTF32 ? toUtf32 : back;
        return result < 0 ? result : text_->ConvertTo(encoding);
    }
    NCFRESULT ConvertCopy(ncfUInt32, INCFString**) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetRawUTF8(ncfUTF8**) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetRawUTF16(ncfUTF16**) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetRawUTF32(ncfUTF32** out) override {
        return raw < 0 ? raw : text_->GetRawUTF32(out);
    }
    NCFRESULT GetRawWCHAR(ncfWCHAR**) override { return NCF_E_NOTIMPL; }
    NCFRESULT FindCharacter(ncfUTF32 character, ncfSInt32 from, ncfBool forward,
                            ncfSInt32* at) override {
        if (search < 0) {
            *at = 0;  // not to be believed
            return search;
        }
        if (wrongPlace >= 0) {
            *at = wrongPlace;
            return NCF_OK;
        }
        return text_->FindCharacter(character, from, forward, at);
    }
    NCFRESULT FindWCHAR(const ncfWCHAR*, ncfUInt32, ncfUInt32, ncfSInt32*) override {
        return NCF_E_NOTIMPL;
    }

private:
    NCFSmartPtr<INCFString> text_;
};

class SlashesOfAStubbornString : public ClipTest {
protected:
    SlashesOfAStubbornString() { path.attach(string = new StubbornString("/a/b.mov")); }
    NCFRESULT Convert() { return ConvertSlashesInPlace(path); }

    StubbornString* string;
    NCFSmartPtr<INCFString> path;
    ~SlashesOfAStubbornString() override { path = nullptr; }
};

class LoadMediaTest : public OtherClipTest {
protected:
    NCFRESULT Ask(const std::string& path) {
        return LoadMedia(HostText(path), NCFSmartPtr<INCFConsole>(&host->console()),
                         NCFSmartPtr<INCFComponentFactory>(host->factory()), media);
    }
    NCFRESULT IsContainer(const std::string& path) {
        return IsQuickTimeContainer(HostText(path), NCFSmartPtr<INCFConsole>(&host->console()),
                                    &flag);
    }
    NCFRESULT IsContainer(const std::vector<ncfUInt8>& bytes) {
        const TempFile small(bytes, "small.mov");
        return IsContainer(small.path());
    }
    static std::vector<ncfUInt8> Bytes(const std::string& text) {
        return std::vector<ncfUInt8>(text.begin(), text.end());
    }
    ~LoadMediaTest() override { media.reset(); }

    std::tr1::shared_ptr<BaseClip> media;
    ncfBool flag = 7;
};

}  // namespace

// --- LoadMedia ---------------------------------------------------------------------------

TEST_F(LoadMediaTest, GivesALoadedClip) {
    parser->AddVideoTrack(1);
    EXPECT_EQ(Ask(file.path()), NCF_OK);
    ASSERT_TRUE(media);
    EXPECT_TRUE(media->IsLoaded());
    EXPECT_EQ(log->records().front().text, "LoadMediatry QT Container... ");
    EXPECT_EQ(log->records().back().text, "LoadMediasucceeded!");
}

TEST_F(LoadMediaTest, RefusesANullPathAndLeavesTheClip) {
    parser->AddVideoTrack(1);
    ASSERT_EQ(Ask(file.path()), NCF_OK);
    const BaseClip* const former = media.get();
    EXPECT_EQ(LoadMedia(nullptr, NCFSmartPtr<INCFConsole>(&host->console()),
                        NCFSmartPtr<INCFComponentFactory>(host->factory()), media),
              NCF_E_INVALIDARG);
    EXPECT_EQ(media.get(), former);
    EXPECT_TRUE(log->once("CHK_INARG(filePath.inArg())LoadMedia"));
}

TEST_F(LoadMediaTest, TriesTheWrapperWhenTheHeadersAreRefused) {
    parser->script = {{NCF_E_FAIL, 0, 0}};
    wrapper->AddPicture(1);
    EXPECT_EQ(Ask(file.path()), NCF_OK);
    ASSERT_TRUE(media);
    EXPECT_TRUE(media->IsLoaded());
    EXPECT_NE(dynamic_cast<OtherClip*>(media.get()), nullptr);
    EXPECT_EQ(wrapper->openedPath, file.path());
    std::vector<std::string> progress;
    for (const LoggedRecord& record : log->records()) {
        if (record.where == "LoadMedia") {
            progress.push_back(record.text);
        }
    }
    EXPECT_EQ(progress, (std::vector<std::string>{
                            "LoadMediatry QT Container... ", "LoadMediaFAILED!",
                            "LoadMediatry OtherMedia Container... ", "LoadMediasucceeded!"}));
    EXPECT_EQ(host->console().lines().size(), 2u) << "fields and colour";
}

TEST_F(LoadMediaTest, TriesTheWrapperWhenThePictureCannotBeRead) {
    parser->AddVideoTrack(1);
    Picture().results["GetFieldInfo"] = NCF_E_FAIL;
    wrapper->AddPicture(1);
    EXPECT_EQ(Ask(file.path()), NCF_OK);
    EXPECT_NE(dynamic_cast<OtherClip*>(media.get()), nullptr);
}

TEST_F(LoadMediaTest, LeavesTheWrapperAloneWhenTheHeadersDo) {
    parser->AddVideoTrack(1);
    EXPECT_EQ(Ask(file.path()), NCF_OK);
    EXPECT_EQ(host->creations(QTWrapper::CompID_QuickTimeWrapper), 0);
}

TEST_F(LoadMediaTest, KeepsTheClipThatFailedLast) {
    parser->script = {{NCF_E_FAIL, 0, 0}};
    wrapper->results["NewMovieFromFilePath"] = NCF_E_FAIL;
    EXPECT_EQ(Ask(file.path()), NMA_E_NOTINITIALIZED);
    ASSERT_TRUE(media);
    EXPECT_FALSE(media->IsLoaded());
    EXPECT_NE(dynamic_cast<OtherClip*>(media.get()), nullptr);
    EXPECT_EQ(log->records().back().text, "LoadMediaFAILED!");
    EXPECT_EQ(log->count("LoadMediaFAILED!"), 2);
    EXPECT_EQ(log->count("LoadMediasucceeded!"), 0);
}

TEST_F(LoadMediaTest, ReleasesTheClipOfTheFirstRoute) {
    parser->script = {{NCF_E_FAIL, 0, 0}};
    wrapper->AddSound(1);
    EXPECT_EQ(Ask(file.path()), NCF_OK);
    EXPECT_EQ(parser->references(), 1u) << "the test's own";
}

TEST_F(LoadMediaTest, HidesThePreciseFailuresOfBothRoutes) {
    host->refuseCreation(QTWrapper::CompID_QuickTimeWrapper, NCF_E_OUTOFMEMORY);
    parser->script = {{NCF_E_ABORT, 0, 0}};
    EXPECT_EQ(Ask(file.path()), NMA_E_NOTINITIALIZED);
}

TEST_F(LoadMediaTest, TellsTheConsoleOfAMovieWithoutPictureAndSoundOnEachRoute) {
    parser->AddTimecodeTrack(1);
    EXPECT_EQ(Ask(file.path()), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(Console(1, "Movie doesn't contain any video/audio tracks!\n"), 2);
}

TEST_F(LoadMediaTest, NeverTriesTheWrapperOnAFileThatCannotBeOpened) {
    RecordingNMALog lines(1);
    EXPECT_THROW(Ask(NoSuchMovie()), NCFRESULT);
    EXPECT_EQ(host->creations(QTWrapper::CompID_QuickTimeWrapper), 0);
}

TEST_F(LoadMediaTest, LetsTheSecondRouteThrowToo) {
    parser->script = {{NCF_E_FAIL, 0, 0}};
    host->maker(QTWrapper::CompID_QuickTimeWrapper,
                [](const GUID&, void**) -> NCFRESULT { throw NCF_E_ABORT; });
    try {
        Ask(file.path());
        FAIL() << "nothing was thrown";
    } catch (NCFRESULT result) {
        EXPECT_EQ(result, NCF_E_ABORT);
    }
    ASSERT_TRUE(media);
    EXPECT_NE(dynamic_cast<QuickTimeClip*>(media.get()), nullptr) << "the clip that failed last";
    EXPECT_FALSE(media->IsLoaded());
}

TEST_F(LoadMediaTest, LetsAFileThatCannotBeOpenedThrow) {
    RecordingNMALog lines(1);
    try {
        Ask(NoSuchMovie());
        FAIL() << "nothing was thrown";
    } catch (NCFRESULT result) {
        EXPECT_EQ(result, NCF_E_HANDLE);
    }
    EXPECT_TRUE(
        lines.contains("SimpleFileIO error. CreateFileW failed. HRESULT = 0x2, "
                       "public_include/SimpleFileIO("));
}

// --- IsQuickTimeContainer -----------------------------------------------------------------

TEST_F(LoadMediaTest, RecognisesAFileTypeAtom) {
    EXPECT_EQ(IsContainer(Bytes(std::string("\0\0\0\x14", 4) + "ftypqt  no movie at all")), NCF_OK);
    EXPECT_EQ(flag, 1);
}

TEST_F(LoadMediaTest, DoesNotRecogniseClassicMovies) {
    for (const char* type : {"moov", "mdat", "wide", "free", "pytf", "Ftyp"}) {
        EXPECT_EQ(IsContainer(Bytes(std::string("\0\0\0\x14", 4) + type + " and more")), NCF_OK);
        EXPECT_EQ(flag, 0) << type;
    }
}

TEST_F(LoadMediaTest, TakesAShortFileForNoMovie) {
    EXPECT_EQ(IsContainer(Bytes("1234fty")), NCF_OK);
    EXPECT_EQ(flag, 0);
    EXPECT_EQ(IsContainer(Bytes("1234ftyp")), NCF_OK);
    EXPECT_EQ(flag, 1);
}

TEST_F(LoadMediaTest, FailsOnAnEmptyFile) {
    RecordingNMALog lines(1);
    EXPECT_EQ(IsContainer(std::vector<ncfUInt8>()), NCF_E_FAIL);
    EXPECT_EQ(flag, 0);
    EXPECT_TRUE(host->console().lines().empty());
}

TEST_F(LoadMediaTest, RefusesAnEmptyPath) {
    EXPECT_EQ(IsContainer(""), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(flag, 0);
    EXPECT_TRUE(log->once("IsQuickTimeContainerfilePath->IsEmpty() !"));
    EXPECT_EQ(log->records().back().kind, slog::kError);
}

TEST_F(LoadMediaTest, TellsTheConsoleOfAFileThatCannotBeOpened) {
    RecordingNMALog lines(1);
    EXPECT_EQ(IsContainer(NoSuchMovie()), NCF_E_HANDLE);
    EXPECT_EQ(flag, 0);
    EXPECT_EQ(Console(1, "Throw caught in QuickTimeContainer::IsContainerSupported: 80000006\n"),
              1);
    const TestFolder folder;
    EXPECT_EQ(IsContainer(folder.path().u8string()), NCF_E_HANDLE) << "a folder is no file";
}

TEST_F(LoadMediaTest, ChecksTheArgumentsOfTheTestInOrder) {
    NCFSmartPtr<INCFConsole> console(&host->console());
    EXPECT_EQ(IsQuickTimeContainer(nullptr, nullptr, nullptr), NCF_E_POINTER);
    EXPECT_EQ(log->records().back().text, "CHK_PTR(console_.inArg())IsQuickTimeContainer");
    EXPECT_EQ(IsQuickTimeContainer(nullptr, console, nullptr), NCF_E_POINTER);
    EXPECT_EQ(log->records().back().text, "CHK_PTR(filePath.inArg())IsQuickTimeContainer");
    EXPECT_EQ(IsQuickTimeContainer(HostText("x"), console, nullptr), NCF_E_POINTER);
    EXPECT_EQ(log->records().back().text, "CHK_PTR(isQTContainer)IsQuickTimeContainer");
}

// --- ConvertSlashesInPlace -------------------------------------------------------------------

TEST(ConvertSlashesInPlace, TurnsEveryForwardSlash) {
    NCFSmartPtr<INCFString> path = HostText("C:/a\\b/c.mov");
    EXPECT_EQ(ConvertSlashesInPlace(path), NCF_OK);
    EXPECT_EQ(TextOf(path.inArg()), "C:\\a\\b\\c.mov");
    path = HostText("//server//share/");
    EXPECT_EQ(ConvertSlashesInPlace(path), NCF_OK);
    EXPECT_EQ(TextOf(path.inArg()), "\\\\server\\\\share\\");
}

TEST(ConvertSlashesInPlace, KeepsTheEncoding) {
    for (const ncfUInt32 encoding : {kNCFASCII, kNCFUTF8, kNCFUTF16, kNCFUTF32, kNCFWCHAR}) {
        NCFSmartPtr<INCFString> path = HostText("/a/b.mov");
        ASSERT_EQ(path->ConvertTo(encoding), NCF_OK);
        EXPECT_EQ(ConvertSlashesInPlace(path), NCF_OK);
        EXPECT_EQ(path->GetEncoding(), encoding);
        EXPECT_EQ(TextOf(path.inArg()), "\\a\\b.mov");
    }
}

TEST(ConvertSlashesInPlace, CountsCharactersBeyondSixteenBitsAsOne) {
    NCFSmartPtr<INCFString> path = HostText("/\xF0\x9F\x8E\xAC/\xF0\x9F\x8E\xAC\xC3\xA9/c.mov");
    ASSERT_EQ(path->ConvertTo(kNCFUTF16), NCF_OK);
    EXPECT_EQ(ConvertSlashesInPlace(path), NCF_OK);
    EXPECT_EQ(TextOf(path.inArg()), "\\\xF0\x9F\x8E\xAC\\\xF0\x9F\x8E\xAC\xC3\xA9\\c.mov");
}

TEST(ConvertSlashesInPlace, LeavesAPathWithoutSlashes) {
    for (const char* text : {"", "clip.mov", "C:\\clip.mov"}) {
        NCFSmartPtr<INCFString> path = HostText(text);
        EXPECT_EQ(ConvertSlashesInPlace(path), NCF_OK);
        EXPECT_EQ(TextOf(path.inArg()), text);
    }
}

TEST_F(SlashesOfAStubbornString, StaysWhenTheStringCannotBeConverted) {
    string->toUtf32 = NCF_E_FAIL;
    EXPECT_EQ(Convert(), NCF_E_FAIL);
    EXPECT_EQ(string->Text(), "/a/b.mov");
    EXPECT_TRUE(
        log->returned("80000008", "filePath->ConvertTo(kNCFUTF32)", "ConvertSlashesInPlace"));
}

TEST_F(SlashesOfAStubbornString, StaysWhenTheBufferIsRefused) {
    string->raw = NCF_E_ABORT;
    EXPECT_EQ(Convert(), NCF_E_ABORT);
    EXPECT_EQ(string->Text(), "/a/b.mov");
    EXPECT_TRUE(
        log->returned("80000007", "filePath->GetRawUTF32(&rawUTF32Path)", "ConvertSlashesInPlace"));
}

TEST_F(SlashesOfAStubbornString, EndsTheSearchQuietlyWhenItFails) {
    const ncfUInt32 encoding = string->GetEncoding();
    string->search = NCF_E_FAIL;
    EXPECT_EQ(Convert(), NCF_OK);
    EXPECT_EQ(string->Text(), "/a/b.mov");
    EXPECT_EQ(string->GetEncoding(), encoding);
    EXPECT_TRUE(log->records().empty());
}

TEST_F(SlashesOfAStubbornString, TouchesNothingButSlashes) {
    string->wrongPlace = 1;
    EXPECT_EQ(Convert(), NCF_E_FAIL);
    EXPECT_EQ(string->Text(), "/a/b.mov");
    EXPECT_TRUE(
        log->once("NCFASSERT( rawUTF32Path[slashPos] == rightSlash )ConvertSlashesInPlace"));
    // A search that never gets on ends too.
    string->wrongPlace = 0;
    EXPECT_EQ(Convert(), NCF_E_FAIL);
    EXPECT_EQ(string->Text(), "\\a/b.mov");
}

TEST_F(SlashesOfAStubbornString, FailsWhenTheEncodingCannotBeRestored) {
    string->back = NCF_E_OUTOFMEMORY;
    EXPECT_EQ(Convert(), NCF_E_OUTOFMEMORY);
    EXPECT_TRUE(log->returned("80000002", "filePath->ConvertTo(srcType)", "ConvertSlashesInPlace"));
}
