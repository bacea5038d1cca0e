// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/aaf/AAFDefinitions.h"
#include "host_interfaces/aaf/AAFDescriptors.h"
#include "host_interfaces/aaf/AAFPictureDescriptors.h"
#include "host_interfaces/aaf/AAFSoundDescriptors.h"
#include "tests/unit/aaf_library/objects/TransientFile.h"

namespace aaf_test {

using Descriptor = TransientFile;

namespace {

const aafUID_t kSomeId = ncfGuid("04010202-0103-0101-060E-2B3404010101");

}  // namespace

TEST_F(Descriptor, OfAFileStartsWithoutRateLengthAndContainer) {
    for (const aafUID_t& id : {AUID_AAFCDCIDescriptor, AUID_AAFPCMDescriptor,
                               AUID_AAFMultipleDescriptor, AUID_AAFRGBADescriptor}) {
        Ptr<IAAFFileDescriptor2> file = Make<IAAFFileDescriptor2>(id);
        aafRational_t rate{9, 9};
        aafUInt32 slot = 0;
        Ptr<IAAFContainerDef> container;
        Ptr<IAAFCodecDef> codec;
        EXPECT_EQ(AAFRESULT_SUCCESS, file->GetSampleRate(&rate));
        EXPECT_EQ(0, rate.numerator);
        EXPECT_EQ(0, rate.denominator);
        EXPECT_EQ(0, Get(file, &IAAFFileDescriptor2::GetLength));
        EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, file->GetContainerFormat(container.Out()));
        EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, file->GetCodecDef(codec.Out()));
        EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, file->GetLinkedSlotID(&slot));
        EXPECT_EQ(AAFRESULT_SUCCESS, file->SetLength(-5));
        EXPECT_EQ(-5, Get(file, &IAAFFileDescriptor2::GetLength));
        EXPECT_EQ(AAFRESULT_SUCCESS, file->SetSampleRate({30000, 1001}));
        EXPECT_EQ(AAFRESULT_SUCCESS, file->GetSampleRate(&rate));
        EXPECT_EQ(1001, rate.denominator);
        EXPECT_EQ(AAFRESULT_SUCCESS, file->SetLinkedSlotID(3));
        EXPECT_EQ(3u, Get(file, &IAAFFileDescriptor2::GetLinkedSlotID));
    }
}

TEST_F(Descriptor, TakesContainersThatTheDictionaryHas) {
    Ptr<IAAFFileDescriptor> file = Make<IAAFFileDescriptor>(AUID_AAFCDCIDescriptor);
    Ptr<IAAFContainerDef> container = Make<IAAFContainerDef>(AUID_AAFContainerDef);
    const aafUID_t id = ncfGuid("ABCDEF00-0000-0000-0000-000000000002");
    ASSERT_EQ(AAFRESULT_SUCCESS, container->Initialize(id, L"", L""));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, file->SetContainerFormat(nullptr));
    EXPECT_EQ(AAFRESULT_INVALID_OBJ, file->SetContainerFormat(container));
    ASSERT_EQ(AAFRESULT_SUCCESS, dictionary_->RegisterContainerDef(container));
    EXPECT_EQ(AAFRESULT_SUCCESS, file->SetContainerFormat(container));
    Ptr<IAAFContainerDef> found = Get(file, &IAAFFileDescriptor::GetContainerFormat);
    EXPECT_EQ(container.get(), found.get());
}

TEST_F(Descriptor, OfAPictureHasTheUsualDefaults) {
    Ptr<IAAFDigitalImageDescriptor2> image =
        Make<IAAFDigitalImageDescriptor2>(AUID_AAFCDCIDescriptor);
    aafUInt32 height = 9;
    aafUInt32 width = 9;
    aafInt32 x = 9;
    aafInt32 y = 9;
    aafInt32 lines[2] = {9, 9};
    aafRational_t aspect{9, 9};
    aafUID_t id{};
    EXPECT_EQ(AAFRESULT_SUCCESS, image->GetStoredView(&height, &width));
    EXPECT_EQ(0u, height);
    EXPECT_EQ(0u, width);
    EXPECT_EQ(kAAFFullFrame, Get(image, &IAAFDigitalImageDescriptor2::GetFrameLayout));
    EXPECT_EQ(2u, Get(image, &IAAFDigitalImageDescriptor2::GetVideoLineMapSize));
    EXPECT_EQ(AAFRESULT_SUCCESS, image->GetVideoLineMap(2, lines));
    EXPECT_EQ(0, lines[0]);
    EXPECT_EQ(1, lines[1]);
    EXPECT_EQ(AAFRESULT_SUCCESS, image->GetImageAspectRatio(&aspect));
    EXPECT_EQ(0, aspect.numerator);
    EXPECT_EQ(1, aspect.denominator);
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, image->GetCompression(&id));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, image->GetSampledView(&height, &width, &x, &y));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, image->GetDisplayView(&height, &width, &x, &y));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, image->GetTransferCharacteristic(&id));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, image->GetColorPrimaries(&id));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, image->GetCodingEquations(&id));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, image->GetFieldStartOffset(&height));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, image->GetAlphaTransparency(&x));
}

TEST_F(Descriptor, OfAPictureStoresWhatItIsGiven) {
    Ptr<IAAFDigitalImageDescriptor> image =
        Make<IAAFDigitalImageDescriptor>(AUID_AAFCDCIDescriptor);
    Ptr<IAAFDigitalImageDescriptor2> more = As<IAAFDigitalImageDescriptor2>(image);
    aafUInt32 height = 0;
    aafUInt32 width = 0;
    aafInt32 x = 0;
    aafInt32 y = 0;
    aafUID_t id{};
    EXPECT_EQ(AAFRESULT_SUCCESS, image->SetStoredView(540, 1920));
    EXPECT_EQ(AAFRESULT_SUCCESS, image->GetStoredView(&height, &width));
    EXPECT_EQ(540u, height);
    EXPECT_EQ(1920u, width);
    EXPECT_EQ(AAFRESULT_SUCCESS, image->SetSampledView(540, 1920, -1, 2));
    EXPECT_EQ(AAFRESULT_SUCCESS, image->GetSampledView(&height, &width, &x, &y));
    EXPECT_EQ(-1, x);
    EXPECT_EQ(2, y);
    EXPECT_EQ(AAFRESULT_NULL_PARAM, image->GetSampledView(&height, &width, &x, nullptr));
    EXPECT_EQ(AAFRESULT_SUCCESS, image->SetDisplayView(480, 720, 3, -4));
    EXPECT_EQ(AAFRESULT_SUCCESS, image->GetDisplayView(&height, &width, &x, &y));
    EXPECT_EQ(480u, height);
    EXPECT_EQ(-4, y);
    EXPECT_EQ(AAFRESULT_SUCCESS, image->SetCompression(kSomeId));
    EXPECT_EQ(kSomeId, Get(image, &IAAFDigitalImageDescriptor::GetCompression));
    EXPECT_EQ(AAFRESULT_SUCCESS, image->SetImageAspectRatio({16, 9}));
    EXPECT_EQ(AAFRESULT_SUCCESS, more->SetColorPrimaries(kSomeId));
    EXPECT_EQ(AAFRESULT_SUCCESS, more->GetColorPrimaries(&id));
    EXPECT_EQ(AAFRESULT_SUCCESS, more->SetCodingEquations(kSomeId));
    EXPECT_EQ(AAFRESULT_SUCCESS, more->GetCodingEquations(&id));
    EXPECT_EQ(AAFRESULT_SUCCESS, more->SetFieldStartOffset(7));
    EXPECT_EQ(7u, Get(more, &IAAFDigitalImageDescriptor2::GetFieldStartOffset));
    EXPECT_EQ(AAFRESULT_SUCCESS, more->SetDisplayF2Offset(-1));
    EXPECT_EQ(-1, Get(more, &IAAFDigitalImageDescriptor2::GetDisplayF2Offset));
    EXPECT_EQ(AAFRESULT_SUCCESS, more->SetActiveFormatDescriptor(200));
    EXPECT_EQ(200, Get(more, &IAAFDigitalImageDescriptor2::GetActiveFormatDescriptor));
}

TEST_F(Descriptor, OfAPictureHasOneGammaUnderTwoNames) {
    Ptr<IAAFDigitalImageDescriptor> image =
        Make<IAAFDigitalImageDescriptor>(AUID_AAFRGBADescriptor);
    aafUID_t id{};
    EXPECT_EQ(AAFRESULT_SUCCESS, image->SetGamma(kSomeId));
    EXPECT_EQ(AAFRESULT_SUCCESS,
              As<IAAFDigitalImageDescriptor2>(image)->GetTransferCharacteristic(&id));
    EXPECT_EQ(kSomeId, id);
}

TEST_F(Descriptor, OfAPictureChecksEnumeratedValues) {
    Ptr<IAAFDigitalImageDescriptor2> image =
        Make<IAAFDigitalImageDescriptor2>(AUID_AAFCDCIDescriptor);
    EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE, image->SetFrameLayout(5));
    EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE, image->SetFrameLayout(-1));
    EXPECT_EQ(AAFRESULT_SUCCESS, image->SetFrameLayout(kAAFSegmentedFrame));
    EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE, image->SetAlphaTransparency(2));
    EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE, image->SetSignalStandard(7));
    EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE, image->SetFieldDominance(3));
    EXPECT_EQ(AAFRESULT_ILLEGAL_VALUE, image->SetFieldDominance(kAAFUnspecifiedField));
    EXPECT_EQ(AAFRESULT_SUCCESS, image->SetFieldDominance(kAAFFieldTwo));
}

TEST_F(Descriptor, OfAPictureReplacesItsLineMapUnlessTheNewOneIsEmpty) {
    Ptr<IAAFDigitalImageDescriptor> image =
        Make<IAAFDigitalImageDescriptor>(AUID_AAFCDCIDescriptor);
    aafInt32 lines[] = {21, 584, 7};
    aafInt32 back[3] = {};
    EXPECT_EQ(AAFRESULT_NULL_PARAM, image->SetVideoLineMap(0, nullptr));
    EXPECT_EQ(AAFRESULT_SUCCESS, image->SetVideoLineMap(3, lines));
    EXPECT_EQ(AAFRESULT_SUCCESS, image->SetVideoLineMap(0, lines));
    EXPECT_EQ(3u, Get(image, &IAAFDigitalImageDescriptor::GetVideoLineMapSize));
    EXPECT_EQ(AAFRESULT_SUCCESS, image->GetVideoLineMap(3, back));
    EXPECT_EQ(584, back[1]);
    EXPECT_EQ(AAFRESULT_SMALLBUF, image->GetVideoLineMap(2, back));
    EXPECT_EQ(AAFRESULT_SUCCESS, image->SetVideoLineMap(1, lines));
    EXPECT_EQ(1u, Get(image, &IAAFDigitalImageDescriptor::GetVideoLineMapSize));
}

TEST_F(Descriptor, OfColourDifferencesTakesKnownSubsamplingOnly) {
    Ptr<IAAFCDCIDescriptor2> cdci = Make<IAAFCDCIDescriptor2>(AUID_AAFCDCIDescriptor);
    aafUInt32 value = 0;
    aafColorSiting_t siting = 0;
    EXPECT_EQ(8, Get(cdci, &IAAFCDCIDescriptor2::GetComponentWidth));
    EXPECT_EQ(1u, Get(cdci, &IAAFCDCIDescriptor2::GetHorizontalSubsampling));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, cdci->GetVerticalSubsampling(&value));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, cdci->GetColorSiting(&siting));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, cdci->GetBlackReferenceLevel(&value));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, cdci->GetWhiteReferenceLevel(&value));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, cdci->GetColorRange(&value));
    for (aafUInt32 sampling : {1u, 2u, 4u}) {
        EXPECT_EQ(AAFRESULT_SUCCESS, cdci->SetHorizontalSubsampling(sampling));
    }
    for (aafUInt32 sampling : {0u, 3u, 5u, 0xFFFFFFFFu}) {
        EXPECT_EQ(AAFRESULT_BAD_PROP, cdci->SetHorizontalSubsampling(sampling));
    }
    EXPECT_EQ(4u, Get(cdci, &IAAFCDCIDescriptor2::GetHorizontalSubsampling));
    EXPECT_EQ(AAFRESULT_SUCCESS, cdci->SetVerticalSubsampling(2));
    EXPECT_EQ(AAFRESULT_BAD_PROP, cdci->SetVerticalSubsampling(4));
    EXPECT_EQ(AAFRESULT_BAD_PROP, cdci->SetVerticalSubsampling(0));
    EXPECT_EQ(AAFRESULT_BAD_PROP, cdci->SetComponentWidth(-1));
    EXPECT_EQ(AAFRESULT_SUCCESS, cdci->SetComponentWidth(0));
    EXPECT_EQ(AAFRESULT_SUCCESS, cdci->SetComponentWidth(1000));
    for (aafColorSiting_t good : {0, 1, 2, 3, 4, 255}) {
        EXPECT_EQ(AAFRESULT_SUCCESS, cdci->SetColorSiting(good));
    }
    for (aafColorSiting_t bad : {-1, 5, 6, 254, 256}) {
        EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE, cdci->SetColorSiting(bad));
    }
    EXPECT_EQ(AAFRESULT_SUCCESS, cdci->SetBlackReferenceLevel(16));
    EXPECT_EQ(AAFRESULT_SUCCESS, cdci->SetWhiteReferenceLevel(235));
    EXPECT_EQ(AAFRESULT_SUCCESS, cdci->SetColorRange(0xFFFFFFFF));
    EXPECT_EQ(0xFFFFFFFFu, Get(cdci, &IAAFCDCIDescriptor2::GetColorRange));
    EXPECT_EQ(AAFRESULT_SUCCESS, cdci->SetPaddingBits(-3));
    EXPECT_EQ(-3, Get(cdci, &IAAFCDCIDescriptor2::GetPaddingBits));
    EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE, cdci->SetReversedByteOrder(2));
}

TEST_F(Descriptor, OfMpegInitializesAsBothOfItsKinds) {
    Ptr<IAAFMPEGVideoDescriptor> mpeg = Make<IAAFMPEGVideoDescriptor>(AUID_AAFMPEGVideoDescriptor);
    EXPECT_EQ(AAFRESULT_SUCCESS, mpeg->Initialize());
    EXPECT_EQ(AAFRESULT_SUCCESS, mpeg->SetMaxGOP(15));
    EXPECT_EQ(AAFRESULT_SUCCESS, mpeg->SetBitRate(50000000));
    EXPECT_EQ(AAFRESULT_SUCCESS, mpeg->SetProfileAndLevel(0x82));
    EXPECT_EQ(AAFRESULT_SUCCESS, As<IAAFCDCIDescriptor>(mpeg)->Initialize());
    aafBoolean_t low = 0;
    EXPECT_EQ(15, Get(mpeg, &IAAFMPEGVideoDescriptor::GetMaxGOP));
    EXPECT_EQ(50000000u, Get(mpeg, &IAAFMPEGVideoDescriptor::GetBitRate));
    EXPECT_EQ(0x82, Get(mpeg, &IAAFMPEGVideoDescriptor::GetProfileAndLevel));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, mpeg->GetLowDelay(&low));
    EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE, mpeg->SetLowDelay(7));
    EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE, mpeg->SetCodedContentScanning(4));
}

TEST_F(Descriptor, OfColoursFillsLayoutsWithEmptyPlaces) {
    Ptr<IAAFRGBADescriptor2> rgba = Make<IAAFRGBADescriptor2>(AUID_AAFRGBADescriptor);
    aafRGBAComponent_t layout[9] = {};
    aafUInt32 count = 9;
    EXPECT_EQ(0u, Get(rgba, &IAAFRGBADescriptor2::CountPixelLayoutElements));
    EXPECT_EQ(AAFRESULT_SUCCESS, rgba->GetPixelLayout(8, layout));
    for (int at = 0; at < 8; ++at) {
        EXPECT_EQ(0x30, layout[at].Code);
        EXPECT_EQ(0, layout[at].Size);
    }
    aafRGBAComponent_t given[9] = {{kAAFCompRed, 8}, {kAAFCompGreen, 8}, {kAAFCompBlue, 8}};
    EXPECT_EQ(AAFRESULT_NULL_PARAM, rgba->SetPixelLayout(3, nullptr));
    EXPECT_EQ(AAFRESULT_SMALLBUF, rgba->SetPixelLayout(9, given));
    EXPECT_EQ(AAFRESULT_SUCCESS, rgba->SetPixelLayout(3, given));
    EXPECT_EQ(3u, Get(rgba, &IAAFRGBADescriptor2::CountPixelLayoutElements));
    EXPECT_EQ(AAFRESULT_SUCCESS, rgba->GetPixelLayout(4, layout));
    EXPECT_EQ(kAAFCompGreen, layout[1].Code);
    EXPECT_EQ(8, layout[2].Size);
    EXPECT_EQ(kAAFCompNone, layout[3].Code);
    EXPECT_EQ(AAFRESULT_SUCCESS, rgba->SetPixelLayout(0, given));
    EXPECT_EQ(0u, Get(rgba, &IAAFRGBADescriptor2::CountPixelLayoutElements));
    aafUInt32 level = 0;
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, rgba->GetComponentMaxRef(&level));
    EXPECT_EQ(AAFRESULT_SUCCESS, rgba->SetComponentMaxRef(255));
    EXPECT_EQ(AAFRESULT_SUCCESS, rgba->SetComponentMinRef(1));
    EXPECT_EQ(255u, Get(rgba, &IAAFRGBADescriptor2::GetComponentMaxRef));
    EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE, rgba->SetScanningDirection(8));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, rgba->CountPaletteLayoutElements(&count));
}

TEST_F(Descriptor, OfSoundHasZeroDefaults) {
    Ptr<IAAFSoundDescriptor> sound = Make<IAAFSoundDescriptor>(AUID_AAFSoundDescriptor);
    aafRational_t rate{9, 9};
    aafUID_t id{};
    aafBoolean_t locked = 0;
    EXPECT_EQ(0u, Get(sound, &IAAFSoundDescriptor::GetChannelCount));
    EXPECT_EQ(0u, Get(sound, &IAAFSoundDescriptor::GetQuantizationBits));
    EXPECT_EQ(AAFRESULT_SUCCESS, sound->GetAudioSamplingRate(&rate));
    EXPECT_EQ(0, rate.denominator);
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, sound->GetCompression(&id));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, sound->IsLocked(&locked));
    EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE, sound->SetIsLocked(2));
    EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE, sound->SetElectroSpatialFormulation(5));
    EXPECT_EQ(AAFRESULT_SUCCESS, sound->SetElectroSpatialFormulation(15));
    EXPECT_EQ(AAFRESULT_SUCCESS, sound->SetAudioRefLevel(-20));
    EXPECT_EQ(-20, Get(sound, &IAAFSoundDescriptor::GetAudioRefLevel));
}

TEST_F(Descriptor, OfSamplesNeedsItsOwnInitialize) {
    Ptr<IAAFPCMDescriptor> pcm = Make<IAAFPCMDescriptor>(AUID_AAFPCMDescriptor);
    Ptr<IAAFSoundDescriptor> sound = As<IAAFSoundDescriptor>(pcm);
    aafUInt16 align = 9;
    EXPECT_EQ(AAFRESULT_NOT_INITIALIZED, pcm->SetBlockAlign(4));
    EXPECT_EQ(AAFRESULT_NOT_INITIALIZED, pcm->GetBlockAlign(&align));
    EXPECT_EQ(AAFRESULT_NOT_INITIALIZED, pcm->SetAverageBPS(4));
    EXPECT_EQ(AAFRESULT_NOT_INITIALIZED, sound->SetChannelCount(2));
    EXPECT_EQ(AAFRESULT_NOT_INITIALIZED, sound->SetQuantizationBits(24));
    EXPECT_EQ(AAFRESULT_NOT_INITIALIZED, sound->SetAudioSamplingRate({48000, 1}));
    EXPECT_EQ(AAFRESULT_NOT_INITIALIZED, sound->SetCompression({}));
    EXPECT_EQ(AAFRESULT_NOT_INITIALIZED, sound->SetIsLocked(kAAFTrue));
    EXPECT_EQ(AAFRESULT_NOT_INITIALIZED, sound->SetElectroSpatialFormulation(1));
    // Odd members of an enumeration come before all else.
    EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE, sound->SetIsLocked(2));
    EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE, sound->SetElectroSpatialFormulation(5));
    EXPECT_EQ(AAFRESULT_NOT_INITIALIZED, sound->SetAudioRefLevel(1));
    EXPECT_EQ(AAFRESULT_NOT_INITIALIZED, sound->SetDialNorm(1));
    EXPECT_EQ(0u, Get(sound, &IAAFSoundDescriptor::GetChannelCount));
    EXPECT_EQ(AAFRESULT_SUCCESS, As<IAAFFileDescriptor>(pcm)->SetLength(5));

    EXPECT_EQ(AAFRESULT_SUCCESS, pcm->Initialize());
    EXPECT_EQ(AAFRESULT_ALREADY_INITIALIZED, pcm->Initialize());
    EXPECT_EQ(0u, Get(sound, &IAAFSoundDescriptor::GetChannelCount));
    EXPECT_EQ(0u, Get(sound, &IAAFSoundDescriptor::GetQuantizationBits));
    EXPECT_EQ(0, Get(pcm, &IAAFPCMDescriptor::GetBlockAlign));
    EXPECT_EQ(0u, Get(pcm, &IAAFPCMDescriptor::GetAverageBPS));
    EXPECT_EQ(AAFRESULT_SUCCESS, sound->SetChannelCount(2));
    EXPECT_EQ(2u, Get(sound, &IAAFSoundDescriptor::GetChannelCount));
    EXPECT_EQ(AAFRESULT_SUCCESS, pcm->SetBlockAlign(6));
    EXPECT_EQ(6, Get(pcm, &IAAFPCMDescriptor::GetBlockAlign));
    EXPECT_EQ(kAAFFalse, Get(pcm, &IAAFPCMDescriptor::AreAllPeakEnvelopePropertiesPresent));
}

TEST_F(Descriptor, OfSeveralKindsKeepsItsPartsInOrder) {
    Ptr<IAAFMultipleDescriptor> multiple = Make<IAAFMultipleDescriptor>(AUID_AAFMultipleDescriptor);
    EXPECT_EQ(AAFRESULT_SUCCESS, multiple->Initialize());
    EXPECT_EQ(AAFRESULT_SUCCESS, multiple->Initialize());
    Ptr<IAAFFileDescriptor> parts[] = {Make<IAAFFileDescriptor>(AUID_AAFCDCIDescriptor),
                                       Make<IAAFFileDescriptor>(AUID_AAFPCMDescriptor)};
    parts[0]->SetSampleRate({25, 1});
    EXPECT_EQ(AAFRESULT_NULL_PARAM, multiple->AppendFileDescriptor(nullptr));
    EXPECT_EQ(AAFRESULT_SUCCESS, multiple->AppendFileDescriptor(parts[1]));
    EXPECT_EQ(AAFRESULT_OBJECT_ALREADY_ATTACHED, multiple->AppendFileDescriptor(parts[1]));
    EXPECT_EQ(AAFRESULT_SUCCESS, multiple->PrependFileDescriptor(parts[0]));
    EXPECT_EQ(AAFRESULT_OBJECT_ALREADY_ATTACHED,
              multiple->AppendFileDescriptor(As<IAAFFileDescriptor>(multiple)));
    Ptr<IAAFFileDescriptor> found = Get(multiple, &IAAFMultipleDescriptor::GetFileDescriptorAt, 0);
    EXPECT_EQ(parts[0].get(), found.get());
    EXPECT_EQ(AAFRESULT_BADINDEX, multiple->GetFileDescriptorAt(2, found.Out()));
    aafRational_t rate{9, 9};
    EXPECT_EQ(AAFRESULT_SUCCESS, As<IAAFFileDescriptor>(multiple)->GetSampleRate(&rate));
    EXPECT_EQ(0, rate.numerator);
    EXPECT_EQ(AAFRESULT_SUCCESS, multiple->RemoveFileDescriptorAt(0));
    EXPECT_EQ(AAFRESULT_BADINDEX, multiple->RemoveFileDescriptorAt(1));
    EXPECT_EQ(1u, Get(multiple, &IAAFMultipleDescriptor::CountFileDescriptors));
    Ptr<IEnumAAFFileDescriptors> all = Get(multiple, &IAAFMultipleDescriptor::GetFileDescriptors);
    EXPECT_EQ(AAFRESULT_SUCCESS, all->NextOne(found.Out()));
    EXPECT_EQ(AAFRESULT_NO_MORE_OBJECTS, all->NextOne(found.Out()));
}

TEST_F(Descriptor, OfAnImportNeedsNoInitializeAndKeepsItsLocators) {
    Ptr<IAAFEssenceDescriptor> import = Make<IAAFEssenceDescriptor>(AUID_AAFImportDescriptor);
    Ptr<IAAFLocator> found;
    EXPECT_EQ(0u, Get(import, &IAAFEssenceDescriptor::CountLocators));
    Ptr<IEnumAAFLocators> all = Get(import, &IAAFEssenceDescriptor::GetLocators);
    EXPECT_EQ(AAFRESULT_NO_MORE_OBJECTS, all->NextOne(found.Out()));
    Ptr<IAAFLocator> first = Make<IAAFLocator>(AUID_AAFNetworkLocator);
    Ptr<IAAFLocator> second = Make<IAAFLocator>(AUID_AAFTextLocator);
    EXPECT_EQ(AAFRESULT_NULL_PARAM, import->AppendLocator(nullptr));
    EXPECT_EQ(AAFRESULT_SUCCESS, import->AppendLocator(second));
    EXPECT_EQ(AAFRESULT_OBJECT_ALREADY_ATTACHED, import->PrependLocator(second));
    EXPECT_EQ(AAFRESULT_BADINDEX, import->InsertLocatorAt(2, first));
    EXPECT_EQ(AAFRESULT_SUCCESS, import->InsertLocatorAt(0, first));
    EXPECT_EQ(AAFRESULT_SUCCESS, import->GetLocatorAt(0, found.Out()));
    EXPECT_EQ(first.get(), found.get());
    EXPECT_EQ(AAFRESULT_BADINDEX, import->GetLocatorAt(2, found.Out()));
    EXPECT_EQ(AAFRESULT_SUCCESS, import->RemoveLocatorAt(0));
    EXPECT_EQ(AAFRESULT_BADINDEX, import->RemoveLocatorAt(1));
    EXPECT_EQ(AAFRESULT_SUCCESS, As<IAAFImportDescriptor>(import)->Initialize());
    EXPECT_EQ(AAFRESULT_SUCCESS, As<IAAFImportDescriptor>(import)->Initialize());
}

TEST_F(Descriptor, LocatorsKeepTheirPath) {
    Ptr<IAAFLocator> locator = Make<IAAFLocator>(AUID_AAFNetworkLocator);
    EXPECT_EQ(sizeof(aafCharacter), Get(locator, &IAAFLocator::GetPathBufLen));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, locator->SetPath(nullptr));
    EXPECT_EQ(AAFRESULT_SUCCESS, locator->SetPath(L"file:///a%20b.mov"));
    EXPECT_EQ(L"file:///a%20b.mov",
              TextOf<IAAFLocator>(locator, &IAAFLocator::GetPathBufLen, &IAAFLocator::GetPath));
    wchar_t small[4];
    EXPECT_EQ(AAFRESULT_SMALLBUF, locator->GetPath(small, sizeof small));
    EXPECT_EQ(AAFRESULT_SUCCESS, As<IAAFNetworkLocator>(locator)->Initialize());
    EXPECT_EQ(AAFRESULT_SUCCESS, As<IAAFNetworkLocator>(locator)->Initialize());

    Ptr<IAAFTextLocator> text = Make<IAAFTextLocator>(AUID_AAFTextLocator);
    EXPECT_EQ(AAFRESULT_SUCCESS, text->SetName(L"shelf 3"));
    Ptr<IAAFLocator> view = As<IAAFLocator>(text);
    EXPECT_EQ(L"shelf 3",
              TextOf<IAAFLocator>(view, &IAAFLocator::GetPathBufLen, &IAAFLocator::GetPath));
}

TEST_F(Descriptor, OfOtherCarriersKeepsWhatIsSaidOfThem) {
    Ptr<IAAFTapeDescriptor> tape = Make<IAAFTapeDescriptor>(AUID_AAFTapeDescriptor);
    aafUInt32 length = 0;
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, tape->GetTapeLength(&length));
    EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE, tape->SetTapeFormFactor(8));
    EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE, tape->SetTapeFormat(7));
    EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE, tape->SetSignalType(4));
    EXPECT_EQ(AAFRESULT_SUCCESS, tape->SetTapeModel(L"X"));
    EXPECT_EQ(L"X", TextOf<IAAFTapeDescriptor>(tape, &IAAFTapeDescriptor::GetTapeModelBufLen,
                                               &IAAFTapeDescriptor::GetTapeModel));
    Ptr<IAAFWAVEDescriptor> wave = Make<IAAFWAVEDescriptor>(AUID_AAFWAVEDescriptor);
    aafUInt8 summary[] = {'R', 'I', 'F', 'F'};
    aafUInt8 back[4] = {};
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, wave->GetSummaryBufferSize(&length));
    EXPECT_EQ(AAFRESULT_SUCCESS, wave->SetSummary(4, summary));
    EXPECT_EQ(4u, Get(wave, &IAAFWAVEDescriptor::GetSummaryBufferSize));
    EXPECT_EQ(AAFRESULT_SMALLBUF, wave->GetSummary(3, back));
    EXPECT_EQ(AAFRESULT_SUCCESS, wave->GetSummary(4, back));
    EXPECT_EQ('F', back[3]);
}

}  // namespace aaf_test
