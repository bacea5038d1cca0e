// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "host_interfaces/aaf/AAFDescriptors.h"
#include "host_interfaces/aaf/AAFMasterMobs.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "source/aaf/NewAAFFromMovie.h"

#include <map>

#include "tests/unit/aaf/support/AAFTest.h"

namespace NMA::Impl {
namespace {

constexpr char kNewAAFFromMovie[] = "NMA::Impl::NewAAFFromMovie";

class NewAAFFromMovieTest : public AAFTest {
protected:
    NewAAFFromMovieTest() { clip->timecode.resize(1); }

    NCFRESULT Describe() { return NewAAFFromMovie(Media(), Console(), &file, host.factory()); }
    void MakeFreshClip(const std::string& path) {
        clip.reset(new FakeClip(path, host, &journal));
        clip->timecode.resize(1);
    }
    // The material that the three ids of the last description share.
    std::string Material() const {
        const std::string line = aaf.linesOf("MasterMob1.SetMobID").at(0);
        return line.substr(line.find(':') + 1);
    }

    IAAFSmartPointer<IAAFFile> file;
};

TEST_F(NewAAFFromMovieTest, GivesTheCallerAFile) {
    const int before = aaf.liveObjects();
    ASSERT_EQ(Describe(), NCF_OK);
    EXPECT_NE((IAAFFile*)file, nullptr);
    EXPECT_GT(aaf.liveObjects(), before);
    // One reference, the caller's: releasing it ends the file.
    IAAFFile* const raw = file;
    raw->AddRef();
    file = nullptr;
    EXPECT_EQ(raw->Release(), 0u);
}

TEST_F(NewAAFFromMovieTest, IdentifiesTheProduct) {
    ASSERT_EQ(Describe(), NCF_OK);
    EXPECT_EQ(aaf.lastIdentification(),
              "'Cliphost'|'QuickTime Plug-In'|'1.3.2'|781F84B7-B989-4534-8A07-C595CB9A6FB8|"
              "'Win64'|1.3.2.6720 type 0");
}

TEST_F(NewAAFFromMovieTest, TheStepsAndTheirOrder) {
    clip->videoTracks = 0;
    ASSERT_EQ(Describe(), NCF_OK);
    std::vector<std::string> calls;
    for (const std::string& line : aaf.journal().lines()) {
        if (line.find("QueryInterface") == std::string::npos &&
            line.find("Dictionary.Lookup") == std::string::npos) {
            calls.push_back(line);
        }
    }
    const std::vector<std::string> start(calls.begin(), calls.begin() + 17);
    const std::string label = "060A2B340101010101010F0013";
    const std::string material = Material();
    EXPECT_EQ(
        start,
        (std::vector<std::string>{
            "AAFFileOpenTransient", "File1.GetHeader", "Header1.GetDictionary",
            "ClassDefMasterMob1.CreateInstance", "MasterMob1.Initialize",
            "ClassDefSourceMob1.CreateInstance", "SourceMob1.Initialize",
            "ClassDefSourceMob1.CreateInstance", "SourceMob2.Initialize",
            "MasterMob1.SetMobID " + label + "000000:" + material,
            "SourceMob1.SetMobID " + label + "B10000:" + material,
            "SourceMob2.SetMobID " + label + "A10000:" + material, "MasterMob1.SetName 'a clip'",
            "SourceMob1.SetName 'a clip'", "SourceMob2.SetName 'a clip'",
            "ClassDefMultipleDescriptor1.CreateInstance", "MultipleDescriptor1.Initialize"}));

    const auto tail =
        std::find(calls.begin(), calls.end(), "ClassDefNetworkLocator1.CreateInstance");
    ASSERT_NE(tail, calls.end());
    EXPECT_EQ(
        std::vector<std::string>(tail, tail + 17),
        (std::vector<std::string>{
            "ClassDefNetworkLocator1.CreateInstance",
            "NetworkLocator1.SetPath 'file:///media/a%20clip.mov'",
            "MultipleDescriptor1.AppendLocator NetworkLocator1",
            "SourceMob1.SetEssenceDescriptor MultipleDescriptor1",
            "ClassDefImportDescriptor1.CreateInstance", "ClassDefNetworkLocator1.CreateInstance",
            "NetworkLocator2.SetPath 'file:///media/a%20clip.mov'",
            "ImportDescriptor1.AppendLocator NetworkLocator2",
            "SourceMob2.SetEssenceDescriptor ImportDescriptor1", "SourceMob1.GetSlots",
            "SlotEnumerator1.NextOne", "Header1.AddMob MasterMob1", "Header1.AddMob SourceMob1",
            "Header1.AddMob SourceMob2", "MasterMob1.AppendComment 'Field Ordering' 'Default'",
            "MasterMob1.AppendComment 'GFX-Video Level' 'Do not modify levels'", *(tail + 16)}));
    EXPECT_TRUE(aaf.has("MasterMob1.SetPropertyValue PropertyMobAttributeList1 ArrayValue1"));
    EXPECT_GT(aaf.place("MasterMob1.SetPropertyValue PropertyMobAttributeList1"),
              aaf.place("MasterMob1.AppendComment '_ncfparametersxml.nma.bin.0'"));
}

TEST_F(NewAAFFromMovieTest, AsksTheClipInOrder) {
    clip->videoTracks = 0;
    journal.clear();
    ASSERT_EQ(Describe(), NCF_OK);
    const std::vector<std::string>& lines_ = journal.lines();
    const auto at = [&](const std::string& line) {
        return std::find(lines_.begin(), lines_.end(), line) - lines_.begin();
    };
    EXPECT_LT(at("create editor settings"), at("clip SetEditRate"));
    EXPECT_LT(at("clip SetEditRate"), at("clip SetMovieLength"));
    EXPECT_LT(at("clip SetMovieLength"), at("clip GetContentForHash"));
    EXPECT_LT(at("clip GetContentForHash"), at("clip GetEditRate"));
    EXPECT_LT(at("clip GetAudioTrackCount"), static_cast<std::ptrdiff_t>(lines_.size()));
}

TEST_F(NewAAFFromMovieTest, AsksTheClipBetweenItsCallsToTheLibrary) {
    std::map<std::string, std::string> lastCall;  // by question, when first asked
    clip->whenAsked = [&](const std::string& operation) {
        lastCall.emplace(operation, aaf.journal().lines().back());
    };
    clip->videoTracks = 0;
    ASSERT_EQ(Describe(), NCF_OK);
    EXPECT_EQ(lastCall.at("SetEditRate"), "SourceMob2.Initialize");
    EXPECT_EQ(lastCall.at("SetMovieLength"), "SourceMob2.Initialize");
    EXPECT_EQ(lastCall.at("GetContentForHash"), "SourceMob2.Initialize");
    EXPECT_EQ(lastCall.at("GetEditRate").rfind("MultipleDescriptor1.QueryInterface", 0), 0u);
}

TEST_F(NewAAFFromMovieTest, ARefusedFileIsNoQuestionToTheEditor) {
    journal.clear();
    aaf.refuse("SourceMob2.Initialize");
    EXPECT_LT(Describe(), 0);
    EXPECT_EQ(journal.count("create editor settings"), 0);
    EXPECT_EQ(journal.count("clip SetEditRate"), 0);
}

TEST_F(NewAAFFromMovieTest, HandsTheEditorsSettingsToTheClip) {
    editor.rate = 29.97;
    editor.named = 1;
    ASSERT_EQ(Describe(), NCF_OK);
    EXPECT_EQ(clip->seenSettings._areSettingsValid, 1u);
    EXPECT_EQ(clip->seenSettings._editorFrameRate, 29.97);
    EXPECT_EQ(clip->seenSettings._movieDurationCalculationToUse, 1u);
}

TEST_F(NewAAFFromMovieTest, IsMadeFromDefaultsWithoutEditorSettings) {
    host.refuseCreation(COMPID_INCFNMAEditorSettings, NCF_E_NOINTERFACE);
    ASSERT_EQ(Describe(), NCF_OK);
    EXPECT_EQ(clip->seenSettings._areSettingsValid, 0u);
    EXPECT_EQ(clip->seenSettings._singleFrameDuration, 60u);
}

TEST_F(NewAAFFromMovieTest, TheMoviesTimecodeMovesTheFileMobsClips) {
    ASSERT_EQ(Describe(), NCF_OK);
    EXPECT_TRUE(aaf.has("SourceMob1Clip1.SetSourceReference {A1 slot 2 at 90000}"));
    EXPECT_EQ(aaf.place("MasterMob1Clip1.SetSourceReference"), -1);
    EXPECT_LT(aaf.place("SourceMob2.SetEssenceDescriptor"), aaf.place("SourceMob1.GetSlots"));
    EXPECT_LT(aaf.place("SourceMob1Clip1.SetSourceReference"), aaf.place("Header1.AddMob"));
}

TEST_F(NewAAFFromMovieTest, EqualContentGivesEqualIdsAndAnotherLocator) {
    ASSERT_EQ(Describe(), NCF_OK);
    const std::string first = Material();
    aaf.clearJournal();
    MakeFreshClip("\\elsewhere\\copy.mov");
    ASSERT_EQ(Describe(), NCF_OK);
    const std::string second = aaf.linesOf("MasterMob2.SetMobID").at(0);
    EXPECT_EQ(second.substr(second.find(':') + 1), first);
    EXPECT_TRUE(aaf.has("MasterMob2.SetName 'copy'"));
    EXPECT_TRUE(aaf.has("NetworkLocator3.SetPath 'file:///elsewhere/copy.mov'"));
    aaf.clearJournal();
    MakeFreshClip("\\elsewhere\\copy.mov");
    clip->content[0] = 99;
    ASSERT_EQ(Describe(), NCF_OK);
    const std::string third = aaf.linesOf("MasterMob3.SetMobID").at(0);
    EXPECT_NE(third.substr(third.find(':') + 1), first);
}

TEST_F(NewAAFFromMovieTest, ContentOfNoBytesIsHashedToo) {
    clip->content.clear();
    EXPECT_EQ(Describe(), NCF_OK);
}

TEST_F(NewAAFFromMovieTest, OnlyAlphaHasAnAppCode) {
    ASSERT_EQ(Describe(), NCF_OK);
    EXPECT_FALSE(aaf.journal().contains("AppCode"));
    clip->setAlpha(true, false);
    ASSERT_EQ(Describe(), NCF_OK);
    EXPECT_GE(aaf.place("MasterMob2.SetPropertyValue PropertyAppCode1"), 0);
    EXPECT_LT(aaf.place("MasterMob2.SetPropertyValue PropertyAppCode1"),
              aaf.place("MasterMob2.AppendComment 'Field Ordering'"));
    EXPECT_GT(aaf.place("MasterMob2.SetPropertyValue PropertyAppCode1"),
              aaf.place("Header2.AddMob SourceMob4"));
}

TEST_F(NewAAFFromMovieTest, TheAppCodeFollowsTheAlphaThatWasThereWithTheContent) {
    clip->whenAsked = [&](const std::string& operation) {
        if (operation == "GetAudioTrackCount") {
            clip->setAlpha(true, false);
        }
    };
    ASSERT_EQ(Describe(), NCF_OK);
    EXPECT_FALSE(aaf.journal().contains("AppCode"));
}

TEST_F(NewAAFFromMovieTest, ChecksItsArguments) {
    const std::tr1::shared_ptr<BaseClip> none;
    IAAFFile* out = nullptr;
    EXPECT_EQ(NewAAFFromMovie(none, Console(), &out, host.factory()), NCF_E_INVALIDARG);
    EXPECT_EQ(NewAAFFromMovie(Media(), Console(), nullptr, host.factory()), NCF_E_INVALIDARG);
    EXPECT_TRUE(log.once(std::string("CHK_INARG(media.get())") + kNewAAFFromMovie));
    EXPECT_TRUE(log.once(std::string("CHK_INARG(pOutAAFFile)") + kNewAAFFromMovie));
}

TEST_F(NewAAFFromMovieTest, AnEmptyPathFailsBeforeTheFileIsOpened) {
    MakeFreshClip("");
    EXPECT_EQ(Describe(), NCF_E_INVALIDARG);
    EXPECT_EQ(aaf.callCount(), 0);
}

TEST_F(NewAAFFromMovieTest, AClipWithoutAPathObjectGetsAsFarAsItsName) {
    clip->setFileName(nullptr);
    EXPECT_LT(Describe(), 0);
    EXPECT_GE(aaf.place("SourceMob2.Initialize"), 0);
    EXPECT_EQ(aaf.place("Header1.AddMob"), -1);
}

TEST_F(NewAAFFromMovieTest, AClipWithoutAFactoryFailsWithItsPointerCode) {
    EXPECT_EQ(NewAAFFromMovie(Media(), Console(), &file, nullptr), NCF_E_POINTER);
}

TEST_F(NewAAFFromMovieTest, AFailureLeavesTheOutputAsItWas) {
    aaf.refuse("MasterMob1.SetMobID");
    IAAFFile* const before = reinterpret_cast<IAAFFile*>(this);
    IAAFFile* out = before;
    EXPECT_EQ(NewAAFFromMovie(Media(), Console(), &out, host.factory()), AAFRESULT_INTERNAL_ERROR);
    EXPECT_EQ(out, before);
}

TEST_F(NewAAFFromMovieTest, AFailureInTheTracksLeavesNoMobInTheHeader) {
    clip->failures["GetAudioTrackCount"] = NCF_E_NOTFOUND;
    EXPECT_EQ(Describe(), NCF_E_NOTFOUND);
    EXPECT_EQ(aaf.place("Header1.AddMob"), -1);
    EXPECT_TRUE(log.returned(NCF_E_NOTFOUND,
                             "AddTracksToAAF(media, pConsole, pHeader, pDictionary, pMobMasterMob, "
                             "pMasterMob, pMobFileMob, pFileMob, pMobSourceMob, pSourceMob, "
                             "pMultiDescriptor, pComponentFactory, &absoluteStartTime)",
                             kNewAAFFromMovie));
}

TEST_F(NewAAFFromMovieTest, FailuresOfTheClipAreLoggedAndReturned) {
    const std::pair<const char*, const char*> statements[] = {
        {"SetEditRate", "media->SetEditRate(editorSettings)"},
        {"SetMovieLength", "media->SetMovieLength(editorSettings)"},
        {"GetContentForHash", "media->GetContentForHash(pContent)"},
    };
    for (const auto& [operation, statement] : statements) {
        clip->failures = {{operation, NMA_E_NOTINITIALIZED}};
        EXPECT_EQ(Describe(), NMA_E_NOTINITIALIZED) << operation;
        EXPECT_TRUE(log.returned(NMA_E_NOTINITIALIZED, statement, kNewAAFFromMovie));
    }
}

TEST_F(NewAAFFromMovieTest, AProviderClipAfterAnRgbaClipIsUnexpected) {
    MakeNative("rgba");
    ASSERT_EQ(Describe(), NCF_OK);
    MakeFreshClip("\\media\\b.mov");
    EXPECT_EQ(Describe(), NCF_E_UNEXPECTED);
}

struct RefusedCall {
    const char* call;
    const char* statement;
};

void PrintTo(const RefusedCall& refused, std::ostream* to) {
    *to << refused.call;
}

class DescriptionRefusalTest : public NewAAFFromMovieTest,
                               public ::testing::WithParamInterface<RefusedCall> {};

TEST_P(DescriptionRefusalTest, IsLoggedWithItsStatementAndReturned) {
    clip->setAlpha(true, false);
    aaf.refuse(GetParam().call, AAFRESULT_NOMEMORY);
    EXPECT_EQ(Describe(), AAFRESULT_NOMEMORY);
    EXPECT_TRUE(log.returned(AAFRESULT_NOMEMORY, GetParam().statement, kNewAAFFromMovie));
}

INSTANTIATE_TEST_SUITE_P(
    EveryCall, DescriptionRefusalTest,
    ::testing::Values(
        RefusedCall{"AAFFileOpenTransient", "AAFFileOpenTransient(&productID, &pTheAAFFile)"},
        RefusedCall{"File1.GetHeader", "pTheAAFFile->GetHeader(&pHeader)"},
        RefusedCall{"Header1.GetDictionary", "pHeader->GetDictionary(&pDictionary)"},
        RefusedCall{"ClassDefMasterMob1.CreateInstance",
                    "defs.cdMasterMob()->CreateInstance(IID_IAAFMob, (IUnknown "
                    "**)&pMobMasterMob)"},
        RefusedCall{"MasterMob1.QueryInterface",
                    "pMobMasterMob->QueryInterface(IID_IAAFMasterMob, (void **)&pMasterMob)"},
        RefusedCall{"MasterMob1.Initialize", "pMasterMob->Initialize()"},
        RefusedCall{"ClassDefSourceMob1.CreateInstance",
                    "defs.cdSourceMob()->CreateInstance(IID_IAAFMob, (IUnknown **)&pMobFileMob)"},
        RefusedCall{"SourceMob1.QueryInterface",
                    "pMobFileMob->QueryInterface(IID_IAAFSourceMob, (void **)&pFileMob)"},
        RefusedCall{"SourceMob1.Initialize", "pFileMob->Initialize()"},
        RefusedCall{"SourceMob2.QueryInterface",
                    "pMobSourceMob->QueryInterface(IID_IAAFSourceMob, (void **)&pSourceMob)"},
        RefusedCall{"SourceMob2.Initialize", "pSourceMob->Initialize()"},
        RefusedCall{"MasterMob1.SetMobID", "pMobMasterMob->SetMobID(masterMobID)"},
        RefusedCall{"SourceMob1.SetMobID", "pMobFileMob->SetMobID(fileMobID)"},
        RefusedCall{"SourceMob2.SetMobID", "pMobSourceMob->SetMobID(sourceMobID)"},
        RefusedCall{"MasterMob1.SetName", "pMobMasterMob->SetName(clipName.GetWCHARString())"},
        RefusedCall{"SourceMob1.SetName", "pMobFileMob->SetName(clipName.GetWCHARString())"},
        RefusedCall{"SourceMob2.SetName", "pMobSourceMob->SetName(clipName.GetWCHARString())"},
        RefusedCall{"ClassDefMultipleDescriptor1.CreateInstance",
                    "defs.cdMultipleDescriptor()->CreateInstance(IID_IAAFMultipleDescriptor, "
                    "(IUnknown **)&pMultiDescriptor)"},
        RefusedCall{"MultipleDescriptor1.Initialize", "pMultiDescriptor->Initialize()"},
        RefusedCall{"MultipleDescriptor1.QueryInterface",
                    "pMultiDescriptor->QueryInterface(IID_IAAFFileDescriptor, "
                    "(void**)&pFileDescriptor)"},
        RefusedCall{"NetworkLocator1.SetPath",
                    "AddLocator(theMoviePathW, pDictionary, pEssenceDesc)"},
        RefusedCall{"NetworkLocator2.SetPath",
                    "AddLocator(theMoviePathW, pDictionary, pEssenceDesc)"},
        RefusedCall{"SourceMob1.SetEssenceDescriptor",
                    "pFileMob->SetEssenceDescriptor(pEssenceDesc)"},
        RefusedCall{"ClassDefImportDescriptor1.CreateInstance",
                    "defs.cdImportDescriptor()->CreateInstance(IID_IAAFImportDescriptor, "
                    "(IUnknown **)&pImportDesc)"},
        RefusedCall{"ImportDescriptor1.QueryInterface",
                    "pImportDesc->QueryInterface(IID_IAAFEssenceDescriptor, (void "
                    "**)&pEssenceDesc)"},
        RefusedCall{"SourceMob2.SetEssenceDescriptor",
                    "pSourceMob->SetEssenceDescriptor(pEssenceDesc)"},
        RefusedCall{"SourceMob1.GetSlots",
                    "AddStartTimeToSourceClip(pMobFileMob, absoluteStartTime)"},
        RefusedCall{"Header1.AddMob MasterMob1", "pHeader->AddMob(pMobMasterMob)"},
        RefusedCall{"Header1.AddMob SourceMob1", "pHeader->AddMob(pMobFileMob)"},
        RefusedCall{"Header1.AddMob SourceMob2", "pHeader->AddMob(pMobSourceMob)"},
        RefusedCall{"MasterMob1.SetPropertyValue PropertyAppCode1",
                    "AddMasterMobAppCode( pDictionary, pMasterMob, kPrecomputeMasterMob )"},
        RefusedCall{"MasterMob1.SetPropertyValue PropertyMobAttributeList1",
                    "AddMasterMobAttributes(pDictionary,pMasterMob)"}));

TEST_F(NewAAFFromMovieTest, ARefusedSourceMobOrEssenceViewIsLogged) {
    aaf.refuse("ClassDefSourceMob1.CreateInstance", AAFRESULT_NOMEMORY, 2);
    EXPECT_EQ(Describe(), AAFRESULT_NOMEMORY);
    EXPECT_TRUE(log.returned(AAFRESULT_NOMEMORY,
                             "defs.cdSourceMob()->CreateInstance(IID_IAAFMob, (IUnknown "
                             "**)&pMobSourceMob)",
                             kNewAAFFromMovie));
    // The multiple descriptor's essence view is asked after all tracks.
    aaf.refuse("MultipleDescriptor1.QueryInterface", AAFRESULT_NOMEMORY, 3);
    EXPECT_EQ(Describe(), AAFRESULT_NOMEMORY);
    EXPECT_TRUE(log.returned(AAFRESULT_NOMEMORY,
                             "pMultiDescriptor->QueryInterface "
                             "(IID_IAAFEssenceDescriptor, (void **)&pEssenceDesc)",
                             kNewAAFFromMovie));
}

TEST_F(NewAAFFromMovieTest, ARefusedColumnMappingIsLogged) {
    aaf.refuse("MasterMob1.AppendComment 'Field Ordering'");
    EXPECT_EQ(Describe(), NMA_E_AAF_ADD);
    EXPECT_TRUE(
        log.returned(NMA_E_AAF_ADD, "AddBinColMappingToMob( pMobMasterMob )", kNewAAFFromMovie));
}

TEST_F(NewAAFFromMovieTest, AFailedLookUpIsUnexpected) {
    aaf.refuse("Dictionary.LookupClassDef MasterMob");
    EXPECT_EQ(Describe(), NCF_E_UNEXPECTED);
}

TEST_F(NewAAFFromMovieTest, WithoutALibraryTheLoadersCodeComesBack) {
    const LibraryAccess before = AAFRunTimeLibrary::Instance().SetAccess(
        {[](const char*) -> void* { return nullptr; },
         [](void*, const char*) -> void* { return nullptr; }});
    EXPECT_EQ(Describe(), AAFRESULT_DLL_LOAD_FAILED);
    AAFRunTimeLibrary::Instance().SetAccess(before);
    EXPECT_TRUE(log.returned(AAFRESULT_DLL_LOAD_FAILED,
                             "AAFFileOpenTransient(&productID, &pTheAAFFile)", kNewAAFFromMovie));
}

}  // namespace
}  // namespace NMA::Impl
