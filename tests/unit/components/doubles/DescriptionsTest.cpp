// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// How container and list go about descriptions: real movies through the host's
// own parser, described by a stand-in.

#include "host_interfaces/aaf/AAFFile.h"
#include "reference_host/header_parser/QTParser.h"
#include "reference_host/movie_writer/Movie.h"
#include "source/components/QuickTimeContainer.h"
#include "source/components/QuickTimeMediaVolume.h"
#include "tests/support/fakes/FakeLock.h"
#include "tests/unit/aaf/support/FakeAAF.h"
#include "tests/unit/components/ComponentFixture.h"
#include "tests/unit/components/doubles/Doubles.h"

namespace {

class Descriptions : public ComponentFixture {
protected:
    Descriptions() {
        descriptionDouble = {};
        volumeDouble = {};
        succeed();
        host.maker(NCFCompID_QTParser, [](const GUID& iid, void** out) {
            return host::MakeRef<header_parser::QTParser>()->QueryInterface(iid, out);
        });
        movies::Movie movie;
        movie.tracks.push_back(movies::VideoTrack(movies::VideoFormat(), 50, 25, 1));
        EXPECT_TRUE(movies::Build(movie).WriteTo((folder / "a.mov").u8string()));
    }

    void succeed() {
        descriptionDouble.describe = [this](IAAFFile** out) {
            *out = made = aaf.newFile();
            return NCF_OK;
        };
    }
    void fail(NCFRESULT result) {
        descriptionDouble.describe = [result](IAAFFile**) { return result; };
    }
    // References of a file beside the one that this takes.
    static ncfUInt32 references(IAAFFile* file) {
        file->AddRef();
        return file->Release();
    }
    NCFSmartPtr<NMA::IMediaContainer3> container(const std::string& name = "a.mov") {
        const auto object =
            make<NMA::IMediaContainer3>(CreateInstanceOf<NMA::Impl::QuickTimeContainer>);
        EXPECT_EQ(object->SetFilePath(path(folder / name).inArg()), NCF_OK);
        return object;
    }
    NCFSmartPtr<NMA::IAAFClips> list() {
        volumeDouble.names = {"a.mov"};
        NCFSmartPtr<NMA::IMediaFormat> format;
        NCFSmartPtr<NMA::IAAFClips> clips;
        const auto volume =
            make<NMA::IMediaVolume>(CreateInstanceOf<NMA::Impl::QuickTimeMediaVolume>);
        EXPECT_EQ(volume->GetMediaFormat(path(folder).inArg(), format.outArg()), NCF_OK);
        EXPECT_EQ(format->GetAAFClips(clips.outArg()), NCF_OK);
        return clips;
    }

    static constexpr char kContainerFunction[] = "NMA::Impl::QuickTimeContainer::GetAAFMasterClips";
    static constexpr char kListFunction[] = "NMA::Impl::QuickTimeMasterClips::GetMetadata";

    FakeAAF aaf;
    IAAFFile* made = nullptr;  // the last file, borrowed
};

// --- of a container ------------------------------------------------------------------

TEST_F(Descriptions, OfAContainerComeFromTheContainerItself) {
    const auto object = container();
    RecordingLog log(host);
    NCFSmartPtr<NMA::IAAFClips> clips;
    ASSERT_EQ(object->GetAAFMasterClips(clips.outArg()), NCF_OK);
    NCFSmartPtr<INCFUnknown> one;
    NCFSmartPtr<INCFUnknown> other;
    ncfQuery(object.inArg(), one);
    ncfQuery(clips.inArg(), other);
    EXPECT_EQ(one, other);
    EXPECT_EQ(descriptionDouble.factory, host.factory());
    EXPECT_EQ(descriptionDouble.console, &host.console());
    EXPECT_TRUE(
        log.once(std::string(kContainerFunction) + "NewAAFFromMovie completed successfully!"));

    IAAFFile* file = nullptr;
    EXPECT_EQ(references(made), 1u) << "the container's";
    ASSERT_EQ(clips->GetMetadata(0, &file), NCF_OK);
    EXPECT_EQ(file, made);
    EXPECT_EQ(references(made), 2u) << "and the caller's";
    file->Release();
}

TEST_F(Descriptions, OfAContainerAreBuiltAgainOverOneClip) {
    const auto object = container();
    EXPECT_EQ(object->IsContainerSupported(), 1);
    NCFSmartPtr<NMA::IAAFClips> clips;
    ASSERT_EQ(object->GetAAFMasterClips(clips.outArg()), NCF_OK);
    IAAFFile* const first = made;
    first->AddRef();
    ASSERT_EQ(object->GetAAFMasterClips(clips.outArg()), NCF_OK);
    EXPECT_NE(made, first);
    EXPECT_EQ(first->Release(), 0u) << "the container let go of the former file";
    EXPECT_EQ(host.creations(NCFCompID_QTParser), 1);
    ASSERT_EQ(descriptionDouble.clips.size(), 2u);
    EXPECT_EQ(descriptionDouble.clips[0].lock(), descriptionDouble.clips[1].lock());
}

TEST_F(Descriptions, OfAContainerThatFailKeepTheFormerOne) {
    const auto object = container();
    NCFSmartPtr<NMA::IAAFClips> clips;
    ASSERT_EQ(object->GetAAFMasterClips(clips.outArg()), NCF_OK);
    fail(NCF_E_ABORT);
    RecordingLog log(host);
    auto* none = reinterpret_cast<NMA::IAAFClips*>(&host);
    EXPECT_EQ(object->GetAAFMasterClips(&none), NCF_E_ABORT);
    EXPECT_EQ(none, nullptr);
    EXPECT_TRUE(
        log.once("NCF_RETURN(0x80000007): NewAAFFromMovie(media_, console_, &aafFile_, "
                 "componentFactory_) : " +
                 std::string(kContainerFunction)));
    IAAFFile* file = nullptr;
    EXPECT_EQ(clips->GetMetadata(0, &file), NCF_OK);
    EXPECT_EQ(file, made);
    file->Release();
}

TEST_F(Descriptions, OfAContainerEndWithIt) {
    NCFSmartPtr<NMA::IAAFClips> clips;
    ASSERT_EQ(container()->GetAAFMasterClips(clips.outArg()), NCF_OK);
    made->AddRef();
    EXPECT_FALSE(descriptionDouble.clips[0].expired()) << "its interface keeps it alive";
    clips = nullptr;
    EXPECT_TRUE(descriptionDouble.clips[0].expired());
    EXPECT_EQ(made->Release(), 0u);
}

TEST_F(Descriptions, OfAContainerNeedAnOutput) {
    EXPECT_EQ(container()->GetAAFMasterClips(nullptr), NCF_E_POINTER);
}

TEST_F(Descriptions, OfAContainerThatThrowAreGivenAsResults) {
    NCFSmartPtr<NMA::IAAFClips> clips;
    descriptionDouble.describe = [](IAAFFile**) -> NCFRESULT { throw NMA_E_FIELDS; };
    EXPECT_EQ(container()->GetAAFMasterClips(clips.outArg()), NMA_E_FIELDS);
    descriptionDouble.describe = [](IAAFFile**) -> NCFRESULT { throw "no result"; };
    EXPECT_EQ(container()->GetAAFMasterClips(clips.outArg()), NCF_E_UNEXPECTED);
}

TEST_F(Descriptions, OfAContainerNeedALoadedClip) {
    write("b.mov", "no movie");
    RecordingLog log(host);
    NCFSmartPtr<NMA::IAAFClips> clips;
    EXPECT_EQ(container("b.mov")->GetAAFMasterClips(clips.outArg()), NMA_E_NOTINITIALIZED);
    EXPECT_TRUE(
        log.once("NCF_RETURN(0xa0000068): LoadMedia(filePath_, console_, "
                 "componentFactory_, media_) : " +
                 std::string(kContainerFunction)));
    EXPECT_TRUE(descriptionDouble.clips.empty());
}

// Inside another object the query goes to that object, which has no clips.
TEST_F(Descriptions, OfAContainerWithoutTheInterfaceGiveTheRefusal) {
    auto* const outer = new FakeLock;
    INCFUnknown* inner = nullptr;
    ASSERT_EQ(CreateInstanceOf<NMA::Impl::QuickTimeContainer>(
                  host.unknown(), outer, IID_INCFUnknown, reinterpret_cast<void**>(&inner)),
              NCF_OK);
    {
        NCFSmartPtr<NMA::IMediaContainer3> object;
        ASSERT_EQ(ncfQuery(inner, object), NCF_OK);
        EXPECT_EQ(object->SetFilePath(path(folder / "a.mov").inArg()), NCF_OK);
        RecordingLog log(host);
        NCFSmartPtr<NMA::IAAFClips> clips;
        EXPECT_EQ(object->GetAAFMasterClips(clips.outArg()), NCF_E_NOINTERFACE);
        EXPECT_TRUE(
            log.once("NCF_RETURN(0x80000004): QueryInterface(NMA::IID_IAAFClips, "
                     "(void**)ppClips) : " +
                     std::string(kContainerFunction)));
    }
    inner->Release();
    outer->Release();
}

// --- of a list -------------------------------------------------------------------------

TEST_F(Descriptions, OfAListAreBuiltAfreshAndGoToTheCaller) {
    const auto clips = list();
    for (int turn = 1; turn <= 2; ++turn) {
        auto* file = reinterpret_cast<IAAFFile*>(&host);
        ASSERT_EQ(clips->GetMetadata(0, &file), NCF_OK);
        EXPECT_EQ(host.creations(NCFCompID_QTParser), turn);
        EXPECT_TRUE(descriptionDouble.clips.back().expired()) << "no clip is kept";
        EXPECT_EQ(file, made);
        EXPECT_EQ(file->Release(), 0u) << "nor a file";
    }
    EXPECT_EQ(descriptionDouble.factory, host.factory());
    EXPECT_EQ(descriptionDouble.console, &host.console());
}

TEST_F(Descriptions, OfAListThatFailGiveNothing) {
    const auto clips = list();
    fail(NCF_E_ABORT);
    RecordingLog log(host);
    auto* file = reinterpret_cast<IAAFFile*>(&host);
    EXPECT_EQ(clips->GetMetadata(0, &file), NCF_E_ABORT);
    EXPECT_EQ(file, nullptr);
    EXPECT_TRUE(
        log.once("NCF_RETURN(0x80000007): NewAAFFromMovie(media, _pConsole, ppData, "
                 "_pComponentFactory) : " +
                 std::string(kListFunction)));
}

TEST_F(Descriptions, OfAListThatThrowAreGivenAsResults) {
    const auto clips = list();
    IAAFFile* file = nullptr;
    descriptionDouble.describe = [](IAAFFile**) -> NCFRESULT { throw NMA_E_FIELDS; };
    EXPECT_EQ(clips->GetMetadata(0, &file), NMA_E_FIELDS);
    descriptionDouble.describe = [](IAAFFile**) -> NCFRESULT { throw "no result"; };
    EXPECT_EQ(clips->GetMetadata(0, &file), NCF_E_UNEXPECTED);
}

}  // namespace
