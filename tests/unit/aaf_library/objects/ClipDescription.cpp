// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "tests/unit/aaf_library/objects/ClipDescription.h"

#define MUST(expression) ASSERT_EQ(AAFRESULT_SUCCESS, expression)

namespace aaf_test {

namespace {

const aafUID_t kBoxType = ncfGuid("0E040301-0200-0000-060E-2B3401040101");
const aafUID_t kBoxes[] = {ncfGuid("0E040101-0101-0107-060E-2B3401010101"),
                           ncfGuid("0E040101-0101-0108-060E-2B3401010101"),
                           ncfGuid("0E040101-0101-0106-060E-2B3401010101"), kBoxType};
const wchar_t* const kBoxNames[] = {L"EssenceBox", L"SourceBox", L"ValidBox", L"BoundsBox"};

}  // namespace

void ClipDescription::MakeMobs() {
    master_ = Make<IAAFMob>(AUID_AAFMasterMob);
    file_mob_ = Make<IAAFMob>(AUID_AAFSourceMob);
    source_ = Make<IAAFMob>(AUID_AAFSourceMob);
    MUST(As<IAAFMasterMob>(master_)->Initialize());
    MUST(As<IAAFSourceMob>(file_mob_)->Initialize());
    MUST(As<IAAFSourceMob>(source_)->Initialize());
    MUST(master_->SetMobID(MobId(0x01)));
    MUST(file_mob_->SetMobID(MobId(0xB1)));
    MUST(source_->SetMobID(MobId(0xA1)));
    for (IAAFMob* mob : {master_.get(), file_mob_.get(), source_.get()}) {
        MUST(mob->SetName(L"A001"));
    }
    multiple_ = Make<IAAFMultipleDescriptor>(AUID_AAFMultipleDescriptor);
    MUST(multiple_->Initialize());
}

void ClipDescription::AddTrack(const aafUID_t& dataDefinition, aafSlotID_t slotId) {
    Ptr<IAAFDataDef> dataDef = DataDef(dataDefinition);
    aafMobID_t fileId{};
    aafMobID_t sourceId{};
    MUST(file_mob_->GetMobID(&fileId));
    MUST(source_->GetMobID(&sourceId));
    Ptr<IAAFMobSlot> slot;
    MUST(As<IAAFMasterMob>(master_)->NewPhysSourceRef(rate_, slotId, dataDef, {fileId, slotId, 0},
                                                      length_));
    MUST(master_->LookupSlot(slotId, slot.Out()));
    MUST(slot->SetName(L""));
    MUST(As<IAAFSourceMob>(file_mob_)->NewPhysSourceRef(rate_, slotId, dataDef,
                                                        {sourceId, slotId, 0}, length_));
    MUST(file_mob_->LookupSlot(slotId, slot.Out()));
    MUST(slot->SetName(L""));
    MUST(As<IAAFSourceMob>(source_)->AddNilReference(slotId, 12960000, dataDef, rate_));
    MUST(source_->LookupSlot(slotId, slot.Out()));
    MUST(slot->SetName(L""));
}

void ClipDescription::AddTimecode(aafTimecode_t timecode, aafLength_t length, aafLength_t maximum,
                                  aafSlotID_t slotId, aafUInt32 number) {
    Ptr<IAAFDataDef> dataDef = DataDef(kAAFDataDef_LegacyTimecode);
    Ptr<IAAFSequence> sequence = Make<IAAFSequence>(AUID_AAFSequence);
    MUST(sequence->Initialize(dataDef));
    Ptr<IAAFComponent> component = Make<IAAFComponent>(AUID_AAFTimecode);
    MUST(As<IAAFTimecode>(component)->Initialize(0, &timecode));
    MUST(component->SetDataDef(dataDef));
    MUST(component->SetLength(length));
    MUST(sequence->AppendComponent(component));
    if (number > 0) {
        Ptr<IAAFFiller> before = Make<IAAFFiller>(AUID_AAFFiller);
        MUST(before->Initialize(dataDef, 0));
        MUST(sequence->PrependComponent(As<IAAFComponent>(before)));
        Ptr<IAAFFiller> behind = Make<IAAFFiller>(AUID_AAFFiller);
        MUST(behind->Initialize(dataDef, maximum - length));
        MUST(sequence->AppendComponent(As<IAAFComponent>(behind)));
    }
    Ptr<IAAFTimelineMobSlot> made;
    Ptr<IAAFMobSlot> slot;
    MUST(source_->AppendNewTimelineSlot(rate_, As<IAAFSegment>(sequence), slotId,
                                        number == 0 ? L"TC1" : L"AuxTC1", 0, made.Out()));
    MUST(source_->LookupSlot(slotId, slot.Out()));
    MUST(slot->SetPhysicalNum(number == 0 ? 1 : number + 2));
}

void ClipDescription::AddPicture() {
    Ptr<IAAFCDCIDescriptor> cdci = Make<IAAFCDCIDescriptor>(AUID_AAFCDCIDescriptor);
    MUST(cdci->Initialize());
    Ptr<IAAFDigitalImageDescriptor> image = As<IAAFDigitalImageDescriptor>(cdci);
    Ptr<IAAFDigitalImageDescriptor2> image2 = As<IAAFDigitalImageDescriptor2>(cdci);
    Ptr<IAAFFileDescriptor> file = As<IAAFFileDescriptor>(cdci);
    aafInt32 lines[] = {21, 584};
    MUST(image2->SetFieldStartOffset(0));
    MUST(image->SetVideoLineMap(2, lines));
    MUST(cdci->SetComponentWidth(10));
    MUST(cdci->SetHorizontalSubsampling(2));
    MUST(cdci->SetVerticalSubsampling(1));
    MUST(cdci->SetColorSiting(kAAFCoSiting));
    MUST(cdci->SetColorRange(897));
    MUST(image2->SetTransferCharacteristic(ncfGuid("04010101-0102-0000-060E-2B3404010101")));
    MUST(image2->SetColorPrimaries(ncfGuid("04010101-0303-0000-060E-2B3404010106")));
    MUST(cdci->SetBlackReferenceLevel(64));
    MUST(cdci->SetWhiteReferenceLevel(940));
    MUST(image->SetCompression(ncfGuid("0E040201-027F-0000-060E-2B3404010101")));

    // A container that no dictionary knows from the start is made on the spot.
    const aafUID_t containerId = ncfGuid("ABCDEF00-027F-0000-060E-2B3404010101");
    Ptr<IAAFContainerDef> container;
    if (dictionary_->LookupContainerDef(containerId, container.Out()) != AAFRESULT_SUCCESS) {
        container = Make<IAAFContainerDef>(AUID_AAFContainerDef);
        MUST(container->Initialize(containerId, L"", L""));
        MUST(dictionary_->RegisterContainerDef(container));
    }
    MUST(file->SetContainerFormat(container));
    MUST(image->SetFrameLayout(kAAFSeparateFields));
    MUST(image->SetStoredView(540, 1920));
    MUST(image->SetSampledView(540, 1920, 0, 0));
    MUST(image->SetDisplayView(540, 1920, 0, 0));
    MUST(image->SetImageAspectRatio({16, 9}));
    MUST(file->SetSampleRate(rate_));
    MUST(file->SetLength(length_));
    SetSliceCount(As<IAAFObject>(cdci), 10);
    SetBoxes(As<IAAFObject>(image));
    SetRate(rate_);
    MUST(multiple_->AppendFileDescriptor(file));
}

void ClipDescription::SetBoxes(IAAFObject* picture) {
    Ptr<IAAFClassDef> pictures;
    MUST(dictionary_->LookupClassDef(AUID_AAFDigitalImageDescriptor, pictures.Out()));
    Ptr<IAAFTypeDef> type;
    if (dictionary_->LookupTypeDef(kBoxType, type.Out()) < 0) {
        MUST(dictionary_->CreateMetaInstance(AUID_AAFTypeDefRecord, IID_IAAFTypeDef,
                                             type.OutUnknown()));
        Ptr<IAAFTypeDef> rational;
        MUST(dictionary_->LookupTypeDef(kAAFTypeID_Rational, rational.Out()));
        IAAFTypeDef* types[] = {rational, rational, rational, rational};
        wchar_t x[] = L"PositionX";
        wchar_t y[] = L"PositionY";
        wchar_t width[] = L"Width";
        wchar_t height[] = L"Height";
        aafString_t names[] = {x, y, width, height};
        MUST(As<IAAFTypeDefRecord>(type)->Initialize(kBoxType, types, names, 4, L"BoundsBox"));
        MUST(dictionary_->RegisterTypeDef(type));
    }
    for (int at = 0; at < 4; ++at) {
        Ptr<IAAFPropertyDef> property;
        if (pictures->LookupPropertyDef(kBoxes[at], property.Out()) < 0) {
            MUST(pictures->RegisterOptionalPropertyDef(kBoxes[at], kBoxNames[at], type,
                                                       property.Out()));
        }
        Ptr<IAAFTypeDefRecord> record = As<IAAFTypeDefRecord>(type);
        aafUInt32 offsets[] = {0, 8, 16, 24};
        MUST(record->RegisterMembers(offsets, 4, 32));
        aafRational_t box[] = {{at, 1}, {-at, 1}, {1920, 1}, {1080, 1}};
        Ptr<IAAFPropertyValue> value;
        MUST(record->CreateValueFromStruct(reinterpret_cast<aafMemPtr_t>(box), sizeof box,
                                           value.Out()));
        MUST(picture->SetPropertyValue(property, value));
    }
}

void ClipDescription::SetSliceCount(IAAFObject* picture, aafUInt32 count) {
    const aafUID_t id = ncfGuid("0E040101-0101-010E-060E-2B3401010101");
    Ptr<IAAFTypeDef> type;
    Ptr<IAAFPropertyValue> value;
    Ptr<IAAFClassDef> pictures;
    Ptr<IAAFPropertyDef> property;
    MUST(dictionary_->LookupTypeDef(kAAFTypeID_Int32, type.Out()));
    MUST(As<IAAFTypeDefInt>(type)->CreateValue(reinterpret_cast<aafMemPtr_t>(&count), sizeof count,
                                               value.Out()));
    MUST(dictionary_->LookupClassDef(AUID_AAFCDCIDescriptor, pictures.Out()));
    if (pictures->LookupPropertyDef(id, property.Out()) < 0) {
        MUST(pictures->RegisterOptionalPropertyDef(id, L"AVCISliceCount", type, property.Out()));
    }
    MUST(picture->SetPropertyValue(property, value));
}

void ClipDescription::SetRate(const aafRational_t& rate) {
    Ptr<IAAFFileDescriptor> file = As<IAAFFileDescriptor>(multiple_);
    aafRational_t current{};
    MUST(file->GetSampleRate(&current));
    if (current.numerator == 0 && current.denominator == 0) {
        MUST(file->SetSampleRate(rate));
    }
}

void ClipDescription::AddSound() {
    Ptr<IAAFPCMDescriptor> pcm = Make<IAAFPCMDescriptor>(AUID_AAFPCMDescriptor);
    Ptr<IUnknown> generic = As<IUnknown>(pcm);
    MUST(pcm->Initialize());
    Ptr<IAAFFileDescriptor> file = As<IAAFFileDescriptor>(generic);
    Ptr<IAAFSoundDescriptor> sound = As<IAAFSoundDescriptor>(pcm);
    MUST(sound->SetCompression(ncfGuid("04020202-0301-0100-060E-2B3404010101")));
    MUST(pcm->SetAverageBPS(1536000));
    MUST(pcm->SetBlockAlign(4));
    MUST(sound->SetChannelCount(2));
    MUST(sound->SetQuantizationBits(16));
    MUST(sound->SetAudioSamplingRate({48000, 1}));
    MUST(file->SetSampleRate({48000, 1}));
    MUST(file->SetLength(480480));
    SetRate({48000, 1});
    MUST(multiple_->AppendFileDescriptor(file));
}

void ClipDescription::AddLocator(IAAFEssenceDescriptor* descriptor) {
    Ptr<IAAFNetworkLocator> network = Make<IAAFNetworkLocator>(AUID_AAFNetworkLocator);
    Ptr<IAAFLocator> locator = As<IAAFLocator>(network);
    MUST(locator->SetPath(L"file:///media/A001.mov"));
    MUST(descriptor->AppendLocator(locator));
}

void ClipDescription::MoveFileMobClips(aafPosition_t by) {
    Ptr<IEnumAAFMobSlots> slots;
    Ptr<IAAFMobSlot> slot;
    MUST(file_mob_->GetSlots(slots.Out()));
    while (slots->NextOne(slot.Out()) == AAFRESULT_SUCCESS) {
        Ptr<IAAFSegment> segment;
        aafSourceRef_t reference{};
        MUST(slot->GetSegment(segment.Out()));
        Ptr<IAAFSourceClip> clip = As<IAAFSourceClip>(segment);
        MUST(clip->GetSourceReference(&reference));
        reference.startTime += by;
        MUST(clip->SetSourceReference(reference));
    }
}

void ClipDescription::AddMobs() {
    MUST(header_->AddMob(master_));
    MUST(header_->AddMob(file_mob_));
    MUST(header_->AddMob(source_));
}

void ClipDescription::AddColumns() {
    const wchar_t* const columns[][2] = {
        {L"Video", L"ProRes 422"},       {L"Video File Format", L"MOV"},
        {L"Audio Format", L"LPCM"},      {L"Audio Format", L"LPCM"},
        {L"Field Ordering", L"Default"}, {L"GFX-Video Level", L"Do not modify levels"}};
    for (const auto& column : columns) {
        std::wstring name = column[0];
        MUST(master_->AppendComment(name.data(), column[1]));
    }
}

void ClipDescription::SetAppCode() {
    const aafUID_t id = ncfGuid("96C46992-4F62-11D3-A022-006094EB75CB");
    aafInt32 code = 1;
    Ptr<IAAFTypeDef> type;
    Ptr<IAAFPropertyValue> value;
    Ptr<IAAFClassDef> mobs;
    Ptr<IAAFPropertyDef> property;
    Ptr<IAAFObject> object = As<IAAFObject>(As<IAAFMasterMob>(master_));
    MUST(dictionary_->LookupTypeDef(kAAFTypeID_Int32, type.Out()));
    MUST(As<IAAFTypeDefInt>(type)->CreateValue(reinterpret_cast<aafMemPtr_t>(&code), 4,
                                               value.Out()));
    MUST(dictionary_->LookupClassDef(AUID_AAFMob, mobs.Out()));
    MUST(mobs->RegisterOptionalPropertyDef(id, L"AppCode", type, property.Out()));
    MUST(object->SetPropertyValue(property, value));
}

void ClipDescription::SetAttributeList() {
    const aafUID_t id = ncfGuid("60958183-47B1-11D4-A01C-0004AC969F50");
    Ptr<IAAFTypeDef> vector;
    Ptr<IAAFTypeDef> reference;
    Ptr<IAAFTypeDef> int32;
    Ptr<IAAFClassDef> mobs;
    Ptr<IAAFPropertyDef> property;
    Ptr<IAAFPropertyValue> list;
    Ptr<IAAFPropertyValue> element;
    MUST(dictionary_->LookupTypeDef(kAAFTypeID_TaggedValueStrongReferenceVector, vector.Out()));
    Ptr<IAAFTypeDefVariableArray> array = As<IAAFTypeDefVariableArray>(vector);
    MUST(dictionary_->LookupClassDef(AUID_AAFMob, mobs.Out()));
    MUST(mobs->RegisterOptionalPropertyDef(id, L"MobAttributeList", vector, property.Out()));
    MUST(array->CreateEmptyValue(list.Out()));
    // Set first and filled afterwards: value and mob share the list.
    MUST(As<IAAFObject>(master_)->SetPropertyValue(property, list));
    MUST(dictionary_->LookupTypeDef(kAAFTypeID_TaggedValueStrongReference, reference.Out()));
    MUST(dictionary_->LookupTypeDef(kAAFTypeID_Int32, int32.Out()));
    Ptr<IAAFTaggedValue> value = Make<IAAFTaggedValue>(AUID_AAFTaggedValue);
    aafInt32 zero = 0;
    MUST(value->Initialize(L"_BOUNDS_REFORMATTING_OPTION", int32, sizeof zero,
                           reinterpret_cast<aafDataBuffer_t>(&zero)));
    MUST(As<IAAFTypeDefObjectRef>(reference)->CreateValue(value, element.Out()));
    MUST(array->AppendElement(list, element));
}

void ClipDescription::DescribeClip() {
    MakeMobs();
    AddTimecode({0, 0, 30}, 2592000, 2592000, 1, 0);
    AddTimecode({1234, 1, 30}, length_, 2592000, 2, 1);
    AddPicture();
    AddTrack(kAAFDataDef_LegacyPicture, 3);
    AddSound();
    AddTrack(kAAFDataDef_LegacySound, 4);
    AddTrack(kAAFDataDef_LegacySound, 5);
    Ptr<IAAFEssenceDescriptor> essence = As<IAAFEssenceDescriptor>(multiple_);
    AddLocator(essence);
    MUST(As<IAAFSourceMob>(file_mob_)->SetEssenceDescriptor(essence));
    Ptr<IAAFImportDescriptor> import = Make<IAAFImportDescriptor>(AUID_AAFImportDescriptor);
    essence = As<IAAFEssenceDescriptor>(import);
    AddLocator(essence);
    MUST(As<IAAFSourceMob>(source_)->SetEssenceDescriptor(essence));
    MoveFileMobClips(1000);
    AddMobs();
    SetAppCode();
    AddColumns();
    SetAttributeList();
}

}  // namespace aaf_test
