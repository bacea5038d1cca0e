// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/components/QuickTimeMasterClips.h"
#include "source/components/QuickTimeMediaFormat.h"
#include "source/components/QuickTimeMediaVolume.h"

#include <algorithm>

#include "reference_host/header_parser/QTParser.h"
#include "source/components/QuickTimeSequences.h"
#include "tests/unit/components/ComponentFixture.h"

namespace {

// A list of another make.
struct ForeignClips : FakeObject<NMA::IAAFClips> {
    ncfSInt32 GetCount() override { return 0; }
    NCFRESULT GetMetadata(ncfSInt32, IAAFFile**) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetClipPath(ncfSInt32, INCFString*) override { return NCF_E_NOTIMPL; }
};

class MediaFormat : public ComponentFixture {
protected:
    NCFSmartPtr<NMA::IMediaFormat> formatFor(const std::filesystem::path& of) {
        NCFSmartPtr<NMA::IMediaFormat> format;
        const auto volume =
            make<NMA::IMediaVolume>(CreateInstanceOf<NMA::Impl::QuickTimeMediaVolume>);
        EXPECT_EQ(volume->GetMediaFormat(path(of).inArg(), format.outArg()), NCF_OK);
        return format;
    }
    std::vector<std::string> pathsOf(NMA::IAAFClips* clips) {
        std::vector<std::string> paths;
        for (ncfSInt32 i = 0; i < clips->GetCount(); ++i) {
            const auto place = text("");
            EXPECT_EQ(clips->GetClipPath(i, place.inArg()), NCF_OK);
            paths.push_back(TextOf(place.inArg()));
        }
        std::sort(paths.begin(), paths.end());
        return paths;
    }
    std::string fullPath(const std::string& name) { return TextOf(path(folder / name).inArg()); }
};

TEST_F(MediaFormat, GivesItsFlags) {
    const auto format = make<NMA::IMediaFormat>(CreateInstanceOf<NMA::Impl::QuickTimeMediaFormat>);
    EXPECT_EQ(format->FormatFlagA(), 1);
    EXPECT_EQ(format->FormatFlagB(), 0);
    EXPECT_EQ(format->FormatFlagC(), 0);
    EXPECT_EQ(format->FormatFlagD(), 1);
    EXPECT_EQ(format->FormatUnsupportedA(nullptr), NCF_E_FAIL);
    EXPECT_EQ(format->FormatUnsupportedB(&host), NCF_E_FAIL);
}

TEST_F(MediaFormat, ListsTheMoviesOfAFolderButHiddenOnes) {
    write("b.mov");
    write("a.mov");
    write(".hidden.mov");
    write("c.mp4");
    std::filesystem::create_directory(folder / "d.mov");
    NCFSmartPtr<NMA::IAAFClips> clips;
    ASSERT_EQ(formatFor(folder)->GetAAFClips(clips.outArg()), NCF_OK);
    EXPECT_EQ(clips->GetCount(), 2);
    EXPECT_EQ(pathsOf(clips.inArg()),
              (std::vector<std::string>{fullPath("a.mov"), fullPath("b.mov")}));
}

TEST_F(MediaFormat, JoinsFolderAndNameWithOneSeparator) {
    write("a.mov");
    NCFSmartPtr<NMA::IAAFClips> clips;
    ASSERT_EQ(formatFor(folder / "")->GetAAFClips(clips.outArg()), NCF_OK);
    EXPECT_EQ(pathsOf(clips.inArg()), std::vector<std::string>{fullPath("a.mov")});
}

TEST_F(MediaFormat, ScansTheEmptyPathWhenNoneWasSet) {
    const auto format = make<NMA::IMediaFormat>(CreateInstanceOf<NMA::Impl::QuickTimeMediaFormat>);
    NCFSmartPtr<NMA::IAAFClips> clips;
    ASSERT_EQ(format->GetAAFClips(clips.outArg()), NCF_OK);
    EXPECT_EQ(clips->GetCount(), 0);
}

TEST_F(MediaFormat, GivesTheRefusalOfTheFactory) {
    host.refuseCreation(NMA::CompID_QuickTimeMasterClips, NCF_E_ACCESSDENIED);
    NCFSmartPtr<NMA::IAAFClips> clips;
    EXPECT_EQ(formatFor(folder)->GetAAFClips(clips.outArg()), NCF_E_ACCESSDENIED);
    EXPECT_TRUE(clips.isNull());
}

TEST_F(MediaFormat, ListOfAnotherMakeIsUnexpectedAndLeftToTheCaller) {
    host.maker(NMA::CompID_QuickTimeMasterClips, [](const GUID&, void** out) {
        *out = static_cast<NMA::IAAFClips*>(new ForeignClips);
        return NCF_OK;
    });
    NCFSmartPtr<NMA::IAAFClips> clips;
    EXPECT_EQ(formatFor(folder)->GetAAFClips(clips.outArg()), NCF_E_UNEXPECTED);
    EXPECT_FALSE(clips.isNull());
}

TEST_F(MediaFormat, NeedsAnOutput) {
    EXPECT_EQ(formatFor(folder)->GetAAFClips(nullptr), NCF_E_POINTER);
}

TEST_F(MediaFormat, NeedsAHost) {
    void* out = nullptr;
    EXPECT_EQ(CreateInstanceOf<NMA::Impl::QuickTimeMediaFormat>(nullptr, nullptr,
                                                                NMA::IID_IMediaFormat, &out),
              NCF_E_POINTER);
}

// --- the list of a folder's movies ----------------------------------------------------

class MasterClips : public MediaFormat {
protected:
    NCFSmartPtr<NMA::IAAFClips> list() {
        write("a.mov");
        NCFSmartPtr<NMA::IAAFClips> clips;
        EXPECT_EQ(formatFor(folder)->GetAAFClips(clips.outArg()), NCF_OK);
        return clips;
    }
};

TEST_F(MasterClips, RefusesPathsOfIndexesOutsideTheList) {
    const auto clips = list();
    const auto place = text("before");
    EXPECT_EQ(clips->GetClipPath(-1, place.inArg()), NCF_E_INVALIDARG);
    EXPECT_EQ(clips->GetClipPath(1, place.inArg()), NCF_E_INVALIDARG);
    EXPECT_EQ(clips->GetClipPath(0, nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(TextOf(place.inArg()), "before");
}

TEST_F(MasterClips, RefusesDescriptionsOfIndexesOutsideTheList) {
    const auto clips = list();
    IAAFFile* file = nullptr;
    EXPECT_EQ(clips->GetMetadata(0, nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(clips->GetMetadata(1, &file), NCF_E_NOTFOUND);
    EXPECT_EQ(clips->GetMetadata(-1, &file), NCF_E_NOTFOUND);
}

TEST_F(MasterClips, GivesTheFailureOfALoadAndLeavesTheOutput) {
    const auto clips = list();
    RecordingLog log(host);
    auto* const before = reinterpret_cast<IAAFFile*>(&host);
    IAAFFile* file = before;
    EXPECT_EQ(clips->GetMetadata(0, &file), NMA_E_NOTINITIALIZED) << "no header parser is there";
    EXPECT_EQ(file, before);
    EXPECT_TRUE(
        log.contains("LoadMedia(_MCList[index].InArg(), _pConsole, _pComponentFactory, media)"));
}

TEST_F(MasterClips, GivesTheCodeOfAFileThatIsGone) {
    host.maker(NCFCompID_QTParser, [](const GUID& iid, void** out) {
        return host::MakeRef<header_parser::QTParser>()->QueryInterface(iid, out);
    });
    const auto clips = list();
    std::filesystem::remove(folder / "a.mov");
    IAAFFile* file = nullptr;
    EXPECT_EQ(clips->GetMetadata(0, &file), NCF_E_HANDLE);
}

TEST_F(MasterClips, NeedsAHostWithAConsole) {
    void* out = nullptr;
    EXPECT_EQ(CreateInstanceOf<NMA::Impl::QuickTimeMasterClips>(nullptr, nullptr,
                                                                NMA::IID_IAAFClips, &out),
              NCF_E_POINTER);
    host.refuseQuery(IID_INCFConsole, NCF_E_NOINTERFACE);
    EXPECT_EQ(CreateInstanceOf<NMA::Impl::QuickTimeMasterClips>(host.unknown(), nullptr,
                                                                NMA::IID_IAAFClips, &out),
              NCF_E_NOINTERFACE);
}

// --- sequences ---------------------------------------------------------------------------

class Sequences : public ComponentFixture {};

TEST_F(Sequences, AreNone) {
    const auto sequences = make<NMA::ISequences>(NMA::Impl::CreateQuickTimeSequences);
    EXPECT_EQ(sequences->GetSequenceCount(), 0);
    EXPECT_EQ(sequences->GetSequence(0, nullptr), NCF_E_NOTIMPL);
    NCFSmartPtr<NMA::IAAFSequences> aafSequences;
    ASSERT_EQ(ncfQuery(sequences.inArg(), aafSequences), NCF_OK);
    EXPECT_EQ(aafSequences->GetAAFSequenceCount(), 0);
    EXPECT_EQ(aafSequences->GetAAFSequence(0, nullptr), NCF_E_NOTIMPL);
}

}  // namespace
