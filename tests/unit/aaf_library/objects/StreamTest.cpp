// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <algorithm>

#include "tests/unit/aaf_library/objects/SavedFile.h"

// Bulk data in an object: beside essence, in sound descriptors and in chunks of wave files; and
// what the channels of a digital interface say.
namespace aaf_test {

namespace {

// The five operations of one stream.
template <class T>
struct StreamOf {
    HRESULT (T::*write)(aafUInt32, aafDataBuffer_t, aafUInt32*);
    HRESULT (T::*read)(aafUInt32, aafDataBuffer_t, aafUInt32*);
    HRESULT (T::*setPosition)(aafPosition_t);
    HRESULT (T::*getPosition)(aafPosition_t*);
    HRESULT (T::*getSize)(aafLength_t*);
};

constexpr StreamOf<IAAFEssenceDataEx> kSampleIndex{
    &IAAFEssenceDataEx::WriteSampleIndex, &IAAFEssenceDataEx::ReadSampleIndex,
    &IAAFEssenceDataEx::SetSampleIndexPosition, &IAAFEssenceDataEx::GetSampleIndexPosition,
    &IAAFEssenceDataEx::GetSampleIndexSize};
constexpr StreamOf<IAAFPCMDescriptor> kPeaks{
    &IAAFPCMDescriptor::WritePeakEnvelopeData, &IAAFPCMDescriptor::ReadPeakEnvelopeData,
    &IAAFPCMDescriptor::SetPeakEnvelopeDataPosition,
    &IAAFPCMDescriptor::GetPeakEnvelopeDataPosition, &IAAFPCMDescriptor::GetPeakEnvelopeDataSize};
constexpr StreamOf<IAAFRIFFChunk> kChunk{&IAAFRIFFChunk::Write, &IAAFRIFFChunk::Read,
                                         &IAAFRIFFChunk::SetPosition, &IAAFRIFFChunk::GetPosition,
                                         &IAAFRIFFChunk::GetLength};

template <class T>
void Write(T* object, const StreamOf<T>& stream, std::string text) {
    aafUInt32 written = 0;
    EXPECT_EQ(AAFRESULT_SUCCESS,
              (object->*stream.write)(static_cast<aafUInt32>(text.size()),
                                      reinterpret_cast<aafDataBuffer_t>(text.data()), &written));
    EXPECT_EQ(text.size(), written);
}

// From the position on.
template <class T>
std::string Read(T* object, const StreamOf<T>& stream, aafUInt32 bytes) {
    std::string text(bytes, '?');
    aafUInt32 read = 0;
    EXPECT_EQ(AAFRESULT_SUCCESS,
              (object->*stream.read)(bytes, reinterpret_cast<aafDataBuffer_t>(text.data()), &read));
    text.resize(read);
    return text;
}

// Before anything is written nothing is there; then one position serves reading and writing.
template <class T>
void ExpectAStream(T* object, const StreamOf<T>& stream, HRESULT absent) {
    aafPosition_t position = 0;
    aafLength_t size = 0;
    aafUInt32 count = 0;
    aafUInt8 byte = 0;
    if (absent != AAFRESULT_SUCCESS) {
        EXPECT_EQ(absent, (object->*stream.getPosition)(&position));
        EXPECT_EQ(absent, (object->*stream.setPosition)(0));
        EXPECT_EQ(absent, (object->*stream.getSize)(&size));
        EXPECT_EQ(absent, (object->*stream.read)(1, &byte, &count));
    }
    EXPECT_EQ(AAFRESULT_NULL_PARAM, (object->*stream.write)(1, nullptr, &count));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, (object->*stream.write)(1, &byte, nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, (object->*stream.read)(1, nullptr, &count));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, (object->*stream.read)(1, &byte, nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, (object->*stream.getPosition)(nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, (object->*stream.getSize)(nullptr));
    Write(object, stream, "stream");
    EXPECT_EQ(AAFRESULT_SUCCESS, (object->*stream.getPosition)(&position));
    EXPECT_EQ(6, position);
    EXPECT_EQ(AAFRESULT_END_OF_DATA, (object->*stream.read)(1, &byte, &count));
    EXPECT_EQ(AAFRESULT_BADSAMPLEOFFSET, (object->*stream.setPosition)(7));
    EXPECT_EQ(AAFRESULT_BADSAMPLEOFFSET, (object->*stream.setPosition)(-1));
    EXPECT_EQ(AAFRESULT_SUCCESS, (object->*stream.setPosition)(4));
    Write(object, stream, "ets");
    EXPECT_EQ(AAFRESULT_SUCCESS, (object->*stream.getSize)(&size));
    EXPECT_EQ(7, size);
    EXPECT_EQ(AAFRESULT_SUCCESS, (object->*stream.setPosition)(1));
    EXPECT_EQ("tre", Read(object, stream, 3));
    EXPECT_EQ("ets", Read(object, stream, 9));
}

}  // namespace

class Stream : public SavedFile {
protected:
    // A source mob with that descriptor in a copy on disk.
    Ptr<IAAFEssenceDescriptor> ReopenedDescriptor(IUnknown* descriptor) {
        Ptr<IAAFMob> mob = FileMob(1);
        EXPECT_EQ(AAFRESULT_SUCCESS, As<IAAFSourceMob>(mob)->SetEssenceDescriptor(
                                         As<IAAFEssenceDescriptor>(descriptor)));
        EXPECT_EQ(AAFRESULT_SUCCESS, header_->AddMob(mob));
        read_ = Reopen();
        return Get(As<IAAFSourceMob>(Get(read_, &IAAFHeader::LookupMob, MobId(1))),
                   &IAAFSourceMob::GetEssenceDescriptor);
    }
    void TearDown() override { read_.Reset(); }

    Ptr<IAAFHeader> read_;
};

TEST_F(Stream, OfTheSampleIndexIsStored) {
    Ptr<IAAFMob> mob = FileMob(1);
    ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddMob(mob));
    Ptr<IAAFEssenceData> data = Make<IAAFEssenceData>(AUID_AAFEssenceData);
    ASSERT_EQ(AAFRESULT_SUCCESS, data->Initialize(As<IAAFSourceMob>(mob)));
    ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddEssenceData(data));
    ExpectAStream(As<IAAFEssenceDataEx>(data).get(), kSampleIndex, AAFRESULT_PROP_NOT_PRESENT);
    EXPECT_EQ(7, Get(As<IAAFEssenceData2>(data), &IAAFEssenceData2::GetSampleIndexSize));
    Ptr<IAAFHeader> file = Reopen();
    Ptr<IAAFEssenceDataEx> read =
        As<IAAFEssenceDataEx>(Get(file, &IAAFHeader::LookupEssenceData, MobId(1)));
    EXPECT_EQ("streets", Read(read.get(), kSampleIndex, 9));
    // A file leaves an empty stream out.
    EXPECT_EQ(0, Get(As<IAAFEssenceData>(read), &IAAFEssenceData::GetSize));
}

TEST_F(Stream, OfSoundPeaksIsStored) {
    Ptr<IAAFPCMDescriptor> sound = Make<IAAFPCMDescriptor>(AUID_AAFPCMDescriptor);
    aafUInt32 count = 0;
    aafUInt8 byte = 0;
    aafPosition_t position = 0;
    EXPECT_EQ(AAFRESULT_NOT_INITIALIZED, sound->WritePeakEnvelopeData(1, &byte, &count));
    EXPECT_EQ(AAFRESULT_NOT_INITIALIZED, sound->ReadPeakEnvelopeData(1, &byte, &count));
    EXPECT_EQ(AAFRESULT_NOT_INITIALIZED, sound->SetPeakEnvelopeDataPosition(0));
    EXPECT_EQ(AAFRESULT_NOT_INITIALIZED, sound->GetPeakEnvelopeDataPosition(&position));
    EXPECT_EQ(AAFRESULT_NOT_INITIALIZED, sound->GetPeakEnvelopeDataSize(&position));
    ASSERT_EQ(AAFRESULT_SUCCESS, sound->Initialize());
    ExpectAStream(sound.get(), kPeaks, AAFRESULT_PROP_NOT_PRESENT);
    Ptr<IAAFPCMDescriptor> read = As<IAAFPCMDescriptor>(ReopenedDescriptor(sound));
    EXPECT_EQ("streets", Read(read.get(), kPeaks, 9));
}

TEST_F(Stream, OfAChunkTellsItsLength) {
    Ptr<IAAFBWFImportDescriptor> import =
        Make<IAAFBWFImportDescriptor>(AUID_AAFBWFImportDescriptor);
    Ptr<IAAFRIFFChunk> chunk = Make<IAAFRIFFChunk>(AUID_AAFRIFFChunk);
    ASSERT_EQ(AAFRESULT_SUCCESS, chunk->Initialize(0x6D786C69));
    EXPECT_EQ(0, Get(chunk, &IAAFRIFFChunk::GetLength));
    EXPECT_EQ(0, Get(chunk, &IAAFRIFFChunk::GetPosition));
    ExpectAStream(chunk.get(), kChunk, AAFRESULT_SUCCESS);
    ASSERT_EQ(AAFRESULT_SUCCESS, import->AppendUnknownBWFChunk(chunk));
    Ptr<IAAFRIFFChunk> unused = Make<IAAFRIFFChunk>(AUID_AAFRIFFChunk);
    ASSERT_EQ(AAFRESULT_SUCCESS, unused->Initialize(1));
    ASSERT_EQ(AAFRESULT_SUCCESS, import->AppendUnknownBWFChunk(unused));
    Ptr<IAAFBWFImportDescriptor> read = As<IAAFBWFImportDescriptor>(ReopenedDescriptor(import));
    Ptr<IAAFRIFFChunk> found =
        Get(read, &IAAFBWFImportDescriptor::GetUnknownBWFChunkAt, aafUInt32{0});
    EXPECT_EQ(0x6D786C69u, Get(found, &IAAFRIFFChunk::GetChunkID));
    EXPECT_EQ(7, Get(found, &IAAFRIFFChunk::GetLength));
    EXPECT_EQ("streets", Read(found.get(), kChunk, 9));
    Ptr<IAAFRIFFChunk> empty =
        Get(read, &IAAFBWFImportDescriptor::GetUnknownBWFChunkAt, aafUInt32{1});
    EXPECT_EQ(0, Get(empty, &IAAFRIFFChunk::GetLength));
    EXPECT_EQ(0, Get(empty, &IAAFRIFFChunk::GetPosition));
    EXPECT_EQ(AAFRESULT_SUCCESS, empty->SetPosition(0));
    aafUInt32 count = 0;
    aafUInt8 byte = 0;
    EXPECT_EQ(AAFRESULT_END_OF_DATA, empty->Read(1, &byte, &count));
}

TEST_F(Stream, OfAChunkIsEmptyOnceInitializedAgain) {
    Ptr<IAAFRIFFChunk> chunk = Make<IAAFRIFFChunk>(AUID_AAFRIFFChunk);
    ASSERT_EQ(AAFRESULT_SUCCESS, chunk->Initialize(1));
    Write(chunk.get(), kChunk, "stream");
    EXPECT_EQ(AAFRESULT_SUCCESS, chunk->Initialize(2));
    EXPECT_EQ(2u, Get(chunk, &IAAFRIFFChunk::GetChunkID));
    EXPECT_EQ(0, Get(chunk, &IAAFRIFFChunk::GetLength));
    EXPECT_EQ(0, Get(chunk, &IAAFRIFFChunk::GetPosition));
    Write(chunk.get(), kChunk, "x");
    EXPECT_EQ(1, Get(chunk, &IAAFRIFFChunk::GetLength));
}

TEST_F(Stream, ChannelsOfADigitalInterfaceAreStored) {
    Ptr<IAAFAES3PCMDescriptor2> sound = Make<IAAFAES3PCMDescriptor2>(AUID_AAFAES3PCMDescriptor);
    ASSERT_EQ(AAFRESULT_SUCCESS, sound->Initialize());
    aafChannelStatusModeType_t status = 0;
    aafUserDataModeType_t user = 0;
    aafUInt8 block[24];
    std::fill_n(block, sizeof block, aafUInt8{0xA5});
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, sound->GetChannelStatusModeAt(0, &status));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, sound->GetUserDataModeAt(0, &user));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, sound->GetFixedUserDataAt(0, sizeof block, block));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT,
              sound->GetFixedChannelStatusDataAt(0, sizeof block, block));
    EXPECT_EQ(AAFRESULT_BADINDEX, sound->SetChannelStatusModeAt(1, kAAFChannelStatusMode_None));
    EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE, sound->SetChannelStatusModeAt(0, 6));
    EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE, sound->SetUserDataModeAt(0, 16));
    EXPECT_EQ(AAFRESULT_SMALLBUF, sound->SetFixedUserDataAt(0, 23, block));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, sound->SetFixedChannelStatusDataAt(0, 24, nullptr));
    EXPECT_EQ(AAFRESULT_SUCCESS, sound->SetChannelStatusModeAt(0, kAAFChannelStatusMode_Standard));
    EXPECT_EQ(AAFRESULT_SUCCESS, sound->SetChannelStatusModeAt(1, kAAFChannelStatusMode_Fixed));
    EXPECT_EQ(AAFRESULT_SUCCESS, sound->SetChannelStatusModeAt(0, kAAFChannelStatusMode_Minimum));
    EXPECT_EQ(AAFRESULT_SUCCESS, sound->SetUserDataModeAt(0, kAAFUserDataMode_AES18));
    EXPECT_EQ(AAFRESULT_SUCCESS, sound->SetFixedUserDataAt(0, sizeof block, block));
    EXPECT_EQ(AAFRESULT_SUCCESS, sound->SetFixedChannelStatusDataAt(0, sizeof block, block));
    std::fill_n(block, sizeof block, aafUInt8{0x5A});
    EXPECT_EQ(AAFRESULT_SUCCESS, sound->SetFixedChannelStatusDataAt(1, sizeof block, block));

    Ptr<IAAFAES3PCMDescriptor2> read = As<IAAFAES3PCMDescriptor2>(ReopenedDescriptor(sound));
    EXPECT_EQ(AAFRESULT_SUCCESS, read->GetChannelStatusModeAt(0, &status));
    EXPECT_EQ(kAAFChannelStatusMode_Minimum, status);
    EXPECT_EQ(AAFRESULT_SUCCESS, read->GetChannelStatusModeAt(1, &status));
    EXPECT_EQ(kAAFChannelStatusMode_Fixed, status);
    EXPECT_EQ(AAFRESULT_BADINDEX, read->GetChannelStatusModeAt(2, &status));
    EXPECT_EQ(AAFRESULT_SUCCESS, read->GetUserDataModeAt(0, &user));
    EXPECT_EQ(kAAFUserDataMode_AES18, user);
    aafUInt8 found[24] = {};
    EXPECT_EQ(AAFRESULT_SMALLBUF, read->GetFixedUserDataAt(0, 23, found));
    EXPECT_EQ(AAFRESULT_SUCCESS, read->GetFixedUserDataAt(0, 24, found));
    EXPECT_EQ(24, std::count(found, found + 24, 0xA5));
    EXPECT_EQ(AAFRESULT_SUCCESS, read->GetFixedChannelStatusDataAt(1, 24, found));
    EXPECT_EQ(24, std::count(found, found + 24, 0x5A));
    EXPECT_EQ(AAFRESULT_SUCCESS, read->GetFixedChannelStatusDataAt(0, 24, found));
    EXPECT_EQ(24, std::count(found, found + 24, 0xA5));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, read->GetChannelStatusModeAt(0, nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, read->GetUserDataModeAt(0, nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, read->GetFixedUserDataAt(0, 24, nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, read->GetFixedChannelStatusDataAt(0, 24, nullptr));
}

}  // namespace aaf_test
