// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Descriptions made with the AAF library that lies in the build folder and is
// found by its bare name along the program's run path, read back through the
// published interfaces.

#include <algorithm>
#include <map>

#include "host_interfaces/aaf/AAF.h"
#include "host_interfaces/aaf/AAFClassIds.h"
#include "host_interfaces/aaf/AAFResultCodes.h"
#include "source/aaf/ExtendedProperties.h"
#include "source/aaf/MobAttributes.h"
#include "source/aaf/MobIds.h"
#include "source/aaf/NewAAFFromMovie.h"
#include "tests/unit/aaf/support/DescriptionHost.h"

namespace NMA::Impl {
namespace {

template <class Interface>
using Pointer = IAAFSmartPointer<Interface>;

template <class Other, class Interface>
Pointer<Other> As(const Pointer<Interface>& object) {
    Pointer<Other> other;
    object->QueryInterface(aafIdOf((const Other*)nullptr), (void**)&other);
    return other;
}

class RealLibraryTest : public DescriptionHost {
protected:
    NCFRESULT Describe() {
        file = nullptr;
        header = nullptr;
        const NCFRESULT result = NewAAFFromMovie(Media(), Console(), &file, host.factory());
        if (result >= 0) {
            EXPECT_EQ(file->GetHeader(&header), 0);
            EXPECT_EQ(header->GetDictionary(&dictionary), 0);
        }
        return result;
    }
    Pointer<IAAFMob> Mob(aafUInt8 instance) {
        aafMobID_t id = MobIdTemplate(instance);
        GenerateUID(Media(), clip->content.data(), (ncfUInt32)clip->content.size(), id.material);
        Pointer<IAAFMob> mob;
        EXPECT_EQ(header->LookupMob(id, &mob), 0) << "mob " << int(instance);
        return mob;
    }
    Pointer<IAAFMob> Master() { return Mob(kMasterMobInstance); }
    Pointer<IAAFMob> FileMob() { return Mob(kFileMobInstance); }
    Pointer<IAAFMob> Source() { return Mob(kSourceMobInstance); }

    static std::vector<aafSlotID_t> SlotIds(const Pointer<IAAFMob>& mob) {
        std::vector<aafSlotID_t> ids;
        Pointer<IEnumAAFMobSlots> slots;
        EXPECT_EQ(mob->GetSlots(&slots), 0);
        Pointer<IAAFMobSlot> slot;
        while (slots->NextOne(&slot) == 0) {
            aafSlotID_t id = 0;
            slot->GetSlotID(&id);
            ids.push_back(id);
        }
        return ids;
    }
    static Pointer<IAAFMobSlot> Slot(const Pointer<IAAFMob>& mob, aafSlotID_t id) {
        Pointer<IAAFMobSlot> slot;
        EXPECT_EQ(mob->LookupSlot(id, &slot), 0);
        return slot;
    }
    static std::wstring NameOf(const Pointer<IAAFMobSlot>& slot) {
        aafCharacter name[64] = L"unread";
        EXPECT_EQ(slot->GetName(name, sizeof name), 0);
        return name;
    }
    static aafSourceRef_t ReferenceOf(const Pointer<IAAFMobSlot>& slot, aafLength_t* length) {
        Pointer<IAAFSegment> segment;
        EXPECT_EQ(slot->GetSegment(&segment), 0);
        EXPECT_EQ(As<IAAFComponent>(segment)->GetLength(length), 0);
        aafSourceRef_t reference{};
        EXPECT_EQ(As<IAAFSourceClip>(segment)->GetSourceReference(&reference), 0);
        return reference;
    }
    static Pointer<IAAFEssenceDescriptor> DescriptorOf(const Pointer<IAAFMob>& mob) {
        Pointer<IAAFEssenceDescriptor> descriptor;
        EXPECT_EQ(As<IAAFSourceMob>(mob)->GetEssenceDescriptor(&descriptor), 0);
        return descriptor;
    }
    std::vector<Pointer<IAAFFileDescriptor>> Children() {
        const auto multi = As<IAAFMultipleDescriptor>(DescriptorOf(FileMob()));
        aafUInt32 count = 0;
        EXPECT_EQ(multi->CountFileDescriptors(&count), 0);
        std::vector<Pointer<IAAFFileDescriptor>> children(count);
        for (aafUInt32 i = 0; i < count; ++i) {
            EXPECT_EQ(multi->GetFileDescriptorAt(i, &children[i]), 0);
        }
        return children;
    }
    static std::wstring LocatorOf(const Pointer<IAAFEssenceDescriptor>& descriptor) {
        aafUInt32 count = 0;
        EXPECT_EQ(descriptor->CountLocators(&count), 0);
        EXPECT_EQ(count, 1u);
        Pointer<IAAFLocator> locator;
        EXPECT_EQ(descriptor->GetLocatorAt(0, &locator), 0);
        aafCharacter path[256] = {};
        EXPECT_EQ(locator->GetPath(path, sizeof path), 0);
        EXPECT_NE((IAAFNetworkLocator*)As<IAAFNetworkLocator>(locator), nullptr);
        return path;
    }
    std::vector<std::pair<std::wstring, std::wstring>> Comments() {
        std::vector<std::pair<std::wstring, std::wstring>> comments;
        Pointer<IEnumAAFTaggedValues> values;
        EXPECT_EQ(Master()->GetComments(&values), 0);
        Pointer<IAAFTaggedValue> value;
        while (values->NextOne(&value) == 0) {
            aafCharacter name[64] = {};
            aafCharacter text[256] = {};
            aafUInt32 bytes = 0;
            EXPECT_EQ(value->GetName(name, sizeof name), 0);
            EXPECT_EQ(value->GetValue(sizeof text, (aafDataBuffer_t)text, &bytes), 0);
            comments.emplace_back(name, text);
        }
        return comments;
    }
    int CommentCount(const std::wstring& name, const std::wstring& value) {
        const auto all = Comments();
        return static_cast<int>(std::count(all.begin(), all.end(), std::make_pair(name, value)));
    }
    // The value of a registered property; null when the object lacks it.
    template <class Interface>
    Pointer<IAAFPropertyValue> Property(const Pointer<Interface>& object, const aafUID_t& classId,
                                        const aafUID_t& id) {
        Pointer<IAAFClassDef> classDef;
        EXPECT_EQ(dictionary->LookupClassDef(classId, &classDef), 0);
        Pointer<IAAFPropertyDef> property;
        Pointer<IAAFPropertyValue> value;
        if (classDef->LookupPropertyDef(id, &property) == 0) {
            As<IAAFObject>(object)->GetPropertyValue(property, &value);
        }
        return value;
    }
    aafInt32 IntegerOf(const Pointer<IAAFPropertyValue>& value) {
        Pointer<IAAFTypeDef> type;
        EXPECT_EQ(value->GetType(&type), 0);
        aafInt32 number = -1;
        EXPECT_EQ(As<IAAFTypeDefInt>(type)->GetInteger(value, (aafMemPtr_t)&number, sizeof number),
                  0);
        return number;
    }
    BoundsBox BoxOf(const Pointer<IAAFPropertyValue>& value) {
        Pointer<IAAFTypeDef> type;
        EXPECT_EQ(value->GetType(&type), 0);
        BoundsBox box;
        EXPECT_EQ(As<IAAFTypeDefRecord>(type)->GetStruct(value, (aafMemPtr_t)&box, sizeof box), 0);
        return box;
    }

    Pointer<IAAFFile> file;
    Pointer<IAAFHeader> header;
    Pointer<IAAFDictionary> dictionary;
};

TEST_F(RealLibraryTest, IsFoundByItsBareName) {
    clip->timecode.resize(1);
    ASSERT_EQ(Describe(), NCF_OK) << "build the target aaf_library";
    aafNumSlots_t count = 0;
    EXPECT_EQ(header->CountMobs(kAAFAllMob, &count), 0);
    EXPECT_EQ(count, 3u);
    EXPECT_EQ(header->CountMobs(kAAFFileMob, &count), 0);
    EXPECT_EQ(count, 1u);
}

TEST_F(RealLibraryTest, ChainsTheSlotsOfAClipWithTimecodeAndStereoSound) {
    clip->timecode.resize(1);
    clip->sound.resize(2);
    clip->sound[1].qtTrack = 9;
    ASSERT_EQ(Describe(), NCF_OK);
    EXPECT_EQ(SlotIds(Master()), (std::vector<aafSlotID_t>{2, 3, 4, 5, 6}));
    EXPECT_EQ(SlotIds(FileMob()), (std::vector<aafSlotID_t>{2, 3, 4, 5, 6}));
    EXPECT_EQ(SlotIds(Source()), (std::vector<aafSlotID_t>{1, 2, 3, 4, 5, 6}));
    for (const aafSlotID_t id : SlotIds(Master())) {
        aafLength_t length = 0;
        aafSourceRef_t reference = ReferenceOf(Slot(Master(), id), &length);
        EXPECT_EQ(reference.sourceID.instanceHigh, kFileMobInstance);
        EXPECT_EQ(reference.sourceSlotID, id);
        EXPECT_EQ(reference.startTime, 0);
        EXPECT_EQ(length, 100);
        reference = ReferenceOf(Slot(FileMob(), id), &length);
        EXPECT_EQ(reference.sourceID.instanceHigh, kSourceMobInstance);
        EXPECT_EQ(reference.startTime, 90000);
        EXPECT_EQ(length, 100);
        reference = ReferenceOf(Slot(Source(), id), &length);
        EXPECT_EQ(reference.sourceID.instanceHigh, 0);
        EXPECT_EQ(length, 12960000);
        EXPECT_EQ(NameOf(Slot(Master(), id)), L"");
        EXPECT_EQ(NameOf(Slot(FileMob(), id)), L"");
        EXPECT_EQ(NameOf(Slot(Source(), id)), L"");
        aafRational_t rate{};
        As<IAAFTimelineMobSlot>(Slot(Master(), id))->GetEditRate(&rate);
        EXPECT_EQ(rate.numerator, 25);
    }
}

TEST_F(RealLibraryTest, NamesTheTimecodeSlotAndItsNumber) {
    clip->timecode.resize(2);
    clip->timecode[1].qtTrack = 4;
    ASSERT_EQ(Describe(), NCF_OK);
    const std::pair<const wchar_t*, aafUInt32> expected[] = {{L"TC1", 1}, {L"AuxTC1", 3}};
    for (aafSlotID_t id = 1; id <= 2; ++id) {
        const auto slot = Slot(Source(), id);
        EXPECT_EQ(NameOf(slot), expected[id - 1].first);
        aafUInt32 number = 0;
        EXPECT_EQ(slot->GetPhysicalNum(&number), 0);
        EXPECT_EQ(number, expected[id - 1].second);
        Pointer<IAAFSegment> segment;
        slot->GetSegment(&segment);
        const auto sequence = As<IAAFSequence>(segment);
        aafUInt32 count = 0;
        EXPECT_EQ(sequence->CountComponents(&count), 0);
        EXPECT_EQ(count, id == 1 ? 1u : 3u);
        aafLength_t length = 0;
        EXPECT_EQ(As<IAAFComponent>(segment)->GetLength(&length), 0);
        EXPECT_EQ(length, 2160000);
    }
}

TEST_F(RealLibraryTest, MakesTimecodeUpFromTheFilesDate) {
    ASSERT_EQ(Describe(), NCF_OK);
    EXPECT_EQ(SlotIds(Source()), (std::vector<aafSlotID_t>{1, 2, 3}));
    Pointer<IAAFSegment> segment;
    Slot(Source(), 2)->GetSegment(&segment);
    Pointer<IAAFComponent> component;
    EXPECT_EQ(As<IAAFSequence>(segment)->GetComponentAt(1, &component), 0);
    aafTimecode_t timecode{};
    EXPECT_EQ(As<IAAFTimecode>(component)->GetTimecode(&timecode), 0);
    EXPECT_EQ(timecode.drop, kAAFTcDrop);
    EXPECT_EQ(timecode.fps, 25);
    aafLength_t length = 0;
    EXPECT_EQ(component->GetLength(&length), 0);
    EXPECT_EQ(length, 100);
}

TEST_F(RealLibraryTest, RefusesTheNegativeFillerOfAMixedClip) {
    clip->timecode.resize(2);
    clip->timecode[1].qtTrack = 4;
    clip->timecode[1].result = NCF_E_PARAMETERNOTAVAILABLE;
    EXPECT_EQ(Describe(), NCF_E_FAIL);
    EXPECT_TRUE(lines.contains("Unable to initialize the filler, AAFResult = 0x801200fc, "));
}

TEST_F(RealLibraryTest, BothSourceMobsPointAtTheMovie) {
    clip->timecode.resize(1);
    ASSERT_EQ(Describe(), NCF_OK);
    EXPECT_EQ(LocatorOf(DescriptorOf(FileMob())), L"file:///media/a%20clip.mov");
    EXPECT_EQ(LocatorOf(DescriptorOf(Source())), L"file:///media/a%20clip.mov");
    EXPECT_NE((IAAFMultipleDescriptor*)As<IAAFMultipleDescriptor>(DescriptorOf(FileMob())),
              nullptr);
    EXPECT_NE((IAAFImportDescriptor*)As<IAAFImportDescriptor>(DescriptorOf(Source())), nullptr);
}

TEST_F(RealLibraryTest, DescribesANativePictureByItsRecord) {
    MakeNative("cdci");
    clip->timecode.resize(1);
    clip->color().colorPrimaries = 1;
    clip->color().transferFunction = 1;
    clip->geometry().valid = {{1, 2}, {3, 4}, {5, 6}, {7, 8}};
    ASSERT_EQ(Describe(), NCF_OK);
    const auto children = Children();
    ASSERT_EQ(children.size(), 1u);
    const auto picture = children[0];
    const auto cdci = As<IAAFCDCIDescriptor>(picture);
    const auto image = As<IAAFDigitalImageDescriptor2>(picture);
    aafInt32 width = 0;
    EXPECT_EQ(cdci->GetComponentWidth(&width), 0);
    EXPECT_EQ(width, 10);
    aafUInt32 number = 0;
    EXPECT_EQ(cdci->GetWhiteReferenceLevel(&number), 0);
    EXPECT_EQ(number, 940u);
    EXPECT_EQ(image->GetFieldStartOffset(&number), 0);
    EXPECT_EQ(number, 8u);
    aafInt32 map[2] = {};
    EXPECT_EQ(image->GetVideoLineMap(2, map), 0);
    EXPECT_EQ(map[0], 42);
    EXPECT_EQ(map[1], 7);
    aafUID_t label{};
    EXPECT_EQ(image->GetCompression(&label), 0);
    EXPECT_EQ(label, ncfGuid("04010202-0306-0100-060E-2B340401010D"));
    EXPECT_EQ(image->GetTransferCharacteristic(&label), 0);
    EXPECT_EQ(label, ncfGuid("04010101-0102-0000-060E-2B3404010101"));
    Pointer<IAAFContainerDef> container;
    EXPECT_EQ(picture->GetContainerFormat(&container), 0);
    EXPECT_EQ(As<IAAFDefObject>(container)->GetAUID(&label), 0);
    EXPECT_EQ(label, ncfGuid("0D010301-021C-0100-060E-2B340401010D"));
    aafLength_t length = 0;
    EXPECT_EQ(picture->GetLength(&length), 0);
    EXPECT_EQ(length, 100);
    EXPECT_EQ(IntegerOf(Property(picture, AUID_AAFCDCIDescriptor, kAAFPropID_CDCIAVCISliceCount)),
              10);
    const BoundsBox valid =
        BoxOf(Property(picture, AUID_AAFDigitalImageDescriptor, kAAFPropID_DIDValidBox));
    EXPECT_EQ(valid.positionX, (Rational{1, 2}));
    EXPECT_EQ(valid.height, (Rational{7, 8}));
    const BoundsBox framing =
        BoxOf(Property(picture, AUID_AAFDigitalImageDescriptor, kAAFPropID_DIDBoundsBox));
    EXPECT_EQ(framing.width, (Rational{0, 0}));
}

TEST_F(RealLibraryTest, DescribesAProviderPictureByItsClip) {
    clip->timecode.resize(1);
    clip->pictureWidth = 720;
    clip->pictureHeight = 486;
    clip->layoutResult = NCF_E_PARAMETERNOTAVAILABLE;
    clip->codecName = "Apple Animation";
    ASSERT_EQ(Describe(), NCF_OK);
    const auto picture = Children().at(0);
    const auto image = As<IAAFDigitalImageDescriptor>(picture);
    aafFrameLayout_t layout = 0;
    EXPECT_EQ(image->GetFrameLayout(&layout), 0);
    EXPECT_EQ(layout, kAAFSeparateFields);
    aafUInt32 height = 0;
    aafUInt32 width = 0;
    EXPECT_EQ(image->GetStoredView(&height, &width), 0);
    EXPECT_EQ(height, 243u);
    EXPECT_EQ(width, 720u);
    aafInt32 x = 0;
    aafInt32 y = 0;
    EXPECT_EQ(image->GetSampledView(&height, &width, &x, &y), 0);
    EXPECT_EQ(width, 0u);
    aafUInt32 subsampling = 0;
    EXPECT_EQ(As<IAAFCDCIDescriptor>(picture)->GetVerticalSubsampling(&subsampling),
              AAFRESULT_PROP_NOT_PRESENT);
    EXPECT_EQ(As<IAAFDigitalImageDescriptor2>(picture)->GetFieldStartOffset(&subsampling),
              AAFRESULT_PROP_NOT_PRESENT);
    EXPECT_EQ((IAAFPropertyValue*)Property(picture, AUID_AAFCDCIDescriptor,
                                           kAAFPropID_CDCIAVCISliceCount),
              nullptr);
    EXPECT_EQ(CommentCount(L"Video", L"Animation"), 1);
    EXPECT_EQ(CommentCount(L"Image Aspect Ratio", L"16:9"), 1);
}

TEST_F(RealLibraryTest, TakesMpegAndRgbaDescriptors) {
    clip->timecode.resize(1);
    MakeNative("mpeg");
    ASSERT_EQ(Describe(), NCF_OK);
    const auto mpeg = As<IAAFMPEGVideoDescriptor>(Children().at(0));
    aafUInt16 gop = 0;
    EXPECT_EQ(mpeg->GetMaxGOP(&gop), 0);
    EXPECT_EQ(gop, 12);
    aafUInt8 profile = 0;
    EXPECT_EQ(mpeg->GetProfileAndLevel(&profile), 0);
    EXPECT_EQ(profile, 0x82);
    aafInt32 width = 0;
    EXPECT_EQ(As<IAAFCDCIDescriptor>(mpeg)->GetComponentWidth(&width), 0);
    EXPECT_EQ(width, 10);
    MakeNative("rgba");
    ASSERT_EQ(Describe(), NCF_OK);
    const auto rgba = As<IAAFRGBADescriptor2>(Children().at(0));
    aafUInt32 count = 0;
    EXPECT_EQ(rgba->CountPixelLayoutElements(&count), 0);
    EXPECT_EQ(count, 3u);
    EXPECT_EQ(rgba->GetComponentMaxRef(&count), 0);
    EXPECT_EQ(count, 254u);
}

TEST_F(RealLibraryTest, AlphaPassesTheRegistrationsTwice) {
    MakeNative("cdci");
    clip->timecode.resize(1);
    clip->setAlpha(true, false);
    ASSERT_EQ(Describe(), NCF_OK);
    ASSERT_EQ(Children().size(), 2u);
    for (const auto& picture : Children()) {
        EXPECT_EQ(
            IntegerOf(Property(picture, AUID_AAFCDCIDescriptor, kAAFPropID_CDCIAVCISliceCount)),
            10);
        EXPECT_NE((IAAFPropertyValue*)Property(picture, AUID_AAFDigitalImageDescriptor,
                                               kAAFPropID_DIDEssenceBox),
                  nullptr);
    }
    EXPECT_EQ(IntegerOf(Property(Master(), AUID_AAFMob, kAAFPropID_MobAppCode)), 1);
    EXPECT_EQ((IAAFPropertyValue*)Property(FileMob(), AUID_AAFMob, kAAFPropID_MobAppCode), nullptr);
}

TEST_F(RealLibraryTest, DescribesSoundOfBothRoads) {
    clip->videoTracks = 0;
    clip->timecode.resize(1);
    clip->sound.resize(2);
    clip->sound[1].qtTrack = 9;
    clip->sound[1].native = 0;
    clip->sound[1].metadata.sampleRate = 44100;
    ASSERT_EQ(Describe(), NCF_OK);
    const auto children = Children();
    ASSERT_EQ(children.size(), 2u);
    const aafUInt32 bits[] = {16, 24};
    const aafInt32 rates[] = {48000, 44100};
    for (int i = 0; i < 2; ++i) {
        const auto sound = As<IAAFSoundDescriptor>(children[i]);
        aafUInt32 number = 0;
        EXPECT_EQ(sound->GetQuantizationBits(&number), 0);
        EXPECT_EQ(number, bits[i]);
        EXPECT_EQ(sound->GetChannelCount(&number), 0);
        EXPECT_EQ(number, 2u);
        aafRational_t rate{};
        EXPECT_EQ(sound->GetAudioSamplingRate(&rate), 0);
        EXPECT_EQ(rate.numerator, rates[i]);
        EXPECT_EQ(rate.denominator, 1);
    }
    aafUInt32 average = 0;
    EXPECT_EQ(As<IAAFPCMDescriptor>(children[0])->GetAverageBPS(&average), 0);
    EXPECT_EQ(average, 1536000u);
    aafRational_t first{};
    As<IAAFFileDescriptor>(DescriptorOf(FileMob()))->GetSampleRate(&first);
    EXPECT_EQ(first.numerator, 48000);
    // The published library would keep one cell of a name, ours keeps all.
    EXPECT_EQ(CommentCount(L"Audio Format", L"LPCM"), 1);
    EXPECT_EQ(CommentCount(L"Audio Format", L"AAC"), 1);
}

TEST_F(RealLibraryTest, TheMasterMobCarriesMappingAndOption) {
    clip->timecode.resize(1);
    ASSERT_EQ(Describe(), NCF_OK);
    EXPECT_EQ(CommentCount(L"_ncfparametersxml.nma.bin.0",
                           L"6caede802de04e2f9f5d904b7a2c2f4a:Field Ordering:"
                           L"322655d50a5646ca9260d006f719b8a4:GFX-Video Level:"),
              1);
    const auto list = Property(Master(), AUID_AAFMob, kAAFPropID_MobAttributeList);
    ASSERT_NE((IAAFPropertyValue*)list, nullptr);
    Pointer<IAAFTypeDef> type;
    ASSERT_EQ(list->GetType(&type), 0);
    const auto array = As<IAAFTypeDefVariableArray>(type);
    aafUInt32 count = 0;
    EXPECT_EQ(array->GetCount(list, &count), 0);
    ASSERT_EQ(count, 1u);
    Pointer<IAAFPropertyValue> element;
    ASSERT_EQ(array->GetElementValue(list, 0, &element), 0);
    Pointer<IAAFTypeDef> elementType;
    ASSERT_EQ(element->GetType(&elementType), 0);
    Pointer<IAAFTaggedValue> option;
    ASSERT_EQ(As<IAAFTypeDefObjectRef>(elementType)
                  ->GetObject(element, IID_IAAFTaggedValue, (IUnknown**)&option),
              0);
    aafCharacter name[64] = {};
    EXPECT_EQ(option->GetName(name, sizeof name), 0);
    EXPECT_STREQ(name, L"_BOUNDS_REFORMATTING_OPTION");
    aafInt32 value = -1;
    aafUInt32 bytes = 0;
    EXPECT_EQ(option->GetValue(sizeof value, (aafDataBuffer_t)&value, &bytes), 0);
    EXPECT_EQ(value, 0);
}

TEST_F(RealLibraryTest, RefusesValuesThatNoPictureHas) {
    clip->nativePicture = 1;
    clip->timecode.resize(1);
    AAFInfo good;
    good.displayHeight = good.displayWidth = 16;
    good.videoLineMapVect = {1, 2};
    const struct {
        const char* what;
        void (*spoil)(AAFInfo&);
        AAFRESULT result;
    } cases[] = {
        {"siting", [](AAFInfo& info) { info.colorSiting = 5; }, AAFRESULT_INVALID_ENUM_VALUE},
        {"horizontal", [](AAFInfo& info) { info.horizontalSubsampling = 3; }, AAFRESULT_BAD_PROP},
        {"vertical", [](AAFInfo& info) { info.verticalSubsampling = 4; }, AAFRESULT_BAD_PROP},
        {"layout", [](AAFInfo& info) { info.frameLayout = 5; }, AAFRESULT_INVALID_ENUM_VALUE},
        {"no lines", [](AAFInfo& info) { info.videoLineMapVect.clear(); }, AAFRESULT_NULL_PARAM},
    };
    for (const auto& [what, spoil, result] : cases) {
        clip->record = good;
        spoil(clip->record);
        EXPECT_EQ(Describe(), result) << what;
    }
    clip->record = good;
    clip->record.colorSiting = 255;
    EXPECT_EQ(Describe(), NCF_OK);
}

TEST_F(RealLibraryTest, NamesEveryMobAfterTheFile) {
    clip->timecode.resize(1);
    ASSERT_EQ(Describe(), NCF_OK);
    for (const auto& mob : {Master(), FileMob(), Source()}) {
        aafCharacter name[64] = {};
        EXPECT_EQ(mob->GetName(name, sizeof name), 0);
        EXPECT_STREQ(name, L"a clip");
    }
}

}  // namespace
}  // namespace NMA::Impl
