// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "host_interfaces/header_parser/QTParser.h"
#include "host_interfaces/media/PluginComponents.h"
#include "host_interfaces/parameters/ParametersXML.h"
#include "source/parameters/QTParameters.h"
#include "tests/unit/aaf/support/StubbornString.h"
#include "tests/unit/essence/support/MappingFixture.h"

namespace {

using SampleMapping = MappingFixture;

// --- creation ---------------------------------------------------------------------

TEST_F(SampleMapping, TakesFactoryLockAndConsoleFromTheHostInThisOrder) {
    void* out = nullptr;
    FakeLock* const ours = lock;
    const auto create = [&](INCFUnknown* unknown) {
        out = nullptr;
        return CreateInstanceOf<NMA::Impl::QuickTimeSampleMapping>(unknown, nullptr,
                                                                   NMA::IID_ISampleMapping, &out);
    };
    EXPECT_EQ(create(nullptr), NCF_E_POINTER);
    host->refuseQuery(IID_INCFConsole, NCF_E_HANDLE);
    EXPECT_EQ(create(host->unknown()), NCF_E_HANDLE);
    host->refuseCreation(CompID_LockComponent, NCF_E_ACCESSDENIED);
    EXPECT_EQ(create(host->unknown()), NCF_E_ACCESSDENIED) << "the lock comes before the console";
    host->refuseQuery(IID_INCFComponentFactory, NCF_E_NOINTERFACE);
    EXPECT_EQ(create(host->unknown()), NCF_E_NOINTERFACE) << "the factory comes first";
    EXPECT_EQ(out, nullptr);
    lock = ours;
}

TEST_F(SampleMapping, HasALockOfItsOwn) {
    void* out = nullptr;
    FakeLock* const first = lock;
    ASSERT_EQ(CreateInstanceOf<NMA::Impl::QuickTimeSampleMapping>(host->unknown(), nullptr,
                                                                  NMA::IID_ISampleMapping, &out),
              NCF_OK);
    EXPECT_NE(lock, first);
    static_cast<NMA::ISampleMapping*>(out)->Release();
    lock = first;
}

// --- interfaces -----------------------------------------------------------------------

TEST_F(SampleMapping, ListsItsInterfacesInOrder) {
    auto* const first = reinterpret_cast<ncfUInt8*>(static_cast<NMA::ISampleProvider*>(mapping));
    const auto place = [&](auto* base) { return reinterpret_cast<ncfUInt8*>(base) - first; };
    const auto step = static_cast<std::ptrdiff_t>(sizeof(void*));
    EXPECT_EQ(static_cast<void*>(first), static_cast<void*>(mapping));
    EXPECT_EQ(place(static_cast<NMA::IUncompressedImageProvider*>(mapping)), step);
    EXPECT_EQ(place(static_cast<NMA::IUncompressedAudioProvider*>(mapping)), 2 * step);
    EXPECT_EQ(place(static_cast<NMA::ISampleMapping*>(mapping)), 3 * step);
    EXPECT_EQ(place(static_cast<CNCFUnknown*>(mapping)), 4 * step);
}

TEST_F(SampleMapping, PreparesNothingForSampleTablesAndDelivery) {
    void* tables = nullptr;
    void* provider = nullptr;
    EXPECT_EQ(mapping->QueryInterface(NMA::IID_ISampleMapping, &tables), NCF_OK);
    EXPECT_EQ(mapping->QueryInterface(NMA::IID_ISampleProvider, &provider), NCF_OK);
    EXPECT_EQ(tables, static_cast<NMA::ISampleMapping*>(mapping));
    EXPECT_EQ(provider, static_cast<NMA::ISampleProvider*>(mapping));
    EXPECT_TRUE(journal.lines().empty());
    static_cast<INCFUnknown*>(tables)->Release();
    static_cast<INCFUnknown*>(provider)->Release();
}

TEST_F(SampleMapping, HasOneIdentityBehindAllInterfaces) {
    AddVideo(1);
    Bind();
    void* viaTables = nullptr;
    void* viaImages = nullptr;
    void* images = nullptr;
    ASSERT_EQ(interface->QueryInterface(IID_INCFUnknown, &viaTables), NCF_OK);
    ASSERT_EQ(interface->QueryInterface(NMA::IID_IUncompressedImageProvider, &images), NCF_OK);
    ASSERT_EQ(static_cast<INCFUnknown*>(images)->QueryInterface(IID_INCFUnknown, &viaImages),
              NCF_OK);
    EXPECT_EQ(viaTables, viaImages);
    for (void* object : {viaTables, viaImages, images}) {
        static_cast<INCFUnknown*>(object)->Release();
    }
}

TEST_F(SampleMapping, RefusesANullOutputSilentlyAndAnUnknownInterface) {
    EXPECT_EQ(mapping->InternalQueryInterface(NMA::IID_ISampleMapping, nullptr), NCF_E_INVALIDARG);
    auto* out = reinterpret_cast<void*>(this);
    EXPECT_EQ(mapping->QueryInterface(IID_INCFBuffer, &out), NCF_E_NOINTERFACE);
    EXPECT_EQ(out, nullptr);
    EXPECT_TRUE(log->records().empty());
}

// --- the parameters -------------------------------------------------------------------------

TEST_F(SampleMapping, GivesNewParametersOfItsClipForEachQuery) {
    AddVideo(1);
    Bind();
    host->maker(NMA::CompID_QTParameters, [this](const GUID& iid, void** out) {
        return CreateInstanceOf<NMA::Impl::QTParameters>(host->unknown(), nullptr, iid, out);
    });
    INCFParametersXML* answers[2] = {};
    for (INCFParametersXML*& answer : answers) {
        ASSERT_EQ(mapping->QueryInterface(IID_INCFParametersXML, reinterpret_cast<void**>(&answer)),
                  NCF_OK);
        clip->setLevels(Expand_Levels);
        EXPECT_EQ(answer->ResetParameters(), NCF_OK) << "they are attached";
        EXPECT_EQ(clip->GetClipParams()->levelRemap, static_cast<ncfUInt32>(Default_Levels));
    }
    EXPECT_NE(answers[0], answers[1]);
    EXPECT_EQ(journal.count("lock"), 0) << "the lock is not for this";
    for (INCFParametersXML* const answer : answers) {
        EXPECT_EQ(answer->Release(), 0u) << "one reference each, and none of the mapping's";
    }
}

TEST_F(SampleMapping, GivesTheRefusalOfItsParameters) {
    AddVideo(1);
    Bind();
    auto* out = reinterpret_cast<void*>(this);
    host->refuseCreation(NMA::CompID_QTParameters, NCF_E_OUTOFMEMORY);
    EXPECT_EQ(mapping->QueryInterface(IID_INCFParametersXML, &out), NCF_E_OUTOFMEMORY);
    EXPECT_EQ(out, nullptr);
    EXPECT_TRUE(log->once(Record("80000002",
                                 "_pComponentFactory->CreateComponent(CompID_QTParameters, NULL, "
                                 "IID_INCFParametersXML, ppvObj)",
                                 "InternalQueryInterface")));
}

TEST_F(SampleMapping, CannotUseParametersThatAreNotTheModulesOwn) {
    struct Foreign : FakeObject<INCFParametersXML> {
        NCFRESULT GetParameterValuesXML(INCFString*) override { return NCF_OK; }
        NCFRESULT GetParameterDescriptionXML(INCFString*) override { return NCF_OK; }
        NCFRESULT GetDefaultValuesXML(INCFString*) override { return NCF_OK; }
        NCFRESULT SetParameterValuesXML(INCFString*) override { return NCF_OK; }
        NCFRESULT ParametersUnsupportedOperation(void*) override { return NCF_OK; }
        NCFRESULT ResetParameters() override { return NCF_OK; }
    };
    AddVideo(1);
    Bind();
    host->maker(NMA::CompID_QTParameters, [](const GUID&, void** out) {
        *out = static_cast<INCFParametersXML*>(new Foreign);
        return NCF_OK;
    });
    auto* out = reinterpret_cast<void*>(this);
    EXPECT_EQ(mapping->QueryInterface(IID_INCFParametersXML, &out), NCF_E_UNEXPECTED);
    EXPECT_EQ(out, nullptr);
}

TEST_F(SampleMapping, ParametersQueryWithoutAClipLoadsItFirst) {
    NCFSmartPtr<INCFString> path;
    path.attach(MakeHostString("/no/such/movie.mov"));
    ASSERT_EQ(mapping->SetFilePath(path), NCF_OK);
    EXPECT_EQ(Query(IID_INCFParametersXML), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(host->creations(NMA::CompID_QTParameters), 0);
    EXPECT_TRUE(
        log->once(Record("a0000068", "LoadMedia(_filePath, _pConsole, _pComponentFactory, media_)",
                         "InternalQueryInterface")));
}

// --- the image query -----------------------------------------------------------------------

TEST_F(SampleMapping, LooksForPictureFormatsAtTheFirstImageQueryUnderTheLock) {
    AddVideo(1);
    Bind();
    EXPECT_EQ(QueryImages(), NCF_OK);
    ASSERT_GE(journal.lines().size(), 2u);
    EXPECT_EQ(journal.lines().front(), "lock");
    EXPECT_EQ(journal.lines().back(), "unlock");
    EXPECT_TRUE(mapping->imageFormatsReady_);
    EXPECT_EQ(property->path, "/movies/a.mov");
    journal.clear();
    EXPECT_EQ(QueryImages(), NCF_OK);
    EXPECT_TRUE(journal.lines().empty()) << "once is enough, and no lock is taken";
}

TEST_F(SampleMapping, LooksAgainAtEachImageQueryWhileNoFormatCouldBeAdded) {
    AddVideo(1);
    clip->setAlpha(true);
    Bind();
    EXPECT_EQ(QueryImages(), NCF_E_FAIL);
    EXPECT_FALSE(mapping->imageFormatsReady_);
    EXPECT_EQ(QueryImages(), NCF_E_FAIL);
    EXPECT_EQ(journal.count("property.GetCodecStorageType"), 2);
}

TEST_F(SampleMapping, FailedImageQueryGivesTheCodeAndAReferenceToRelease) {
    AddVideo(1);
    Bind();
    property->results["CreateMovie"] = NCF_E_HANDLE;
    void* out = nullptr;
    EXPECT_EQ(mapping->QueryInterface(NMA::IID_IUncompressedImageProvider, &out), NCF_E_HANDLE);
    ASSERT_EQ(out, static_cast<NMA::IUncompressedImageProvider*>(mapping));
    EXPECT_EQ(static_cast<INCFUnknown*>(out)->Release(), 1u) << "the fixture's is left";
    EXPECT_TRUE(log->once(
        Record("80000006", "AddSupportedImageFormatsBasedOnCodec()", "InternalQueryInterface")));
}

TEST_F(SampleMapping, ImageQueryWithoutAClipLoadsItAndKeepsTheOneThatFailed) {
    NCFSmartPtr<INCFString> path;
    path.attach(MakeHostString("/no/such/movie.mov"));
    ASSERT_EQ(mapping->SetFilePath(path), NCF_OK);
    EXPECT_EQ(QueryImages(), NMA_E_NOTINITIALIZED);
    EXPECT_TRUE(mapping->media_);
    EXPECT_TRUE(
        log->once(Record("a0000068", "LoadMedia(_filePath, _pConsole, _pComponentFactory, media_)",
                         "InternalQueryInterface")));
    EXPECT_EQ(QueryImages(), NCF_E_POINTER) << "it has no tracks, and is not loaded again";
}

// The file's failure is thrown: it must not leave the query as an exception.
TEST_F(SampleMapping, FileThatCannotBeOpenedIsTheQuerysFailure) {
    NCFSmartPtr<INCFString> path;
    path.attach(MakeHostString("/no/such/movie.mov"));
    ASSERT_EQ(mapping->SetFilePath(path), NCF_OK);
    host->maker(NCFCompID_QTParser, [](const GUID&, void**) -> NCFRESULT { throw NCF_E_HANDLE; });
    for (const GUID& iid :
         {NMA::IID_IUncompressedImageProvider, NMA::IID_IUncompressedAudioProvider}) {
        void* out = nullptr;
        EXPECT_EQ(mapping->QueryInterface(iid, &out), NCF_E_HANDLE);
        ASSERT_NE(out, nullptr);
        static_cast<INCFUnknown*>(out)->Release();
    }
}

TEST_F(SampleMapping, QueriesWithoutPathOrClipFailAndStillGiveAReference) {
    for (const GUID& iid :
         {NMA::IID_IUncompressedImageProvider, NMA::IID_IUncompressedAudioProvider}) {
        void* out = nullptr;
        EXPECT_EQ(mapping->QueryInterface(iid, &out), NCF_E_INVALIDARG);
        ASSERT_NE(out, nullptr);
        static_cast<INCFUnknown*>(out)->Release();
    }
    EXPECT_EQ(
        log->count(Record("80000003", "LoadMedia(_filePath, _pConsole, _pComponentFactory, media_)",
                          "InternalQueryInterface")),
        2);
}

TEST_F(SampleMapping, LoadsTheClipUnderTheLockForPicturesAlone) {
    NCFSmartPtr<INCFString> path;
    path.attach(MakeHostString("/no/such/movie.mov"));
    ASSERT_EQ(mapping->SetFilePath(path), NCF_OK);
    int loads = 0;
    int depth = 1;
    host->maker(NCFCompID_QTParser, [&](const GUID&, void**) {
        ++loads;
        EXPECT_EQ(lock->depth(), depth);
        return NCF_E_FAIL;
    });
    EXPECT_LT(Query(NMA::IID_IUncompressedImageProvider), 0);
    depth = 0;
    for (const GUID& iid : {NMA::IID_IUncompressedAudioProvider, IID_INCFParametersXML}) {
        mapping->media_.reset();
        EXPECT_LT(Query(iid), 0);
    }
    EXPECT_EQ(loads, 3);
}

// --- the audio query -----------------------------------------------------------------------

TEST_F(SampleMapping, TakesTheSoundReaderAtTheFirstAudioQueryWithoutTheLock) {
    AddAudio(2);
    Bind();
    EXPECT_EQ(QuerySound(), NCF_OK);
    EXPECT_EQ(journal.count("wrapper.GetQTAudioReader"), 1);
    EXPECT_EQ(QuerySound(), NCF_OK);
    EXPECT_EQ(journal.count("wrapper.GetQTAudioReader"), 1);
    EXPECT_EQ(journal.count("lock"), 0);
}

TEST_F(SampleMapping, FailedAudioQueryGivesTheCodeAndAReferenceToRelease) {
    AddAudio(2);
    Bind();
    wrapper->results["GetQTAudioReader"] = NCF_E_NOTFOUND;
    void* out = nullptr;
    EXPECT_EQ(mapping->QueryInterface(NMA::IID_IUncompressedAudioProvider, &out), NCF_E_NOTFOUND);
    ASSERT_EQ(out, static_cast<NMA::IUncompressedAudioProvider*>(mapping));
    EXPECT_EQ(static_cast<INCFUnknown*>(out)->Release(), 1u);
    EXPECT_TRUE(log->once(Record("8000000c", "media_->GetQuickTimeAudioReader(_audioReaderHolder)",
                                 "InternalQueryInterface")));
}

TEST_F(SampleMapping, CreationThatAsksForAProviderGivesItsFailureWithAReference) {
    void* out = nullptr;
    FakeLock* const first = lock;
    EXPECT_EQ(CreateInstanceOf<NMA::Impl::QuickTimeSampleMapping>(
                  host->unknown(), nullptr, NMA::IID_IUncompressedAudioProvider, &out),
              NCF_E_INVALIDARG);
    ASSERT_NE(out, nullptr);
    static_cast<INCFUnknown*>(out)->Release();
    lock = first;
}

// --- path and clip ---------------------------------------------------------------------------

TEST_F(SampleMapping, TurnsTheCallersPathToUTF16) {
    NCFSmartPtr<INCFString> path;
    path.attach(MakeHostString("/movies/a.mov"));
    ASSERT_EQ(path->ConvertTo(kNCFUTF8), NCF_OK);
    EXPECT_EQ(mapping->SetFilePath(path), NCF_OK);
    EXPECT_EQ(path->GetEncoding(), kNCFUTF16);
}

TEST_F(SampleMapping, GivesTheFailureToTurnThePath) {
    NCFSmartPtr<INCFString> path;
    path.attach(new StubbornString("/movies/a.mov", "ConvertTo", NCF_E_ABORT));
    EXPECT_EQ(mapping->SetFilePath(path), NCF_E_ABORT);
    EXPECT_TRUE(log->once(Record("80000007", "_filePath->ConvertTo(kNCFUTF16)", "SetFilePath")));
}

TEST_F(SampleMapping, RefusesANullClip) {
    EXPECT_EQ(mapping->SetMediaContainer(std::tr1::shared_ptr<BaseClip>()), NCF_E_INVALIDARG);
    EXPECT_TRUE(log->once(Check("CHK_INARG(media)", "SetMediaContainer")));
}

TEST_F(SampleMapping, TakesAClipThatCannotTellItsTracks) {
    AddVideo(1);
    AddAudio(2);
    clip->results["GetAudioTrackCount"] = NCF_E_FAIL;
    EXPECT_EQ(mapping->SetMediaContainer(clip), NCF_OK);
    EXPECT_EQ(mapping->mediaTracks_.size(), 1u) << "what it told up to there";
    EXPECT_TRUE(log->once(Record("80000008", "media->GetAudioTrackCount(&audioTrackCount)",
                                 "InitializeMediaTracks")));
    clip->results["GetVideoTrackCount"] = NCF_E_HANDLE;
    EXPECT_EQ(mapping->SetMediaContainer(clip), NCF_OK);
    EXPECT_EQ(mapping->mediaTracks_.size(), 1u);
}

// --- Setup and Cleanup -------------------------------------------------------------------------

TEST_F(SampleMapping, StartsAndStopsThePictureReaderOnceItIsThere) {
    AddVideo(1);
    Bind();
    ASSERT_EQ(QueryImages(), NCF_OK);
    journal.clear();
    EXPECT_EQ(mapping->Setup(0), NCF_OK);
    EXPECT_EQ(mapping->Cleanup(0), NCF_OK);
    EXPECT_TRUE(journal.lines().empty()) << "no format is chosen yet";
    ASSERT_EQ(mapping->SetWorkingImageFormat(0, 0), NCF_OK);
    journal.clear();
    EXPECT_EQ(mapping->Setup(0), NCF_OK);
    EXPECT_EQ(mapping->Cleanup(0), NCF_OK);
    EXPECT_EQ(journal.lines(), (Lines{"reader.InitQT", "reader.ReleaseQT"})) << "without a lock";
}

TEST_F(SampleMapping, GivesTheFailureOfStartingAndStopping) {
    AddVideo(1);
    Bind();
    ASSERT_EQ(QueryImages(), NCF_OK);
    ASSERT_EQ(mapping->SetWorkingImageFormat(0, 0), NCF_OK);
    wrapper->picture->results = {{"InitQT", NCF_E_HANDLE}, {"ReleaseQT", NCF_E_ABORT}};
    EXPECT_EQ(mapping->Setup(0), NCF_E_HANDLE);
    EXPECT_EQ(mapping->Cleanup(0), NCF_E_ABORT);
    EXPECT_TRUE(log->once(Record("80000006",
                                 "_videoReaderHolder->InitQT(QTWrapper::kUseDecompressionSession)",
                                 "SetupOrCleanup")));
    EXPECT_TRUE(log->once(Record("80000007", "_videoReaderHolder->ReleaseQT()", "SetupOrCleanup")));
}

TEST_F(SampleMapping, StartsAndStopsForTheAlphaTrackToo) {
    AddVideo(1);
    clip->setAlpha(true);
    property->codes = {QuickTime::kBGRAPixelFormat};
    Bind();
    ASSERT_EQ(QueryImages(), NCF_OK);
    ASSERT_EQ(mapping->SetWorkingImageFormat(0, 0), NCF_OK);
    journal.clear();
    EXPECT_EQ(mapping->Setup(1), NCF_OK);
    EXPECT_EQ(mapping->Cleanup(1), NCF_OK);
    EXPECT_EQ(journal.lines(), (Lines{"reader.InitQT", "reader.ReleaseQT"}));
}

TEST_F(SampleMapping, StartingWithoutAClipLoadsItFirstAndStoppingNeedsNone) {
    AddVideo(1);
    Bind();
    ASSERT_EQ(QueryImages(), NCF_OK);
    ASSERT_EQ(mapping->SetWorkingImageFormat(0, 0), NCF_OK);
    NCFSmartPtr<INCFString> path;
    path.attach(MakeHostString("/no/such/movie.mov"));
    ASSERT_EQ(mapping->SetFilePath(path), NCF_OK);
    mapping->media_.reset();
    journal.clear();
    EXPECT_EQ(mapping->Cleanup(0), NCF_OK);
    EXPECT_EQ(host->creations(NCFCompID_QTParser), 0);
    EXPECT_EQ(mapping->Setup(0), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(journal.count("reader.InitQT"), 0);
    EXPECT_TRUE(
        log->once(Record("a0000068", "LoadMedia(_filePath, _pConsole, _pComponentFactory, media_)",
                         "SetupOrCleanup")));
    EXPECT_EQ(mapping->Setup(0), NCF_OK) << "the clip that failed is kept";
}

TEST_F(SampleMapping, SetupAndCleanupTouchNothingOfASoundTrack) {
    AddVideo(1);
    AddAudio(2);
    Bind();
    ASSERT_EQ(QueryImages(), NCF_OK);
    ASSERT_EQ(mapping->SetWorkingImageFormat(0, 0), NCF_OK);
    journal.clear();
    EXPECT_EQ(mapping->Setup(1), NCF_OK);
    EXPECT_EQ(mapping->Cleanup(1), NCF_OK);
    EXPECT_TRUE(journal.lines().empty());
}

TEST_F(SampleMapping, SetupOfATrackThatIsNotThereTellsWhichCallFailed) {
    EXPECT_EQ(mapping->Setup(0), NCF_E_INVALIDARG);
    EXPECT_EQ(mapping->Cleanup(7), NCF_E_INVALIDARG);
    EXPECT_EQ(log->count(Record("80000003", "GetMediaTrack(trackNMA, track)", "SetupOrCleanup")),
              2);
}

// --- operations without an effect ----------------------------------------------------------------

TEST_F(SampleMapping, RefusesThreeOperationsSilentlyAndDoesNothingInFour) {
    RecordingNMALog lines;
    EXPECT_EQ(mapping->ProviderUnsupportedOperation(0, 1, 2), NCF_E_NOTIMPL);
    EXPECT_EQ(mapping->ImageProviderUnsupportedOperation(0, 1, nullptr), NCF_E_NOTIMPL);
    EXPECT_EQ(mapping->AudioProviderUnsupportedOperation(0, 1, nullptr), NCF_E_NOTIMPL);
    EXPECT_EQ(mapping->ProviderNoOperationA(0, 1, 2), NCF_OK);
    EXPECT_EQ(mapping->ProviderNoOperationB(), NCF_OK);
    EXPECT_EQ(mapping->ImageProviderNoOperationA(0, 1), NCF_OK);
    EXPECT_EQ(mapping->ImageProviderNoOperationB(0, 0.5f), NCF_OK);
    EXPECT_TRUE(journal.lines().empty());
    EXPECT_TRUE(log->records().empty());
    EXPECT_TRUE(lines.lines().empty());
}

// --- after a change of the parameters ---------------------------------------------------------

TEST_F(SampleMapping, RefreshAddsFormatsThenLetsTheClipWorkOutItsFieldsUnderTheLock) {
    AddVideo(1);
    Bind();
    ASSERT_EQ(QueryImages(), NCF_OK);
    ASSERT_EQ(Offered(0), (Lines{"2/1/8/1/1 <- 2vuy"}));
    clip->setLevels(Expand_Levels);
    journal.clear();
    EXPECT_EQ(mapping->RefreshBasedOnUIParams(), NCF_OK);
    EXPECT_EQ(Offered(0), (Lines{"2/1/8/1/1 <- 2vuy", "8/4/2/1/1 <- NVZ2"}))
        << "the new format comes behind, the old one stays";
    EXPECT_EQ(mapping->levelRemap_, static_cast<ncfUInt32>(Expand_Levels));
    EXPECT_EQ(journal.count("property.CreateMovie"), 0) << "the codec is known";
    EXPECT_EQ(journal.lines().front(), "lock");
    ASSERT_GE(journal.lines().size(), 2u);
    EXPECT_EQ(journal.lines()[journal.lines().size() - 2], "clip.SetFieldLayoutDetails");
    EXPECT_EQ(journal.lines().back(), "unlock");
}

TEST_F(SampleMapping, RefreshWithUnchangedSettingsAddsNothing) {
    AddVideo(1);
    property->codes = {QuickTime::kr4flPixelFormat, QuickTime::k2vuyPixelFormat};
    Bind();
    ASSERT_EQ(QueryImages(), NCF_OK);
    const Lines before = Offered(0);
    EXPECT_EQ(before.size(), 2u);
    EXPECT_EQ(mapping->RefreshBasedOnUIParams(), NCF_OK);
    EXPECT_EQ(mapping->RefreshBasedOnUIParams(), NCF_OK);
    EXPECT_EQ(Offered(0), before);
}

TEST_F(SampleMapping, RefreshAddsFormatsToTheAlphaTrackWhileTheClipShowsAlpha) {
    AddVideo(1);
    clip->setAlpha(true);
    property->codes = {QuickTime::kBGRAPixelFormat};
    Bind();
    ASSERT_EQ(QueryImages(), NCF_OK);
    ASSERT_EQ(Offered(0).size(), 1u);
    ASSERT_EQ(Offered(1).size(), 1u);
    clip->setFieldOrder(kTopFieldFirst);
    EXPECT_EQ(mapping->RefreshBasedOnUIParams(), NCF_OK);
    EXPECT_EQ(Offered(0).size(), 2u);
    EXPECT_EQ(Offered(1).size(), 2u);
    clip->setFieldOrder(kBottomFieldFirst);
    clip->setIgnoreAlpha(true);
    EXPECT_EQ(mapping->RefreshBasedOnUIParams(), NCF_OK);
    EXPECT_EQ(Offered(0).size(), 3u);
    EXPECT_EQ(Offered(1).size(), 2u) << "the track is there and not shown";
}

TEST_F(SampleMapping, RefreshIgnoresThatNoFormatCouldBeAdded) {
    AddVideo(1);
    property->codes = {QuickTime::k2vuyPixelFormat};
    Bind();
    ASSERT_EQ(QueryImages(), NCF_OK);
    journal.clear();
    clip->results["IsMultiFormatMovie"] = NCF_E_ABORT;
    EXPECT_EQ(mapping->RefreshBasedOnUIParams(), NCF_OK);
    EXPECT_EQ(journal.count("clip.IsMultiFormatMovie"), 1);
    EXPECT_EQ(journal.count("clip.SetFieldLayoutDetails"), 1);
}

TEST_F(SampleMapping, RefreshBeforeTheFirstLookLooksAndIgnoresItsFailure) {
    AddVideo(1);
    Bind();
    property->results["CreateMovie"] = NCF_E_HANDLE;
    EXPECT_EQ(mapping->RefreshBasedOnUIParams(), NCF_OK);
    EXPECT_EQ(journal.count("clip.SetFieldLayoutDetails"), 1);
    property->results.clear();
    EXPECT_EQ(mapping->RefreshBasedOnUIParams(), NCF_OK);
    EXPECT_TRUE(mapping->imageFormatsReady_);
}

TEST_F(SampleMapping, RefreshGivesTheFailureOfTheFields) {
    AddVideo(1);
    Bind();
    clip->results["SetFieldLayoutDetails"] = NCF_E_ABORT;
    EXPECT_EQ(mapping->RefreshBasedOnUIParams(), NCF_E_ABORT);
    EXPECT_TRUE(
        log->once(Record("80000007", "media_->SetFieldLayoutDetails()", "RefreshBasedOnUIParams")));
}

TEST_F(SampleMapping, RefreshWithoutAClipIsNotInitialized) {
    EXPECT_EQ(mapping->RefreshBasedOnUIParams(), NMA_E_NOTINITIALIZED);
}

}  // namespace
