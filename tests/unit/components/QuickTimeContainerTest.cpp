// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/components/QuickTimeContainer.h"
#include "source/essence/QuickTimeSampleMapping.h"

#include "host_interfaces/aaf/AAFFile.h"
#include "host_interfaces/aaf/AAFMasterMobs.h"
#include "host_interfaces/aaf/AAFMobSlots.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "reference_host/header_parser/QTParser.h"
#include "reference_host/movie_writer/Movie.h"
#include "tests/support/fakes/FakeLock.h"
#include "tests/support/fakes/StubSampleMapping.h"
#include "tests/unit/components/ComponentFixture.h"

namespace {

class FakeCapability : public FakeObject<INCFCapability> {
public:
    explicit FakeCapability(ncfUInt32 value) : value_(value) {}
    NCFRESULT GetValue(ncfUInt32* value) override {
        *value += value_;
        return NCF_E_FAIL;  // the result is nobody's business
    }

private:
    ncfUInt32 value_;
};

// A container that the host's own header parser serves.
class Container : public ComponentFixture {
protected:
    Container() {
        host.maker(NCFCompID_QTParser, [](const GUID& iid, void** out) {
            return host::MakeRef<header_parser::QTParser>()->QueryInterface(iid, out);
        });
    }
    NCFSmartPtr<NMA::IMediaContainer3> container() {
        return make<NMA::IMediaContainer3>(CreateInstanceOf<NMA::Impl::QuickTimeContainer>);
    }
    void useCapability(ncfUInt32 value) {
        host.maker(CompID_Capability, [value](const GUID&, void** out) {
            *out = static_cast<INCFCapability*>(new FakeCapability(value));
            return NCF_OK;
        });
    }
    void serveMappings() {
        serve(NMA::CompID_QuickTimeSampleMapping,
              CreateInstanceOf<NMA::Impl::QuickTimeSampleMapping>);
        host.maker(CompID_LockComponent, [](const GUID&, void** out) {
            *out = static_cast<INCFLock*>(new FakeLock);
            return NCF_OK;
        });
    }
    std::filesystem::path writeMovie() {
        movies::Movie movie;
        movie.tracks.push_back(movies::VideoTrack(movies::VideoFormat(), 50, 25, 1));
        const std::filesystem::path file = folder / "a.mov";
        EXPECT_TRUE(movies::Build(movie).WriteTo(file));
        return file;
    }
};

TEST_F(Container, AnswersToItsThreeGenerationsThroughOneTable) {
    const auto newest = container();
    NCFSmartPtr<NMA::IMediaContainer> first;
    NCFSmartPtr<NMA::IMediaContainer2> second;
    NCFSmartPtr<NMA::IAAFClips> clips;
    ASSERT_EQ(ncfQuery(newest.inArg(), first), NCF_OK);
    ASSERT_EQ(ncfQuery(newest.inArg(), second), NCF_OK);
    ASSERT_EQ(ncfQuery(newest.inArg(), clips), NCF_OK);
    EXPECT_EQ(first.inArg(), static_cast<NMA::IMediaContainer*>(newest.inArg()));
    EXPECT_EQ(second.inArg(), static_cast<NMA::IMediaContainer2*>(newest.inArg()));
    NCFSmartPtr<NMA::IMediaVolume> volume;
    EXPECT_EQ(ncfQuery(newest.inArg(), volume), NCF_E_NOINTERFACE);
}

TEST_F(Container, GivesItsFlagAndRefusesWhatItDoesNotDo) {
    const auto object = container();
    EXPECT_EQ(object->ContainerFlag(), 1);
    EXPECT_EQ(object->ContainerUnsupportedA(nullptr, nullptr, nullptr), NCF_E_NOTIMPL);
    EXPECT_EQ(object->ContainerUnsupportedB(nullptr), NCF_E_NOTIMPL);
    NCFSmartPtr<NMA::IAAFClips> clips;
    ncfQuery(object.inArg(), clips);
    EXPECT_EQ(clips->GetCount(), 1);
    EXPECT_EQ(clips->GetClipPath(0, nullptr), NCF_E_NOTIMPL);
}

TEST_F(Container, NeedsHostFactoryAndConsoleButNoSettings) {
    void* out = nullptr;
    const auto create = [&](INCFUnknown* unknown) {
        return CreateInstanceOf<NMA::Impl::QuickTimeContainer>(unknown, nullptr,
                                                               NMA::IID_IMediaContainer3, &out);
    };
    EXPECT_EQ(create(nullptr), NCF_E_POINTER);
    host.refuseQuery(IID_INCFConsole, NCF_E_NOINTERFACE);
    EXPECT_EQ(create(host.unknown()), NCF_E_NOINTERFACE);
    host.clearRefusals();
    host.refuseQuery(IID_INCFComponentFactory, NCF_E_ACCESSDENIED);
    EXPECT_EQ(create(host.unknown()), NCF_E_ACCESSDENIED);
    host.clearRefusals();
    host.refuseCreation(CompID_Capability, NCF_E_FAIL);
    EXPECT_EQ(create(host.unknown()), NCF_OK);
    static_cast<NMA::IMediaContainer3*>(out)->Release();
}

// --- capabilities and file types -----------------------------------------------------

TEST_F(Container, TellsItsCapabilitiesByTheHostsPreference) {
    ncfUInt32 flags = 0;
    EXPECT_EQ(container()->GetCapabilities(nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(container()->GetCapabilities(&flags), NCF_OK);
    EXPECT_EQ(flags, 16387u + 256u) << "without the component";
    useCapability(0);
    EXPECT_EQ(container()->GetCapabilities(&flags), NCF_OK);
    EXPECT_EQ(flags, 16387u + 256u);
    useCapability(5);
    EXPECT_EQ(container()->GetCapabilities(&flags), NCF_OK);
    EXPECT_EQ(flags, 16387u + 512u) << "the value starts from 0";
}

TEST_F(Container, ListsItsFileTypes) {
    const char* const extensions[] = {
        "MOV", "MP4", "M4V",  "MPG",  "MPE", "MPEG", "M2T",  "3GP", "3G2", "QT",  "MOOV", "MOVIE",
        "AVI", "TXT", "MP2",  "MP3",  "M4A", "WAV",  "AIFF", "AIF", "AU",  "AAC", "MID",  "MPA",
        "GIF", "JPG", "JPEG", "JFIF", "TIF", "TIFF", "PNG",  "BMP", "PSD", "DV"};
    const auto object = container();
    ASSERT_EQ(object->GetFileTypeCount(), std::size(extensions));
    for (ncfUInt32 i = 0; i < std::size(extensions); ++i) {
        NCFSmartPtr<INCFString> extension, description, group;
        ASSERT_EQ(object->GetFileType(i, extension.outArg(), description.outArg(), group.outArg()),
                  NCF_OK);
        EXPECT_EQ(TextOf(extension.inArg()), extensions[i]);
        EXPECT_EQ(TextOf(description.inArg()), std::string(extensions[i]) + " Files");
        EXPECT_EQ(TextOf(group.inArg()), "QuickTime Media Files");
    }
    EXPECT_EQ(object->GetFileType(0, nullptr, nullptr, nullptr), NCF_OK);
    EXPECT_EQ(object->GetFileType(34, nullptr, nullptr, nullptr), NCF_E_NOTFOUND);
}

TEST_F(Container, HandsOutAllTextsOfAFileTypeOrNone) {
    for (int nth = 1; nth <= 3; ++nth) {
        const auto object = container();
        host.refuseCreation(NCFCompID_NCFString, NCF_E_OUTOFMEMORY, nth);
        auto* const poison = reinterpret_cast<INCFString*>(&host);
        INCFString* texts[] = {poison, poison, poison};
        EXPECT_EQ(object->GetFileType(0, &texts[0], &texts[1], &texts[2]), NCF_E_OUTOFMEMORY);
        for (INCFString* const text : texts) {
            EXPECT_EQ(text, nullptr) << nth;
        }
        host.clearRefusals();
    }
}

// --- path ---------------------------------------------------------------------------

TEST_F(Container, TakesAPathOnceAndLeavesTheCallersStringAlone) {
    const auto object = container();
    const auto given = text("C:/a\\b/c.mov");
    RecordingNMALog log;
    EXPECT_EQ(object->SetFilePath(given.inArg()), NCF_OK);
    EXPECT_EQ(TextOf(given.inArg()), "C:/a\\b/c.mov");
    ASSERT_EQ(log.lines().size(), 1u);
    EXPECT_EQ(log.lines()[0].level, 8u);
    EXPECT_EQ(log.lines()[0].text, "Container File Path = C:\\a\\b\\c.mov");
    EXPECT_EQ(object->SetFilePath(given.inArg()), NMA_E_ALREADYSET);
}

TEST_F(Container, TakesAnotherPathAfterAnEmptyOne) {
    const auto object = container();
    EXPECT_EQ(object->SetFilePath(text("").inArg()), NCF_OK);
    EXPECT_EQ(object->SetFilePath(text("a.mov").inArg()), NCF_OK);
}

TEST_F(Container, RefusesANullPath) {
    EXPECT_EQ(container()->SetFilePath(nullptr), NCF_E_POINTER);
}

TEST_F(Container, PathWithAPercentSignIsNoFormat) {
    RecordingNMALog log;
    EXPECT_EQ(container()->SetFilePath(text("%s%n.mov").inArg()), NCF_OK);
    EXPECT_TRUE(log.contains("Container File Path = %s%n.mov"));
}

TEST_F(Container, RecordsItsPath) {
    RecordingLog log(host);
    container()->SetFilePath(text("C:/a.mov").inArg());
    EXPECT_TRUE(log.once("NMA::Impl::QuickTimeContainer::SetFilePathC:\\a.mov"));
}

// A string that answers a copy, or refuses it.
class CopyingString : public FakeObject<INCFString> {
public:
    CopyingString(INCFString* copy, NCFRESULT answer) : copy_(copy), answer_(answer) {}

    ncfUInt32 GetEncoding() override { return kNCFUTF8; }
    ncfUInt32 GetLength() override { return 0; }
    ncfBool IsEmpty() override { return 0; }
    NCFRESULT Assign(INCFString*) override { return NCF_E_NOTIMPL; }
    NCFRESULT AssignUTF8(ncfUInt32, const ncfUTF8*, ncfUInt32) override { return NCF_E_NOTIMPL; }
    NCFRESULT AssignUTF16(ncfUInt32, const ncfUTF16*, ncfUInt32) override { return NCF_E_NOTIMPL; }
    NCFRESULT AssignWCHAR(ncfUInt32, const ncfWCHAR*, ncfUInt32) override { return NCF_E_NOTIMPL; }
    NCFRESULT ConvertTo(ncfUInt32) override { return answer_; }
    NCFRESULT ConvertCopy(ncfUInt32 encoding, INCFString** out) override {
        asked = encoding;
        *out = copy_;
        return copy_ ? NCF_OK : answer_;
    }
    NCFRESULT GetRawUTF8(ncfUTF8**) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetRawUTF16(ncfUTF16**) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetRawUTF32(ncfUTF32** out) override {
        *out = nothing_;
        return NCF_OK;
    }
    NCFRESULT GetRawWCHAR(ncfWCHAR** out) override {
        *out = nullptr;
        return NCF_E_ABORT;
    }
    NCFRESULT FindCharacter(ncfUTF32, ncfSInt32, ncfBool, ncfSInt32* at) override {
        *at = -1;
        return NCF_OK;
    }
    NCFRESULT FindWCHAR(const ncfWCHAR*, ncfUInt32, ncfUInt32, ncfSInt32*) override {
        return NCF_E_NOTIMPL;
    }

    ncfUInt32 asked = 0;

private:
    INCFString* copy_;
    NCFRESULT answer_;
    ncfUTF32 nothing_[1] = {};
};

TEST_F(Container, StaysWithoutAPathThatCanNotBeCopied) {
    const auto object = container();
    NCFSmartPtr<INCFString> given;
    auto* const string = new CopyingString(nullptr, NCF_E_HANDLE);
    given.attach(string);
    EXPECT_EQ(object->SetFilePath(given.inArg()), NCF_E_HANDLE);
    EXPECT_EQ(string->asked, 4u) << "wide characters";
    EXPECT_EQ(object->SetFilePath(text("a.mov").inArg()), NCF_OK);
}

TEST_F(Container, RecordsAPathThatCanNotBeTurnedOrRead) {
    const auto failing = [&](NCFRESULT answer) {
        NCFSmartPtr<INCFString> given;
        given.attach(new CopyingString(new CopyingString(nullptr, answer), NCF_OK));
        return container()->SetFilePath(given.inArg());
    };
    const std::string function = " : NMA::Impl::QuickTimeContainer::SetFilePath";
    RecordingLog log(host);
    EXPECT_EQ(failing(NCF_E_OUTOFMEMORY), NCF_E_OUTOFMEMORY);
    EXPECT_TRUE(log.once("NCF_RETURN(0x80000002): ConvertSlashesInPlace(filePath_)" + function));
    EXPECT_EQ(failing(NCF_OK), NCF_E_ABORT);
    EXPECT_TRUE(log.once("NCF_RETURN(0x80000007): filePath_->GetRawWCHAR(&ppwcharStr)" + function));
}

// --- description -----------------------------------------------------------------------

TEST_F(Container, NeedsAPathBeforeItIsDescribed) {
    const auto object = container();
    NCFSmartPtr<NMA::IAAFClips> clips;
    EXPECT_EQ(object->GetAAFMasterClips(clips.outArg()), NCF_E_POINTER) << "no path at all";
    object->SetFilePath(text("").inArg());
    EXPECT_EQ(object->GetAAFMasterClips(clips.outArg()), NMA_E_NOTINITIALIZED) << "an empty one";
}

TEST_F(Container, HasNoDescriptionUntilItIsAskedFor) {
    const auto object = container();
    NCFSmartPtr<NMA::IAAFClips> clips;
    ncfQuery(object.inArg(), clips);
    auto* file = reinterpret_cast<IAAFFile*>(&host);
    EXPECT_EQ(clips->GetMetadata(0, &file), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(file, nullptr);
    EXPECT_EQ(clips->GetMetadata(0, nullptr), NCF_OK);
    file = reinterpret_cast<IAAFFile*>(&host);
    EXPECT_EQ(clips->GetMetadata(1, &file), NCF_E_NOTFOUND);
    EXPECT_EQ(file, nullptr);
    EXPECT_EQ(clips->GetMetadata(1, nullptr), NCF_E_NOTFOUND) << "the index is looked at first";
    EXPECT_EQ(clips->GetMetadata(-1, &file), NCF_E_NOTFOUND);
}

TEST_F(Container, GivesTheFailureOfALoadAndDoesNotTryAgain) {
    const auto object = container();
    object->SetFilePath(path(write("a.mov", "no movie")).inArg());
    NCFSmartPtr<NMA::IAAFClips> clips;
    EXPECT_EQ(object->GetAAFMasterClips(clips.outArg()), NMA_E_NOTINITIALIZED);
    EXPECT_TRUE(clips.isNull());
    const int tries = host.creations(NCFCompID_QTParser);
    EXPECT_LT(object->GetAAFMasterClips(clips.outArg()), 0);
    EXPECT_EQ(host.creations(NCFCompID_QTParser), tries) << "the failed clip is kept";
}

TEST_F(Container, GivesTheCodeOfAFileThatCanNotBeOpened) {
    const auto object = container();
    object->SetFilePath(path(folder / "absent.mov").inArg());
    NCFSmartPtr<NMA::IAAFClips> clips;
    EXPECT_EQ(object->GetAAFMasterClips(clips.outArg()), NCF_E_HANDLE);
}

TEST_F(Container, TellsWhetherItsFileCanBeLoaded) {
    const auto good = container();
    good->SetFilePath(path(writeMovie()).inArg());
    EXPECT_EQ(good->IsContainerSupported(), 1);
    const auto bad = container();
    bad->SetFilePath(path(write("b.mov", "no movie")).inArg());
    EXPECT_EQ(bad->IsContainerSupported(), 0);
}

TEST_F(Container, LetsTheExceptionOfAFileThatCanNotBeOpenedThrough) {
    const auto object = container();
    object->SetFilePath(path(folder / "absent.mov").inArg());
    try {
        object->IsContainerSupported();
        FAIL() << "nothing was thrown";
    } catch (NCFRESULT thrown) {
        EXPECT_EQ(thrown, NCF_E_HANDLE);
    }
}

TEST_F(Container, IsNotSupportedWithoutAPath) {
    EXPECT_EQ(container()->IsContainerSupported(), 0);
}

// --- sample mapping -----------------------------------------------------------------------

TEST_F(Container, HasNoSampleMappingBeforeItsPath) {
    auto* mapping = reinterpret_cast<NMA::ISampleMapping*>(&host);
    EXPECT_EQ(container()->GetSampleMapping(&mapping), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(mapping, nullptr);
    EXPECT_EQ(container()->GetSampleMapping(nullptr), NMA_E_NOTINITIALIZED);
}

TEST_F(Container, MakesAMappingOverItsClipAtEachRequest) {
    serveMappings();
    const auto object = container();
    object->SetFilePath(path(writeMovie()).inArg());
    NCFSmartPtr<NMA::ISampleMapping> first;
    NCFSmartPtr<NMA::ISampleMapping> second;
    ASSERT_EQ(object->GetSampleMapping(first.outArg()), NCF_OK);
    ASSERT_EQ(object->GetSampleMapping(second.outArg()), NCF_OK);
    EXPECT_NE(first.inArg(), second.inArg());
    EXPECT_EQ(host.creations(NCFCompID_QTParser), 1) << "one clip";
    ncfUInt64 samples = 0;
    EXPECT_EQ(first->GetNumberOfTracks(), 1);
    EXPECT_EQ(first->GetNumberOfSamples(0, &samples), NCF_OK);
    EXPECT_EQ(samples, 50u);
    EXPECT_EQ(second->GetNumberOfSamples(0, &samples), NCF_OK);
}

TEST_F(Container, MappingOutlivesItsContainer) {
    serveMappings();
    NCFSmartPtr<NMA::ISampleMapping> mapping;
    {
        const auto object = container();
        object->SetFilePath(path(writeMovie()).inArg());
        ASSERT_EQ(object->GetSampleMapping(mapping.outArg()), NCF_OK);
    }
    ncfUInt64 samples = 0;
    EXPECT_EQ(mapping->GetNumberOfSamples(0, &samples), NCF_OK);
    EXPECT_EQ(samples, 50u);
}

TEST_F(Container, CanStillBeDescribedAfterAMapping) {
    serveMappings();
    const auto object = container();
    object->SetFilePath(path(writeMovie()).inArg());
    NCFSmartPtr<NMA::ISampleMapping> mapping;
    ASSERT_EQ(object->GetSampleMapping(mapping.outArg()), NCF_OK);
    EXPECT_EQ(object->IsContainerSupported(), 1) << "the path is in another encoding now";
}

TEST_F(Container, MappingNeedsAnOutput) {
    serveMappings();
    const auto object = container();
    object->SetFilePath(path(writeMovie()).inArg());
    EXPECT_EQ(object->GetSampleMapping(nullptr), NCF_E_POINTER);
}

TEST_F(Container, GivesTheFailureToMakeAMapping) {
    RecordingLog log(host);
    const auto object = container();
    object->SetFilePath(path(writeMovie()).inArg());
    auto* mapping = reinterpret_cast<NMA::ISampleMapping*>(&host);
    EXPECT_EQ(object->GetSampleMapping(&mapping), NCF_CLASS_E_CLASSNOTAVAILABLE);
    EXPECT_EQ(mapping, nullptr);
    EXPECT_TRUE(
        log.once("NCF_RETURN(0x80040111): "
                 "componentFactory_->CreateComponent(NMA::CompID_QuickTimeSampleMapping, "
                 "NULL, IID_ISampleMapping, (void**)ppSampleMapping) : "
                 "NMA::Impl::QuickTimeContainer::GetSampleMapping"));
}

TEST_F(Container, TellsTheUserOfAMappingThatIsNotTheModulesOwn) {
    const auto object = container();
    object->SetFilePath(path(writeMovie()).inArg());
    const auto refused = [&] {
        host.console().clear();
        auto* mapping = reinterpret_cast<NMA::ISampleMapping*>(&host);
        EXPECT_EQ(object->GetSampleMapping(&mapping), NCF_E_UNEXPECTED);
        EXPECT_EQ(mapping, nullptr);
        EXPECT_EQ(host.console().count(1, "Failed to create a QuickTimeSampleMapping component."),
                  1);
    };
    host.maker(NMA::CompID_QuickTimeSampleMapping, [](const GUID&, void** out) {
        *out = nullptr;
        return NCF_OK;
    });
    refused();
    host.maker(NMA::CompID_QuickTimeSampleMapping, [](const GUID&, void** out) {
        *out = static_cast<NMA::ISampleMapping*>(new StubSampleMapping);
        return NCF_OK;
    });
    refused();
    EXPECT_EQ(LiveFakes(), 2) << "host and console: what was made is released";
    EXPECT_EQ(host.creations(NCFCompID_QTParser), 0) << "the movie is opened after that";
}

TEST_F(Container, MappingOfAFileThatIsNoMovieFailsAndLeavesNothing) {
    RecordingLog log(host);
    serveMappings();
    const auto object = container();
    object->SetFilePath(path(write("a.mov", "no movie")).inArg());
    auto* mapping = reinterpret_cast<NMA::ISampleMapping*>(&host);
    EXPECT_EQ(object->GetSampleMapping(&mapping), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(mapping, nullptr);
    EXPECT_TRUE(
        log.once("NCF_RETURN(0xa0000068): LoadMedia(filePath_, console_, "
                 "componentFactory_, media_) : NMA::Impl::QuickTimeContainer::GetSampleMapping"));
    // The clip that failed is kept, so the next mapping stands over that one.
    ASSERT_EQ(object->GetSampleMapping(&mapping), NCF_OK);
    EXPECT_EQ(host.creations(NCFCompID_QTParser), 1);
    mapping->Release();
    const auto absent = container();
    absent->SetFilePath(path(folder / "absent.mov").inArg());
    mapping = reinterpret_cast<NMA::ISampleMapping*>(&host);
    EXPECT_EQ(absent->GetSampleMapping(&mapping), NCF_E_HANDLE);
    EXPECT_EQ(mapping, nullptr);
}

}  // namespace
