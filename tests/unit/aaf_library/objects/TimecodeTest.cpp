// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <algorithm>
#include <limits>

#include "aaf_library/model/PropertyKeys.h"
#include "tests/unit/aaf_library/objects/SavedFile.h"

// Timecode by offset, and timecode as it was recorded.
namespace aaf_test {

class TimecodeOffset : public SavedFile {
protected:
    Ptr<IAAFTimecode> Timecode(aafFrameOffset_t start, aafLength_t length, aafUInt16 fps = 25,
                               aafDropType_t drop = kAAFTcNonDrop) {
        Ptr<IAAFTimecode> made = Make<IAAFTimecode>(AUID_AAFTimecode);
        aafTimecode_t timecode{start, drop, fps};
        EXPECT_EQ(AAFRESULT_SUCCESS, made->Initialize(length, &timecode));
        return made;
    }
    Ptr<IAAFSequence> TwoStretches() {
        Ptr<IAAFSequence> sequence = Make<IAAFSequence>(AUID_AAFSequence);
        EXPECT_EQ(AAFRESULT_SUCCESS, sequence->Initialize(DataDef(kAAFDataDef_LegacyTimecode)));
        EXPECT_EQ(AAFRESULT_SUCCESS,
                  sequence->AppendComponent(As<IAAFComponent>(Timecode(1000, 10))));
        EXPECT_EQ(AAFRESULT_SUCCESS,
                  sequence->AppendComponent(As<IAAFComponent>(Timecode(5000, 10))));
        return sequence;
    }
    static HRESULT FrameAt(IAAFSegment* segment, aafPosition_t offset, aafFrameOffset_t* frame) {
        aafTimecode_t timecode{};
        const HRESULT result = segment->SegmentOffsetToTC(&offset, &timecode);
        *frame = timecode.startFrame;
        return result;
    }
    static HRESULT OffsetOf(IAAFSegment* segment, aafFrameOffset_t frame, aafFrameOffset_t* offset,
                            aafUInt16 fps = 25, aafRational_t rate = {25, 1},
                            aafDropType_t drop = kAAFTcNonDrop) {
        aafTimecode_t timecode{frame, drop, fps};
        return segment->SegmentTCToOffset(&timecode, &rate, offset);
    }
};

TEST_F(TimecodeOffset, OfASegmentIsFoundByItsTimecode) {
    Ptr<IAAFSegment> segment = As<IAAFSegment>(Timecode(1000, 10));
    aafFrameOffset_t offset = -1;
    EXPECT_EQ(AAFRESULT_SUCCESS, OffsetOf(segment, 1009, &offset));
    EXPECT_EQ(9, offset);
    EXPECT_EQ(AAFRESULT_BADSAMPLEOFFSET, OffsetOf(segment, 1010, &offset));
    EXPECT_EQ(AAFRESULT_BADSAMPLEOFFSET, OffsetOf(segment, 999, &offset));
    EXPECT_EQ(AAFRESULT_INVALID_TIMECODE, OffsetOf(segment, 1000, &offset, 30));
    EXPECT_EQ(AAFRESULT_INVALID_TIMECODE,
              OffsetOf(segment, 1000, &offset, 25, {25, 1}, kAAFTcDrop));
    EXPECT_EQ(AAFRESULT_BADRATE, OffsetOf(segment, 1000, &offset, 25, {25, 0}));
    // In another rate than the timecode counts; 29.97 counts 30.
    EXPECT_EQ(AAFRESULT_SUCCESS, OffsetOf(segment, 1009, &offset, 25, {50, 1}));
    EXPECT_EQ(18, offset);
    Ptr<IAAFSegment> drop = As<IAAFSegment>(Timecode(0, 1000, 30, kAAFTcDrop));
    EXPECT_EQ(AAFRESULT_SUCCESS, OffsetOf(drop, 999, &offset, 30, {30000, 1001}, kAAFTcDrop));
    EXPECT_EQ(999, offset);
    aafTimecode_t timecode{1000, kAAFTcNonDrop, 25};
    aafRational_t rate{25, 1};
    EXPECT_EQ(AAFRESULT_NULL_PARAM, segment->SegmentTCToOffset(nullptr, &rate, &offset));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, segment->SegmentTCToOffset(&timecode, nullptr, &offset));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, segment->SegmentTCToOffset(&timecode, &rate, nullptr));
    Ptr<IAAFSegment> bare = Make<IAAFSegment>(AUID_AAFTimecode);
    EXPECT_EQ(AAFRESULT_NOT_INITIALIZED, OffsetOf(bare, 1000, &offset));
}

TEST_F(TimecodeOffset, OfASequenceIsThatOfItsStretch) {
    AddComposition(TwoStretches());
    Ptr<IAAFSegment> segment = ReopenedSegment<IAAFSegment>();
    aafFrameOffset_t found = -1;
    EXPECT_EQ(AAFRESULT_SUCCESS, FrameAt(segment, 9, &found));
    EXPECT_EQ(1009, found);
    EXPECT_EQ(AAFRESULT_SUCCESS, FrameAt(segment, 10, &found));
    EXPECT_EQ(5000, found);
    EXPECT_EQ(AAFRESULT_BADSAMPLEOFFSET, FrameAt(segment, 20, &found));
    EXPECT_EQ(AAFRESULT_BADSAMPLEOFFSET, FrameAt(segment, -1, &found));
    EXPECT_EQ(AAFRESULT_SUCCESS, OffsetOf(segment, 5009, &found));
    EXPECT_EQ(19, found);
    EXPECT_EQ(AAFRESULT_SUCCESS, OffsetOf(segment, 1000, &found));
    EXPECT_EQ(0, found);
    EXPECT_EQ(AAFRESULT_BADSAMPLEOFFSET, OffsetOf(segment, 3000, &found));
    EXPECT_EQ(0, found);
    aafPosition_t offset = 0;
    aafTimecode_t timecode{};
    aafRational_t rate{25, 1};
    EXPECT_EQ(AAFRESULT_NULL_PARAM, segment->SegmentOffsetToTC(nullptr, &timecode));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, segment->SegmentOffsetToTC(&offset, nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, segment->SegmentTCToOffset(nullptr, &rate, &found));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, segment->SegmentTCToOffset(&timecode, nullptr, &found));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, segment->SegmentTCToOffset(&timecode, &rate, nullptr));
}

TEST_F(TimecodeOffset, TellsNothingWhereItWouldOverflow) {
    Ptr<IAAFSegment> segment = As<IAAFSegment>(Timecode(1000, 10));
    aafPosition_t offset = std::numeric_limits<aafPosition_t>::max();
    aafTimecode_t timecode{77, kAAFTcDrop, 30};
    EXPECT_EQ(AAFRESULT_INVALID_PARAM, segment->SegmentOffsetToTC(&offset, &timecode));
    EXPECT_EQ(77, timecode.startFrame);
    EXPECT_EQ(30, timecode.fps);
}

TEST_F(TimecodeOffset, IsThereInTimecodeOnly) {
    Ptr<IAAFSegment> clip = As<IAAFSegment>(Clip(10));
    aafFrameOffset_t found = -1;
    EXPECT_EQ(AAFRESULT_TIMECODE_NOT_FOUND, FrameAt(clip, 0, &found));
    EXPECT_EQ(AAFRESULT_TIMECODE_NOT_FOUND, OffsetOf(clip, 0, &found));
    aafPosition_t offset = 0;
    aafTimecode_t timecode{};
    aafRational_t rate{25, 1};
    EXPECT_EQ(AAFRESULT_NULL_PARAM, clip->SegmentOffsetToTC(nullptr, &timecode));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, clip->SegmentOffsetToTC(&offset, nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, clip->SegmentTCToOffset(nullptr, &rate, &found));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, clip->SegmentTCToOffset(&timecode, nullptr, &found));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, clip->SegmentTCToOffset(&timecode, &rate, nullptr));
}

TEST_F(TimecodeOffset, OfAMobIsThatOfItsFirstTimecode) {
    Ptr<IAAFMob> mob = Make<IAAFMob>(AUID_AAFCompositionMob);
    aafPosition_t offset = 12;
    aafTimecode_t timecode{};
    EXPECT_EQ(AAFRESULT_TIMECODE_NOT_FOUND, mob->OffsetToMobTimecode(nullptr, &offset, &timecode));
    Ptr<IAAFTimelineMobSlot> slot;
    ASSERT_EQ(AAFRESULT_SUCCESS, mob->AppendNewTimelineSlot({25, 1}, As<IAAFSegment>(Clip(10)), 1,
                                                            L"V1", 0, slot.Out()));
    EXPECT_EQ(AAFRESULT_TIMECODE_NOT_FOUND, mob->OffsetToMobTimecode(nullptr, &offset, &timecode));
    ASSERT_EQ(AAFRESULT_SUCCESS,
              mob->AppendNewTimelineSlot({25, 1}, As<IAAFSegment>(TwoStretches()), 2, L"TC", 0,
                                         slot.Out()));
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->OffsetToMobTimecode(nullptr, &offset, &timecode));
    EXPECT_EQ(5002, timecode.startFrame);
    EXPECT_EQ(25, timecode.fps);
    // A segment of the caller's choice.
    Ptr<IAAFSegment> other = As<IAAFSegment>(Timecode(70, 100));
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->OffsetToMobTimecode(other, &offset, &timecode));
    EXPECT_EQ(82, timecode.startFrame);
    offset = 20;
    EXPECT_EQ(AAFRESULT_BADSAMPLEOFFSET, mob->OffsetToMobTimecode(nullptr, &offset, &timecode));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, mob->OffsetToMobTimecode(nullptr, nullptr, &timecode));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, mob->OffsetToMobTimecode(nullptr, &offset, nullptr));
}

TEST_F(TimecodeOffset, OfAMobIsFoundBehindAShorterPicture) {
    Ptr<IAAFMob> mob = Make<IAAFMob>(AUID_AAFCompositionMob);
    const auto append = [&](IAAFSequence* sequence, aafSlotID_t id) {
        Ptr<IAAFTimelineMobSlot> slot;
        ASSERT_EQ(AAFRESULT_SUCCESS, mob->AppendNewTimelineSlot({25, 1}, As<IAAFSegment>(sequence),
                                                                id, L"", 0, slot.Out()));
    };
    Ptr<IAAFSequence> empty = Make<IAAFSequence>(AUID_AAFSequence);
    ASSERT_EQ(AAFRESULT_SUCCESS, empty->Initialize(DataDef(kAAFDataDef_LegacyPicture)));
    Ptr<IAAFSequence> picture = Make<IAAFSequence>(AUID_AAFSequence);
    ASSERT_EQ(AAFRESULT_SUCCESS, picture->Initialize(DataDef(kAAFDataDef_LegacyPicture)));
    ASSERT_EQ(AAFRESULT_SUCCESS, picture->AppendComponent(As<IAAFComponent>(Clip(10))));
    append(empty, 1);
    append(picture, 2);
    append(TwoStretches(), 3);
    aafPosition_t offset = 12;
    aafTimecode_t timecode{};
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->OffsetToMobTimecode(nullptr, &offset, &timecode));
    EXPECT_EQ(5002, timecode.startFrame);
    aafFrameOffset_t found = -1;
    EXPECT_EQ(AAFRESULT_TIMECODE_NOT_FOUND, FrameAt(As<IAAFSegment>(empty), 0, &found));
    EXPECT_EQ(AAFRESULT_TIMECODE_NOT_FOUND, FrameAt(As<IAAFSegment>(picture), 12, &found));
}

// Why a timecode isn't there is told by the timecode, not by what stands behind it.
TEST_F(TimecodeOffset, OfASequenceIsMissedInItsTimecode) {
    Ptr<IAAFSequence> sequence = TwoStretches();
    ASSERT_EQ(AAFRESULT_SUCCESS, sequence->AppendComponent(Filler(10, kAAFDataDef_LegacyTimecode)));
    aafFrameOffset_t found = -1;
    EXPECT_EQ(AAFRESULT_BADSAMPLEOFFSET, OffsetOf(As<IAAFSegment>(sequence), 3000, &found));
    EXPECT_EQ(AAFRESULT_TIMECODE_NOT_FOUND, FrameAt(As<IAAFSegment>(sequence), 25, &found));
    EXPECT_EQ(AAFRESULT_BADSAMPLEOFFSET, FrameAt(As<IAAFSegment>(sequence), 30, &found));
}

class RecordedTimecode : public SavedFile {
protected:
    Ptr<IAAFTimecodeStream> Stream(aafRational_t rate) {
        Ptr<IAAFTimecodeStream> made = Make<IAAFTimecodeStream>(AUID_AAFTimecodeStream12M);
        Ptr<IAAFComponent> component = As<IAAFComponent>(made);
        EXPECT_EQ(AAFRESULT_SUCCESS, component->SetDataDef(DataDef(kAAFDataDef_LegacyTimecode)));
        EXPECT_EQ(AAFRESULT_SUCCESS, component->SetLength(100));
        EXPECT_EQ(AAFRESULT_SUCCESS, made->SetSampleRate(rate));
        EXPECT_EQ(AAFRESULT_SUCCESS, made->SetSourceType(kAAFTimecodeLTC));
        return made;
    }
    void IncludeSync(IAAFTimecodeStream* stream) {
        constexpr aafUID_t kIncludeSync = ncfGuid("04040101-0400-0000-060E-2B3401010101");
        Ptr<IAAFObject> object = As<IAAFObject>(stream);
        Ptr<IAAFPropertyDef> property = Get(Get(object, &IAAFObject::GetDefinition),
                                            &IAAFClassDef::LookupPropertyDef, kIncludeSync);
        Ptr<IAAFTypeDefEnum> type =
            As<IAAFTypeDefEnum>(Get(property, &IAAFPropertyDef::GetTypeDef));
        Ptr<IAAFPropertyValue> value;
        ASSERT_EQ(AAFRESULT_SUCCESS, type->CreateValueFromName(L"True", value.Out()));
        ASSERT_EQ(AAFRESULT_SUCCESS, object->SetPropertyValue(property, value));
    }
    static aafFrameOffset_t FrameAt(IAAFTimecodeStream* stream, aafPosition_t position) {
        aafTimecode_t timecode{};
        EXPECT_EQ(AAFRESULT_SUCCESS, stream->GetPositionTimecode(position, &timecode));
        return timecode.startFrame;
    }
    static std::vector<int> Words(IAAFTimecodeStream* stream) {
        std::vector<aafUInt8> bytes(Get(stream, &IAAFTimecodeStream::GetSourceBufLen));
        aafUInt32 read = 0;
        EXPECT_EQ(AAFRESULT_SUCCESS,
                  stream->GetSource(static_cast<aafUInt32>(bytes.size()), bytes.data(), &read));
        EXPECT_EQ(bytes.size(), read);
        return {bytes.begin(), bytes.end()};
    }
};

TEST_F(RecordedTimecode, HasAWordForEachFrame) {
    Ptr<IAAFTimecodeStream> stream = Stream({25, 1});
    EXPECT_EQ(8u, Get(stream, &IAAFTimecodeStream::GetSampleSize));
    const aafFrameOffset_t start = ((12 * 60 + 34) * 60 + 56) * 25 + 18;
    ASSERT_EQ(AAFRESULT_SUCCESS, stream->SetPositionTimecode(0, {start, kAAFTcNonDrop, 25}));
    aafUInt8 user[4] = {0x21, 0x43, 0x65, 0x87};
    ASSERT_EQ(AAFRESULT_SUCCESS, stream->SetUserDataAtPosition(0, 4, user));
    EXPECT_EQ((std::vector<int>{0x18, 0x21, 0x36, 0x45, 0x54, 0x63, 0x72, 0x81}), Words(stream));
    // Either leaves the other alone.
    ASSERT_EQ(AAFRESULT_SUCCESS, stream->SetPositionTimecode(0, {start + 1, kAAFTcNonDrop, 25}));
    aafUInt8 found[4] = {};
    EXPECT_EQ(AAFRESULT_SUCCESS, stream->GetUserDataAtPosition(0, 4, found));
    EXPECT_TRUE(std::equal(user, user + 4, found));
    ASSERT_EQ(AAFRESULT_SUCCESS, stream->SetPositionTimecode(1, {start + 2, kAAFTcNonDrop, 25}));
    AddComposition(stream);
    Ptr<IAAFTimecodeStream> read = ReopenedSegment<IAAFTimecodeStream>();
    EXPECT_EQ(16u, Words(read).size());
    EXPECT_EQ(start + 1, FrameAt(read, 0));
    EXPECT_EQ(start + 2, FrameAt(read, 1));
    aafTimecode_t timecode{};
    EXPECT_EQ(AAFRESULT_SUCCESS, read->GetPositionTimecode(0, &timecode));
    EXPECT_EQ(25, timecode.fps);
    EXPECT_EQ(kAAFTcNonDrop, timecode.drop);
}

TEST_F(RecordedTimecode, DropsNumbers) {
    Ptr<IAAFTimecodeStream> stream = Stream({30000, 1001});
    const std::vector<std::pair<aafFrameOffset_t, std::vector<int>>> cases = {
        {1799, {9, 2 + 4, 9, 5, 0, 0, 0, 0}},     // 00:00:59;29
        {1800, {2, 0 + 4, 0, 0, 1, 0, 0, 0}},     // 00:01:00;02
        {3597, {9, 2 + 4, 9, 5, 1, 0, 0, 0}},     // 00:01:59;29
        {3598, {2, 0 + 4, 0, 0, 2, 0, 0, 0}},     // 00:02:00;02
        {17981, {9, 2 + 4, 9, 5, 9, 0, 0, 0}},    // 00:09:59;29
        {17982, {0, 0 + 4, 0, 0, 0, 1, 0, 0}},    // 00:10:00;00
        {2589407, {9, 2 + 4, 9, 5, 9, 5, 3, 2}},  // 23:59:59;29
    };
    for (const auto& [frame, word] : cases) {
        ASSERT_EQ(AAFRESULT_SUCCESS, stream->SetPositionTimecode(0, {frame, kAAFTcDrop, 30}));
        EXPECT_EQ(word, Words(stream)) << frame;
        EXPECT_EQ(frame, FrameAt(stream, 0));
    }
    EXPECT_EQ(AAFRESULT_INVALID_TIMECODE,
              stream->SetPositionTimecode(0, {2589408, kAAFTcDrop, 30}));
    for (aafFrameOffset_t frame = 0; frame < 2589408; frame += 997) {
        ASSERT_EQ(AAFRESULT_SUCCESS, stream->SetPositionTimecode(0, {frame, kAAFTcDrop, 30}));
        ASSERT_EQ(frame, FrameAt(stream, 0));
    }
}

TEST_F(RecordedTimecode, MayTellWhereAWordStarts) {
    Ptr<IAAFTimecodeStream> stream = Stream({25, 1});
    IncludeSync(stream);
    EXPECT_EQ(10u, Get(stream, &IAAFTimecodeStream::GetSampleSize));
    ASSERT_EQ(AAFRESULT_SUCCESS, stream->SetPositionTimecode(0, {1, kAAFTcNonDrop, 25}));
    ASSERT_EQ(AAFRESULT_SUCCESS, stream->SetPositionTimecode(1, {2, kAAFTcNonDrop, 25}));
    EXPECT_EQ((std::vector<int>{1, 0, 0, 0, 0, 0, 0, 0, 0xFC, 0xBF,  //
                                2, 0, 0, 0, 0, 0, 0, 0, 0xFC, 0xBF}),
              Words(stream));
    EXPECT_EQ(2, FrameAt(stream, 1));
}

TEST_F(RecordedTimecode, ChecksItsArguments) {
    Ptr<IAAFTimecodeStream> stream = Make<IAAFTimecodeStream>(AUID_AAFTimecodeStream12M);
    aafTimecode_t timecode{};
    aafUInt32 size = 0;
    aafUInt32 read = 0;
    aafUInt8 bytes[8] = {};
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, stream->GetPositionTimecode(0, &timecode));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, stream->GetUserDataAtPosition(0, 4, bytes));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, stream->GetSourceBufLen(&size));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, stream->GetSource(8, bytes, &read));
    EXPECT_EQ(AAFRESULT_BADRATE, stream->SetPositionTimecode(0, {0, kAAFTcNonDrop, 25}));
    EXPECT_EQ(AAFRESULT_SUCCESS, stream->SetSource(8, bytes));
    EXPECT_EQ(AAFRESULT_BADRATE, stream->GetPositionTimecode(0, &timecode));
    stream = Stream({25, 1});
    EXPECT_EQ(AAFRESULT_SUCCESS, stream->SetSource(8, bytes));
    EXPECT_EQ(AAFRESULT_SMALLBUF, stream->GetSource(7, bytes, &read));
    for (const aafTimecode_t& odd :
         {aafTimecode_t{-1, kAAFTcNonDrop, 25}, aafTimecode_t{24 * 3600 * 25, kAAFTcNonDrop, 25},
          aafTimecode_t{0, kAAFTcNonDrop, 30}, aafTimecode_t{0, 2, 25}}) {
        EXPECT_EQ(AAFRESULT_INVALID_TIMECODE, stream->SetPositionTimecode(0, odd));
    }
    // Forty frames are what a word can count.
    EXPECT_EQ(AAFRESULT_INVALID_TIMECODE,
              Stream({50, 1})->SetPositionTimecode(0, {0, kAAFTcNonDrop, 50}));
    EXPECT_EQ(AAFRESULT_BADSAMPLEOFFSET, stream->SetPositionTimecode(2, {0, kAAFTcNonDrop, 25}));
    EXPECT_EQ(AAFRESULT_BADSAMPLEOFFSET, stream->SetPositionTimecode(-1, {0, kAAFTcNonDrop, 25}));
    EXPECT_EQ(AAFRESULT_BADSAMPLEOFFSET, stream->GetPositionTimecode(1, &timecode));
    EXPECT_EQ(AAFRESULT_BADSAMPLEOFFSET, stream->GetUserDataAtPosition(1, 4, bytes));
    EXPECT_EQ(AAFRESULT_BADSAMPLEOFFSET, stream->SetUserDataAtPosition(2, 4, bytes));
    EXPECT_EQ(4, Get(stream, &IAAFTimecodeStream::GetUserDataLength));
    EXPECT_EQ(AAFRESULT_SMALLBUF, stream->GetUserDataAtPosition(0, 3, bytes));
    EXPECT_EQ(AAFRESULT_INVALID_PARM_SIZE, stream->SetUserDataAtPosition(0, 3, bytes));
    EXPECT_EQ(AAFRESULT_INVALID_PARM_SIZE, stream->SetUserDataAtPosition(0, 5, bytes));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, stream->GetPositionTimecode(0, nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, stream->GetUserDataLength(nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, stream->GetUserDataAtPosition(0, 4, nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, stream->SetUserDataAtPosition(0, 4, nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, stream->GetSampleSize(nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, stream->GetSource(8, nullptr, &read));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, stream->GetSource(8, bytes, nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, stream->GetSourceBufLen(nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, stream->SetSource(8, nullptr));
}

// A recording of 25 frames has a flag in the place where one of 30 tells that it drops numbers.
TEST_F(RecordedTimecode, DropsNumbersOfThirtyFramesOnly) {
    Ptr<IAAFTimecodeStream> stream = Stream({25, 1});
    EXPECT_EQ(AAFRESULT_INVALID_TIMECODE, stream->SetPositionTimecode(0, {5000, kAAFTcDrop, 25}));
    ASSERT_EQ(AAFRESULT_SUCCESS, stream->SetPositionTimecode(0, {5000, kAAFTcNonDrop, 25}));
    std::vector<int> word = Words(stream);
    std::vector<aafUInt8> flagged(word.begin(), word.end());
    flagged[1] |= 0x04;
    ASSERT_EQ(AAFRESULT_SUCCESS, stream->SetSource(8, flagged.data()));
    aafTimecode_t found{};
    EXPECT_EQ(AAFRESULT_SUCCESS, stream->GetPositionTimecode(0, &found));
    EXPECT_EQ(5000, found.startFrame);
    EXPECT_EQ(kAAFTcNonDrop, found.drop);
}

// Whoever reads the stream by its value stands at the end of what is there now.
TEST_F(RecordedTimecode, MayBecomeShorterWhileItIsRead) {
    Ptr<IAAFTimecodeStream> stream = Stream({25, 1});
    aafUInt8 bytes[16] = {};
    ASSERT_EQ(AAFRESULT_SUCCESS, stream->SetSource(16, bytes));
    Ptr<IAAFObject> object = As<IAAFObject>(stream);
    Ptr<IAAFPropertyDef> source =
        Get(Get(object, &IAAFObject::GetDefinition), &IAAFClassDef::LookupPropertyDef,
            aaf::prop::TimecodeStream_Source.id);
    Ptr<IAAFPropertyValue> value = Get(object, &IAAFObject::GetPropertyValue, source);
    Ptr<IAAFTypeDefStream> type = As<IAAFTypeDefStream>(Get(source, &IAAFPropertyDef::GetTypeDef));
    ASSERT_EQ(AAFRESULT_SUCCESS, type->SetPosition(value, 16));
    ASSERT_EQ(AAFRESULT_SUCCESS, stream->SetSource(4, bytes));
    aafInt64 position = 0;
    EXPECT_EQ(AAFRESULT_SUCCESS, type->GetPosition(value, &position));
    EXPECT_EQ(4, position);
    aafUInt32 read = 0;
    EXPECT_EQ(AAFRESULT_END_OF_DATA, type->Read(value, sizeof bytes, bytes, &read));
    Ptr<IAAFTypeDef> number = Get(dictionary_, &IAAFDictionary::LookupTypeDef, kAAFTypeID_UInt32);
    EXPECT_EQ(AAFRESULT_END_OF_DATA, type->ReadElements(value, number, sizeof bytes, bytes, &read));
    EXPECT_EQ(0u, read);
}

}  // namespace aaf_test
