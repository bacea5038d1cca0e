// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/unit/clips/OtherClipFixture.h"

namespace {

class OtherClipSamples : public OtherClipTest {
protected:
    OtherClipSamples() { LoadUsual(); }
};

}  // namespace

TEST_F(OtherClipSamples, ForwardsEachQuestionToTheTable) {
    ncfUInt64 large = 0;
    ncfUInt32 number = 0;
    ncfSInt64 time = 0;
    ncfBool flag = 0;
    EXPECT_EQ(other->GetNumSamples(2, &large), NCF_OK);
    EXPECT_EQ(large, ncfUInt64{1} << 33);
    EXPECT_EQ(wrapper->table->asked, "2");
    EXPECT_EQ(other->GetDataOffset(1, 1, &large), NCF_OK);
    EXPECT_EQ(large, ncfUInt64{1} << 34);
    EXPECT_EQ(wrapper->table->asked, "1/1");
    EXPECT_EQ(other->GetSampleFlags(1, ncfUInt64{1} << 40, &number), NCF_OK);
    EXPECT_EQ(number, 3u);
    EXPECT_EQ(wrapper->table->asked, "1/1099511627776");
    EXPECT_EQ(other->GetNextDiscontiguousDataAttributeChange(1, 3, &large), NCF_OK);
    EXPECT_EQ(large, ncfUInt64{1} << 35);
    EXPECT_EQ(wrapper->table->asked, "1/3");
    EXPECT_EQ(other->GetDataSizePerSample(1, 4, &number), NCF_OK);
    EXPECT_EQ(number, 700u);
    EXPECT_EQ(wrapper->table->asked, "1/4");
    EXPECT_EQ(other->GetDisplayOffset(1, 5, &time), NCF_OK);
    EXPECT_EQ(time, -(ncfSInt64{1} << 36));
    EXPECT_EQ(wrapper->table->asked, "1/5");
    EXPECT_EQ(other->GetDecodeDuration(1, 6, &time), NCF_OK);
    EXPECT_EQ(time, ncfSInt64{1} << 37);
    EXPECT_EQ(wrapper->table->asked, "1/6");
    EXPECT_EQ(other->GetMaxDataSizeInBytes(7, &number), NCF_OK);
    EXPECT_EQ(number, 8000u);
    EXPECT_EQ(wrapper->table->asked, "7");
    EXPECT_EQ(other->GetHasOutOfOrderFrameDependencies(8, &flag), NCF_OK);
    EXPECT_EQ(flag, 1);
    EXPECT_EQ(wrapper->table->asked, "8");
}

TEST_F(OtherClipSamples, HandsFailuresOnAndLeavesTheOutputs) {
    ncfUInt64 large = 77;
    ncfUInt32 number = 77;
    ncfSInt64 time = 77;
    const struct {
        const char* function;
        const char* record;
        std::function<NCFRESULT()> ask;
    } kQuestions[] = {
        {"GetNumSamples", "sampleTable_->GetNumSamples(qtTrack, numSamples)",
         [&] { return other->GetNumSamples(1, &large); }},
        {"GetDataOffset", "sampleTable_->GetDataOffset(qtTrack, sampleNum, samplePosition)",
         [&] { return other->GetDataOffset(1, 1, &large); }},
        {"GetSampleFlags",
         "sampleTable_->GetSampleFlags(qtTrack, sampleNum, "
         "(QTWrapper::QTWSamplePropertyFlags_t*)flags)",
         [&] { return other->GetSampleFlags(1, 1, &number); }},
        {"GetNextDiscontiguousDataAttributeChange",
         "sampleTable_->GetNextDiscontiguousDataAttributeChange(qtTrack, sampleNum, lastSample)",
         [&] { return other->GetNextDiscontiguousDataAttributeChange(1, 1, &large); }},
        {"GetDataSizePerSample",
         "sampleTable_->GetDataSizePerSample(qtTrack, sampleNum, dataSizeInBytes)",
         [&] { return other->GetDataSizePerSample(1, 1, &number); }},
        {"GetDisplayOffset", "sampleTable_->GetDisplayOffset(qtTrack, sampleNum, outOffset)",
         [&] { return other->GetDisplayOffset(1, 1, &time); }},
        {"GetDecodeDuration", "sampleTable_->GetDecodeDuration(qtTrack, sampleNum, decodeDuration)",
         [&] { return other->GetDecodeDuration(1, 1, &time); }},
    };
    for (const auto& question : kQuestions) {
        wrapper->table->results = {{question.function, NCF_E_INVALIDARG}};
        EXPECT_EQ(question.ask(), NCF_E_INVALIDARG) << question.function;
        EXPECT_EQ(LastRecord(), ReturnRecord("80000003", question.record,
                                             std::string("OtherClip::") + question.function));
    }
    EXPECT_EQ(large, 77u);
    EXPECT_EQ(number, 77u);
    EXPECT_EQ(time, 77);
}

TEST_F(OtherClipSamples, ChecksItsOutputs) {
    EXPECT_EQ(other->GetNumSamples(1, nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(LastRecord(), "CHK_INARG(numSamples)OtherClip::GetNumSamples");
    EXPECT_EQ(other->GetDataOffset(1, 1, nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(LastRecord(), "CHK_INARG(samplePosition)OtherClip::GetDataOffset");
    EXPECT_EQ(other->GetSampleFlags(1, 1, nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(LastRecord(), "CHK_INARG(flags)OtherClip::GetSampleFlags");
    EXPECT_EQ(other->GetNextDiscontiguousDataAttributeChange(1, 1, nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(LastRecord(),
              "CHK_INARG(lastSample)OtherClip::GetNextDiscontiguousDataAttributeChange");
    EXPECT_EQ(other->GetDataSizePerSample(1, 1, nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(LastRecord(), "CHK_INARG(dataSizeInBytes)OtherClip::GetDataSizePerSample");
    EXPECT_EQ(other->GetDisplayOffset(1, 1, nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(LastRecord(), "CHK_INARG(outOffset)OtherClip::GetDisplayOffset");
    EXPECT_EQ(other->GetDecodeDuration(1, 1, nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(LastRecord(), "CHK_INARG(decodeDuration)OtherClip::GetDecodeDuration");
    EXPECT_EQ(other->GetMaxDataSizeInBytes(1, nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(LastRecord(), "CHK_INARG(maxDataSize)OtherClip::GetMaxDataSizeInBytes");
    EXPECT_EQ(other->GetHasOutOfOrderFrameDependencies(1, nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(LastRecord(), "CHK_INARG(outOfOrder)OtherClip::GetHasOutOfOrderFrameDependencies");
    EXPECT_TRUE(journal.lines().empty()) << "the table is not asked";
}

TEST_F(OtherClipSamples, AnswersWithoutATable) {
    wrapper->results["GetSampleTable"] = NCF_E_FAIL;
    LoadOther();
    ncfUInt64 large = 77;
    ncfUInt32 number = 77;
    ncfSInt64 time = 77;
    ncfBool flag = 77;
    EXPECT_EQ(other->GetNumSamples(1, &large), NCF_E_POINTER);
    EXPECT_EQ(other->GetDataOffset(1, 1, &large), NCF_E_POINTER);
    EXPECT_EQ(other->GetSampleFlags(1, 1, &number), NCF_E_POINTER);
    EXPECT_EQ(other->GetNextDiscontiguousDataAttributeChange(1, 1, &large), NCF_E_POINTER);
    EXPECT_EQ(other->GetDataSizePerSample(1, 1, &number), NCF_E_POINTER);
    EXPECT_EQ(other->GetDisplayOffset(1, 1, &time), NCF_E_POINTER);
    EXPECT_EQ(other->GetDecodeDuration(1, 1, &time), NCF_E_POINTER);
    EXPECT_EQ(other->GetMaxDataSizeInBytes(1, &number), NCF_E_POINTER);
    EXPECT_EQ(other->GetHasOutOfOrderFrameDependencies(1, &flag), NCF_E_POINTER);
    EXPECT_EQ(LastRecord(), "CHK_PTR(sampleTable_)OtherClip::GetHasOutOfOrderFrameDependencies");
}
