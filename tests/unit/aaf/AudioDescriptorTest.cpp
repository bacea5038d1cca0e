// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "host_interfaces/aaf/AAFDescriptors.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "host_interfaces/aaf/AAFSoundDescriptors.h"
#include "source/aaf/AudioDescriptor.h"

#include <limits>
#include <tuple>

#include "tests/unit/aaf/support/AAFTest.h"

namespace NMA::Impl {
namespace {

constexpr char kAddAudioDescriptor[] = "NMA::Impl::AddAudioDescriptor";

class AudioDescriptorTest : public AAFTest {
protected:
    AudioDescriptorTest() {
        clip->setTiming();
        clip->sound.resize(1);
    }
    NCFRESULT Add() {
        slots = 1;
        return AddAudioDescriptor(Media(), 0, Console(), mob, Dictionary(), multi, slots);
    }
    FakeSoundTrack& Track() { return clip->sound[0]; }

    ncfUInt32 slots = 1;
    IAAFSmartPointer<IAAFMob> mob = Make<IAAFMob>("MasterMob");
    IAAFSmartPointer<IAAFMultipleDescriptor> multi =
        Make<IAAFMultipleDescriptor>("MultipleDescriptor");
};

TEST_F(AudioDescriptorTest, ChecksItsArgumentsInOrder) {
    const std::tr1::shared_ptr<BaseClip> none;
    EXPECT_EQ(AddAudioDescriptor(none, 0, nullptr, nullptr, nullptr, nullptr, slots),
              NCF_E_INVALIDARG);
    EXPECT_EQ(AddAudioDescriptor(Media(), 0, nullptr, nullptr, nullptr, nullptr, slots),
              NCF_E_INVALIDARG);
    EXPECT_EQ(AddAudioDescriptor(Media(), 0, Console(), nullptr, nullptr, nullptr, slots),
              NCF_E_INVALIDARG);
    EXPECT_EQ(AddAudioDescriptor(Media(), 0, Console(), nullptr, Dictionary(), nullptr, slots),
              NCF_E_INVALIDARG);
    std::vector<std::string> texts;
    for (const LoggedRecord& record : log.records()) {
        texts.push_back(record.text);
    }
    std::vector<std::string> expected;
    for (const char* name : {"media.get()", "pConsole", "pDictionary", "pMultiDescriptor"}) {
        expected.push_back(std::string("CHK_INARG(") + name + ")" + kAddAudioDescriptor);
    }
    EXPECT_EQ(texts, expected);
}

TEST_F(AudioDescriptorTest, ANativeTrackInOrder) {
    Track().metadata.isBigEndian = 1;
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_EQ(slots, 2u);
    std::vector<std::string> calls;
    for (const std::string& line : aaf.journal().lines()) {
        if (line.find("QueryInterface") == std::string::npos) {
            calls.push_back(line);
        }
    }
    EXPECT_EQ(calls,
              (std::vector<std::string>{
                  "Dictionary.CreateInstance PCMDescriptor", "PCMDescriptor1.Initialize",
                  "PCMDescriptor1.SetCompression 0F020202-0301-0100-060E-2B3404010101",
                  "MasterMob1.AppendComment 'Audio Format' 'LPCM'",
                  "PCMDescriptor1.SetAverageBPS 1536000", "PCMDescriptor1.SetBlockAlign 4",
                  "PCMDescriptor1.SetChannelCount 2", "PCMDescriptor1.SetQuantizationBits 16",
                  "PCMDescriptor1.SetAudioSamplingRate 48000/1",
                  "PCMDescriptor1.SetSampleRate 48000/1", "PCMDescriptor1.SetLength 192000",
                  "MultipleDescriptor1.GetSampleRate", "MultipleDescriptor1.SetSampleRate 48000/1",
                  "MultipleDescriptor1.AppendFileDescriptor PCMDescriptor1"}));
}

TEST_F(AudioDescriptorTest, LittleEndianSoundHasItsOwnLabel) {
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_TRUE(aaf.has("PCMDescriptor1.SetCompression 04020202-0301-0100-060E-2B3404010101"));
}

TEST_F(AudioDescriptorTest, SoundOfTheSampleProviderIsAskedOfTheWrapper) {
    Track().native = 0;
    wrapper.bytesPerPacket = 12;
    wrapper.channels = 6;
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_EQ(slots, 6u);
    EXPECT_EQ(journal.count("wrapper GetAudioInfoForTrack 2"), 1);
    EXPECT_TRUE(aaf.has("PCMDescriptor1.SetCompression 04020202-0000-0000-060E-2B3404010101"));
    EXPECT_TRUE(aaf.has("MasterMob1.AppendComment 'Audio Format' 'AAC'"));
    EXPECT_TRUE(aaf.has("PCMDescriptor1.SetAverageBPS " + std::to_string(12 * 8 * 44100)));
    EXPECT_TRUE(aaf.has("PCMDescriptor1.SetBlockAlign 12"));
    EXPECT_TRUE(aaf.has("PCMDescriptor1.SetChannelCount 6"));
    EXPECT_TRUE(aaf.has("PCMDescriptor1.SetQuantizationBits 24"));
    EXPECT_TRUE(aaf.has("PCMDescriptor1.SetAudioSamplingRate 44100/1"));
}

TEST_F(AudioDescriptorTest, AVariableBitRateHasNoAverage) {
    Track().metadata.isConstantBitRate = 0;
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_TRUE(aaf.has("PCMDescriptor1.SetAverageBPS 0"));
}

TEST_F(AudioDescriptorTest, AFractionalRateIsCut) {
    Track().metadata.sampleRate = 44100.5;
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_TRUE(aaf.has("PCMDescriptor1.SetAudioSamplingRate 44100/1"));
    // 4 * 8 * 44100.5 exactly
    EXPECT_TRUE(aaf.has("PCMDescriptor1.SetAverageBPS 1411216"));
}

TEST_F(AudioDescriptorTest, TheAverageIsRounded) {
    Track().metadata.bytesPerPacket = 1;
    Track().metadata.sampleRate = 8000.1;  // 64000.8 bits in a second
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_TRUE(aaf.has("PCMDescriptor1.SetAverageBPS 64001"));
    Track().native = 0;
    wrapper.bytesPerPacket = 1;
    wrapper.sampleRate = 8000.1;
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_TRUE(aaf.has("PCMDescriptor2.SetAverageBPS 64001"));
    EXPECT_TRUE(aaf.has("PCMDescriptor2.SetAudioSamplingRate 8000/1"));
}

// 8 * 0x20000001 * 1.5 is 0x18000000C. Whole numbers of 32 bits would lose the
// top before the rate comes in.
TEST_F(AudioDescriptorTest, TheAverageIsWorkedOutInDoubles) {
    Track().metadata.bytesPerPacket = 0x20000001;
    Track().metadata.sampleRate = 1.5;
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_TRUE(aaf.has("PCMDescriptor1.SetAverageBPS " + std::to_string(0x8000000Cu)));
}

TEST_F(AudioDescriptorTest, AnyFlagButZeroIsSet) {
    Track().metadata.isConstantBitRate = 2;
    Track().metadata.isBigEndian = 2;
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_TRUE(aaf.has("PCMDescriptor1.SetAverageBPS 1536000"));
    EXPECT_TRUE(aaf.has("PCMDescriptor1.SetCompression 0F020202-0301-0100-060E-2B3404010101"));
}

TEST_F(AudioDescriptorTest, NumbersTooLargeKeepTheirLowBits) {
    Track().metadata.bytesPerPacket = 0x10001;
    Track().metadata.channelsPerFrame = 0x20003;
    Track().metadata.sampleRate = 1e6;
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_EQ(slots, 3u);
    EXPECT_TRUE(aaf.has("PCMDescriptor1.SetBlockAlign 1"));
    const auto bits = static_cast<ncfUInt32>(0x10001ull * 8 * 1000000);
    EXPECT_TRUE(aaf.has("PCMDescriptor1.SetAverageBPS " + std::to_string(bits)));
}

TEST_F(AudioDescriptorTest, RatesThatAreNoNumbersDoNoHarm) {
    Track().native = 0;
    for (const double rate : {-1.0, 1e300, std::numeric_limits<double>::infinity(),
                              std::numeric_limits<double>::quiet_NaN()}) {
        wrapper.sampleRate = rate;
        wrapper.bytesPerPacket = 4;
        EXPECT_EQ(Add(), NCF_OK) << rate;
    }
    EXPECT_EQ(aaf.linesOf("PCMDescriptor4.SetAudioSamplingRate"),
              std::vector<std::string>{"PCMDescriptor4.SetAudioSamplingRate 0/1"});
}

TEST_F(AudioDescriptorTest, NoChannelsGiveADescriptorAndNoSlot) {
    Track().metadata.channelsPerFrame = 0;
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_EQ(slots, 0u);
    EXPECT_TRUE(aaf.has("MultipleDescriptor1.AppendFileDescriptor PCMDescriptor1"));
}

TEST_F(AudioDescriptorTest, ALengthFromThePolicyIsTaken) {
    Track().lengthFromPolicy = 777;
    journal.clear();
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_TRUE(aaf.has("PCMDescriptor1.SetLength 777"));
    EXPECT_EQ(journal.count("clip CalculateAudioTrackLengthInSamples"), 0);
}

TEST_F(AudioDescriptorTest, SoundLongerThanTheVideoIsCut) {
    Track().samples = 1000000;
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_TRUE(aaf.has("PCMDescriptor1.SetLength 192000"));
}

TEST_F(AudioDescriptorTest, OnlyTheFirstDescriptorSetsTheRateOfAll) {
    ASSERT_EQ(Add(), NCF_OK);
    Track().metadata.sampleRate = 96000;
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_EQ(aaf.linesOf("MultipleDescriptor1.SetSampleRate"),
              std::vector<std::string>{"MultipleDescriptor1.SetSampleRate 48000/1"});
    EXPECT_EQ(aaf.journal().count("MasterMob1.AppendComment 'Audio Format' 'LPCM'"), 2);
}

TEST_F(AudioDescriptorTest, TellsTrackChannelsAndBits) {
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_TRUE(log.once(std::string(kAddAudioDescriptor) + "qtTrack: 2; numAudioChannels: 2"));
    EXPECT_TRUE(log.once(std::string(kAddAudioDescriptor) + "qtTrack: 2; quantizationBits: 16"));
}

TEST_F(AudioDescriptorTest, ARefusedCellDoesNotEndTheClip) {
    aaf.refuse("MasterMob1.AppendComment");
    EXPECT_EQ(Add(), NCF_OK);
}

TEST_F(AudioDescriptorTest, AMasterMobIsNotNeeded) {
    EXPECT_EQ(AddAudioDescriptor(Media(), 0, Console(), nullptr, Dictionary(), multi, slots),
              NCF_OK);
    EXPECT_TRUE(log.contains("CHK_INARG(pMobMasterMob)NMA::Impl::AddBinColumnEntry"));
    EXPECT_TRUE(aaf.has("MultipleDescriptor1.AppendFileDescriptor PCMDescriptor1"));
}

TEST_F(AudioDescriptorTest, EachRoadAsksItsOwnSource) {
    const std::vector<std::string> length = {"clip GetAudioTrackMetadata",
                                             "clip CalculateAudioTrackLengthInSamples",
                                             "clip GetEditRate", "clip GetMovieLength"};
    std::vector<std::string> native = {"clip GetAudioTrackQTId", "clip IsAudioSampleProviderMedia",
                                       "clip GetAudioTrackMetadata"};
    std::vector<std::string> provided = {"clip GetAudioTrackQTId",
                                         "clip IsAudioSampleProviderMedia"};
    native.insert(native.end(), length.begin(), length.end());
    provided.insert(provided.end(), length.begin(), length.end());
    journal.clear();
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_EQ(journal.startingWith("clip "), native);
    EXPECT_EQ(journal.startingWith("wrapper "), std::vector<std::string>{});
    Track().native = 0;
    journal.clear();
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_EQ(journal.startingWith("clip "), provided);
    EXPECT_EQ(journal.startingWith("wrapper "),
              (std::vector<std::string>{"wrapper NewMovieFromFilePath",
                                        "wrapper GetAudioInfoForTrack 2"}));
}

TEST_F(AudioDescriptorTest, AFailureBehindTheTracksFormLeavesTheChannelsTold) {
    aaf.refuse("PCMDescriptor1.SetCompression");
    EXPECT_LT(Add(), 0);
    EXPECT_EQ(slots, 2u);
}

TEST_F(AudioDescriptorTest, ARefusedDescriptorIsThrown) {
    aaf.refuse("Dictionary.CreateInstance PCMDescriptor", AAFRESULT_NOMEMORY);
    try {
        Add();
        FAIL() << "nothing was thrown";
    } catch (NCFRESULT result) {
        EXPECT_EQ(result, AAFRESULT_NOMEMORY);
    }
}

TEST_F(AudioDescriptorTest, FailuresOfTheClipAreLoggedAndReturned) {
    const std::tuple<NCFRESULT, const char*, const char*> statements[] = {
        {1, "GetAudioTrackQTId", "media->GetAudioTrackQTId(trackNum, qtTrack)"},
        {1, "IsAudioSampleProviderMedia",
         "MovieRequiresSampleProviderForAudio(pConsole, media, qtTrack, &numAudioSamples)"},
        {1, "GetAudioTrackMetadata", "media->GetAudioTrackMetadata(qtTrack, &audioInfo)"},
        {0, "CalculateAudioTrackLengthInSamples",
         "media->ObtainAudioTrackLength(qtTrack, &numAudioSamples)"},
    };
    for (const auto& [native, operation, statement] : statements) {
        Track().native = native;
        clip->failures = {{operation, NCF_E_NOTFOUND}};
        EXPECT_EQ(Add(), NCF_E_NOTFOUND) << operation;
        EXPECT_TRUE(log.returned(NCF_E_NOTFOUND, statement, kAddAudioDescriptor)) << operation;
    }
}

TEST_F(AudioDescriptorTest, FailuresOfTheWrapperAreLoggedAndReturned) {
    Track().native = 0;
    wrapper.soundResult = NCF_E_NOTFOUND;
    EXPECT_EQ(Add(), NCF_E_NOTFOUND);
    EXPECT_TRUE(
        log.returned(NCF_E_NOTFOUND,
                     "qtWrapper->GetAudioInfoForTrack(qtTrack, &numAudioChannels, &sampleRate, "
                     "&formatID, NULL, &bytesPerPacket, NULL, NULL, NULL, NULL)",
                     kAddAudioDescriptor));
}

TEST_F(AudioDescriptorTest, AWrapperThatCannotBeMadeIsLoggedAndReturned) {
    Track().native = 0;
    host.refuseCreation(QTWrapper::CompID_QuickTimeWrapper, NCF_E_NOTFOUND);
    EXPECT_EQ(Add(), NCF_E_NOTFOUND);
    EXPECT_TRUE(log.returned(NCF_E_NOTFOUND, "media->GetQuickTimeInterface(qtWrapper)",
                             kAddAudioDescriptor));
}

struct RefusedCall {
    NCFRESULT native;
    bool bigEndian;
    const char* call;
    const char* statement;
};

void PrintTo(const RefusedCall& refused, std::ostream* to) {
    *to << refused.call << (refused.native != 0 ? " native" : "")
        << (refused.bigEndian ? " big-endian" : "");
}

class AudioRefusalTest : public AudioDescriptorTest,
                         public ::testing::WithParamInterface<RefusedCall> {};

TEST_P(AudioRefusalTest, IsLoggedWithItsStatementAndReturned) {
    const RefusedCall& refused = GetParam();
    Track().native = refused.native;
    Track().metadata.isBigEndian = refused.bigEndian;
    aaf.refuse(refused.call, AAFRESULT_NOMEMORY);
    EXPECT_EQ(Add(), AAFRESULT_NOMEMORY);
    EXPECT_TRUE(log.returned(AAFRESULT_NOMEMORY, refused.statement, kAddAudioDescriptor));
}

INSTANTIATE_TEST_SUITE_P(
    EveryCall, AudioRefusalTest,
    ::testing::Values(
        RefusedCall{1, false, "PCMDescriptor1.QueryInterface 00000000",
                    "pPCMDescriptor->QueryInterface(IID_IUnknown, (void**)&pGenericDescriptor)"},
        RefusedCall{1, false, "PCMDescriptor1.Initialize", "pPCMDescriptor->Initialize()"},
        RefusedCall{1, false, "PCMDescriptor1.SetCompression",
                    "pSoundDescriptor->SetCompression(MakeAAFUIDfromMXFUL("
                    "UncompressedPCMAudioCoding))"},
        RefusedCall{1, true, "PCMDescriptor1.SetCompression",
                    "pSoundDescriptor->SetCompression(MakeAAFUIDfromMXFUL("
                    "UncompressedPCM_BigEndian_AudioCoding))"},
        RefusedCall{0, false, "PCMDescriptor1.SetCompression",
                    "pSoundDescriptor->SetCompression(MakeAAFUIDfromMXFUL("
                    "CompressedSoundCodingBaseKey))"},
        RefusedCall{1, false, "PCMDescriptor1.SetAverageBPS",
                    "pPCMDescriptor->SetAverageBPS(bitsPerFrame )"},
        RefusedCall{1, false, "PCMDescriptor1.SetBlockAlign",
                    "pPCMDescriptor->SetBlockAlign(static_cast<aafUInt16>(bytesPerPacket))"},
        RefusedCall{1, false, "PCMDescriptor1.SetChannelCount",
                    "pSoundDescriptor->SetChannelCount( numAudioChannels)"},
        RefusedCall{1, false, "PCMDescriptor1.SetQuantizationBits",
                    "pSoundDescriptor->SetQuantizationBits( quantizationBits)"},
        RefusedCall{1, false, "PCMDescriptor1.SetAudioSamplingRate",
                    "pSoundDescriptor->SetAudioSamplingRate(sampleRateRational)"},
        RefusedCall{1, false, "PCMDescriptor1.SetSampleRate",
                    "pFileDesc->SetSampleRate(sampleRateRational)"},
        RefusedCall{1, false, "PCMDescriptor1.SetLength", "pFileDesc->SetLength(numAudioSamples)"},
        RefusedCall{1, false, "MultipleDescriptor1.SetSampleRate",
                    "FixMultiDescSampleRate(pMultiDescriptor, sampleRateRational)"},
        RefusedCall{1, false, "MultipleDescriptor1.AppendFileDescriptor",
                    "pMultiDescriptor->AppendFileDescriptor( pFileDesc )"}));

TEST_F(AudioDescriptorTest, ARefusedViewIsLoggedAndReturned) {
    const std::pair<const char*, const char*> views[] = {
        {"pGenericDescriptor->QueryInterface(IID_IAAFFileDescriptor, (void**)&pFileDesc)",
         "IAAFFileDescriptor"},
        {"pPCMDescriptor->QueryInterface(IID_IAAFSoundDescriptor, (void**)&pSoundDescriptor)",
         "IAAFSoundDescriptor"},
    };
    int nth = 2;  // after the query for the root
    for (const auto& [statement, name] : views) {
        aaf.clearRefusals();
        aaf.refuse("PCMDescriptor", AAFRESULT_NOMEMORY, ++nth);
        EXPECT_EQ(Add(), AAFRESULT_NOMEMORY) << name;
        EXPECT_TRUE(log.returned(AAFRESULT_NOMEMORY, statement, kAddAudioDescriptor)) << name;
    }
}

}  // namespace
}  // namespace NMA::Impl
