// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "tests/unit/aaf_library/stored/SampleModel.h"

#include "aaf_library/model/ClassDefinition.h"
#include "aaf_library/model/TypeDefinition.h"
#include "aaf_library/stored/ModelTypes.h"
#include "host_interfaces/aaf/AAFClassIds.h"
#include "host_interfaces/aaf/AAFDefinitionIds.h"
#include "host_interfaces/aaf/AAFTypeDefinitions.h"
#include "host_interfaces/aaf/AAFTypeIds.h"

#include <stdexcept>

namespace aaf::stored::sample {

namespace {

void must(HRESULT result) {
    if (result < 0) {
        throw std::runtime_error("the sample cannot be made: " + std::to_string(result));
    }
}

constexpr GUID kAafContainerId = ncfGuid("4313B571-D8BA-11D2-809B-006008143E6F");

class Maker {
public:
    Maker() : model_(NewModel()) {}

    SampleModel empty() {
        RefPtr<Object> header = Make(AUID_AAFHeader);
        must(header->PutInteger(prop::Header_ByteOrder, 0x4949));
        must(header->PutStruct(prop::Header_LastModified, date()));
        must(header->PutStruct(prop::Header_Version, aafVersionType_t{1, 1}));
        must(header->PutInteger(prop::Header_ObjectModelVersion, 1));
        must(header->PutObject(prop::Header_Content, id(Make(AUID_AAFContentStorage))));
        must(header->AppendObject(prop::Header_IdentificationList, id(identification())));
        return {model_, header};
    }

    SampleModel whole() {
        AddExtensions();
        SampleModel sample = empty();
        Object& content = *sample.header->ObjectAt(prop::Header_Content);
        for (const RefPtr<Object>& mob : {MasterMob(), FileMob(), ImportMob()}) {
            must(content.AddToSet(prop::ContentStorage_Mobs, id(mob)));
        }
        return sample;
    }

private:
    static IUnknown* id(const RefPtr<Object>& object) { return object->Identity(); }

    RefPtr<Object> Make(const GUID& classId) {
        return model_->CreateObject(*model_->FindClass(classId));
    }

    static aafTimeStamp_t date() { return {{2024, 2, 29}, {23, 59, 58, 99}}; }

    RefPtr<Object> identification() {
        RefPtr<Object> object = Make(AUID_AAFIdentification);
        must(object->PutString(prop::Identification_CompanyName, L"Cliphost"));
        must(object->PutString(prop::Identification_ProductName, L""));
        must(object->PutString(prop::Identification_ProductVersionString, L"1"));
        must(object->PutStruct(prop::Identification_ProductID, kOwnClassId));
        must(object->PutStruct(prop::Identification_Date, date()));
        must(object->PutStruct(prop::Identification_GenerationAUID, kQuadTypeId));
        return object;
    }

    void AddExtensions() {
        TypeFacts quad;
        quad.id = kQuadTypeId;
        quad.name = L"ExampleQuad";
        quad.kind = TypeKind::Record;
        for (const wchar_t* name : {L"Left", L"Top", L"Right", L"Bottom"}) {
            quad.members.push_back({name, kAAFTypeID_Rational, 0});
        }
        must(model_->RegisterType(*StorableType(quad, *model_)));
        ClassDefinition* descriptor = model_->FindClass(AUID_AAFDigitalImageDescriptor);
        descriptor->AddProperty(kQuadPropertyId, L"ExampleActiveArea", kQuadTypeId, true, false);
        model_->FindClass(AUID_AAFMob)
            ->AddProperty(kNotePropertyId, L"ExampleNotes",
                          kAAFTypeID_TaggedValueStrongReferenceVector, true, false);

        RefPtr<ClassDefinition> own(new ClassDefinition);
        own->JoinModel(*model_);
        must(own->SetIdentity(kOwnClassId, L"ExampleLocator"));
        own->SetParent(model_->FindClass(AUID_AAFLocator));
        own->SetConcrete(true);
        must(model_->RegisterClass(*own));
        own->AddProperty(kOwnPropertyId, L"ExamplePlace", kAAFTypeID_Int64Array, true, false);

        RefPtr<Object> definition = Make(AUID_AAFContainerDef);
        must(definition->PutStruct(prop::DefinitionObject_Identification, kOwnDefinitionId));
        must(definition->PutString(prop::DefinitionObject_Name, L"Example container"));
        must(model_->dictionary().AddToSet(prop::Dictionary_ContainerDefinitions, id(definition)));
    }

    RefPtr<Object> mob(const GUID& classId, std::uint8_t number, const wchar_t* name) {
        RefPtr<Object> object = Make(classId);
        must(object->PutStruct(prop::Mob_MobID, MobId(number)));
        must(object->PutString(prop::Mob_Name, name));
        must(object->PutStruct(prop::Mob_CreationTime, date()));
        must(object->PutStruct(prop::Mob_LastModified, date()));
        return object;
    }

    RefPtr<Object> slot(int number, const wchar_t* name, const RefPtr<Object>& segment) {
        RefPtr<Object> object = Make(AUID_AAFTimelineMobSlot);
        must(object->PutInteger(prop::MobSlot_SlotID, number));
        must(object->PutString(prop::MobSlot_SlotName, name));
        must(object->PutObject(prop::MobSlot_Segment, id(segment)));
        must(object->PutStruct(prop::TimelineMobSlot_EditRate, aafRational_t{24000, 1001}));
        must(object->PutInteger(prop::TimelineMobSlot_Origin, -5));
        return object;
    }

    void SetKind(Object& component, const GUID& kind) {
        Unknown* definition = model_->FindTarget(AUID_AAFDataDef, kind);
        must(component.PutWeak(prop::Component_DataDefinition, definition->Identity()));
    }

    RefPtr<Object> SourceClip(const GUID& kind, const aafMobID_t& source, int slot) {
        RefPtr<Object> object = Make(AUID_AAFSourceClip);
        SetKind(*object, kind);
        must(object->PutInteger(prop::Component_Length, 100));
        must(object->PutStruct(prop::SourceReference_SourceID, source));
        must(object->PutInteger(prop::SourceReference_SourceMobSlotID, slot));
        must(object->PutInteger(prop::SourceClip_StartTime, slot == 0 ? 0 : 7));
        return object;
    }

    RefPtr<Object> tagged(const wchar_t* name, const GUID& type, const void* data,
                          std::size_t size) {
        RefPtr<Object> object = Make(AUID_AAFTaggedValue);
        IAAFTypeDef* definition = nullptr;
        must(GiveOut(model_->FindType(type), &definition));
        must(object->PutString(prop::TaggedValue_Name, name));
        must(object->PutIndirect(prop::TaggedValue_Value, definition, data, size));
        definition->Release();
        return object;
    }

    RefPtr<Object> comment(const wchar_t* name, const std::wstring& value) {
        return tagged(name, kAAFTypeID_String, value.c_str(), (value.size() + 1) * sizeof(wchar_t));
    }

    RefPtr<Object> MasterMob() {
        RefPtr<Object> object = mob(AUID_AAFMasterMob, 9, L"clip \xE4 \x4E2D");
        must(object->AppendObject(
            prop::Mob_Slots, id(slot(1, L"V1", SourceClip(kAAFDataDef_Picture, MobId(5), 1)))));
        RefPtr<Object> sequence = Make(AUID_AAFSequence);
        SetKind(*sequence, kAAFDataDef_Sound);
        must(sequence->PutInteger(prop::Component_Length, 100));
        must(sequence->AppendObject(prop::Sequence_Components,
                                    id(SourceClip(kAAFDataDef_Sound, MobId(5), 2))));
        must(object->AppendObject(prop::Mob_Slots, id(slot(2, L"", sequence))));
        must(object->AppendObject(prop::Mob_UserComments, id(comment(L"Scene", L""))));
        must(object->AppendObject(prop::Mob_UserComments, id(comment(L"", L"two \U0001F3AC"))));
        const aafInt32 seven = 7;
        PropertyDefinition* notes = model_->FindProperty(kNotePropertyId);
        must(object->AppendObject(notes->key(),
                                  id(tagged(L"Count", kAAFTypeID_Int32, &seven, sizeof seven))));
        return object;
    }

    RefPtr<Object> picture() {
        RefPtr<Object> object = Make(AUID_AAFCDCIDescriptor);
        must(object->PutStruct(prop::FileDescriptor_SampleRate, aafRational_t{24000, 1001}));
        must(object->PutInteger(prop::FileDescriptor_Length, 100));
        must(object->PutInteger(prop::DigitalImageDescriptor_StoredHeight, 1080));
        must(object->PutInteger(prop::DigitalImageDescriptor_StoredWidth, 1920));
        must(object->PutInteger(prop::DigitalImageDescriptor_FrameLayout, 0));
        const aafInt32 lines[] = {42, 0};
        must(object->PutNative(prop::DigitalImageDescriptor_VideoLineMap, lines, sizeof lines));
        must(
            object->PutStruct(prop::DigitalImageDescriptor_ImageAspectRatio, aafRational_t{16, 9}));
        must(object->PutInteger(prop::CDCIDescriptor_ComponentWidth, 8));
        must(object->PutInteger(prop::CDCIDescriptor_HorizontalSubsampling, 2));
        Unknown* container = model_->FindTarget(AUID_AAFContainerDef, kAafContainerId);
        must(object->PutWeak(prop::FileDescriptor_ContainerFormat, container->Identity()));
        PropertyValue* area = object->RequireValue(model_->FindProperty(kQuadPropertyId)->key());
        area->BytesToChange() = {0,   0, 0, 0, 1, 0, 0, 0, 0,  0, 0, 0, 1, 0, 0, 0,
                                 128, 7, 0, 0, 1, 0, 0, 0, 56, 4, 0, 0, 1, 0, 0, 0};
        return object;
    }

    RefPtr<Object> FileMob() {
        RefPtr<Object> object = mob(AUID_AAFSourceMob, 5, L"file");
        RefPtr<Object> descriptor = Make(AUID_AAFMultipleDescriptor);
        must(descriptor->PutStruct(prop::FileDescriptor_SampleRate, aafRational_t{24, 1}));
        must(descriptor->PutInteger(prop::FileDescriptor_Length, 100));
        must(descriptor->AppendObject(prop::MultipleDescriptor_FileDescriptors, id(picture())));
        RefPtr<Object> locator = Make(AUID_AAFNetworkLocator);
        must(locator->PutString(prop::NetworkLocator_URLString, L"file:///clip.mov"));
        must(descriptor->AppendObject(prop::EssenceDescriptor_Locator, id(locator)));
        RefPtr<Object> own = Make(kOwnClassId);
        own->RequireValue(model_->FindProperty(kOwnPropertyId)->key())->BytesToChange() =
            Bytes(24, 3);
        must(descriptor->AppendObject(prop::EssenceDescriptor_Locator, id(own)));
        must(object->PutObject(prop::SourceMob_EssenceDescription, id(descriptor)));
        must(object->AppendObject(
            prop::Mob_Slots, id(slot(1, L"V1", SourceClip(kAAFDataDef_Picture, aafMobID_t{}, 0)))));
        must(object->AppendObject(
            prop::Mob_Slots, id(slot(2, L"A1", SourceClip(kAAFDataDef_Sound, aafMobID_t{}, 0)))));
        return object;
    }

    RefPtr<Object> ImportMob() {
        RefPtr<Object> object = mob(AUID_AAFSourceMob, 7, L"import");
        must(object->PutObject(prop::SourceMob_EssenceDescription,
                               id(Make(AUID_AAFImportDescriptor))));
        RefPtr<Object> timecode = Make(AUID_AAFTimecode);
        SetKind(*timecode, kAAFDataDef_Timecode);
        must(timecode->PutInteger(prop::Component_Length, 100));
        must(timecode->PutInteger(prop::Timecode_Start, 86400));
        must(timecode->PutInteger(prop::Timecode_FPS, 24));
        must(timecode->PutInteger(prop::Timecode_Drop, 0));
        must(object->AppendObject(prop::Mob_Slots, id(slot(1, L"TC1", timecode))));
        return object;
    }

    RefPtr<Model> model_;
};

}  // namespace

RefPtr<Model> NewModel() {
    static const ClassRegistry classes;
    return Model::Create(classes);
}

SampleModel WholeModel() {
    return Maker().whole();
}

SampleModel EmptyModel() {
    return Maker().empty();
}

Object& mob(Object& header, std::size_t index) {
    return *header.ObjectAt(prop::Header_Content)->ObjectAt(prop::ContentStorage_Mobs, index);
}

Object& slot(Object& mob, std::size_t index) {
    return *mob.ObjectAt(prop::Mob_Slots, index);
}

aafMobID_t MobId(std::uint8_t last) {
    aafMobID_t id{};
    const std::uint8_t label[] = {6, 10, 43, 52, 1, 1, 1, 1, 1, 1, 15, 0};
    std::copy(std::begin(label), std::end(label), id.SMPTELabel);
    id.length = 0x13;
    id.material.Data1 = 0x01020304;
    id.material.Data4[7] = last;
    return id;
}

}  // namespace aaf::stored::sample
