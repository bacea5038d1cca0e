// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// File, header, dictionary, definitions, types and values.

#include "host_interfaces/aaf/AAFClassIds.h"
#include "host_interfaces/aaf/AAFDefinitions.h"
#include "host_interfaces/aaf/AAFDictionary.h"
#include "host_interfaces/aaf/AAFMetaDefinitions.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "host_interfaces/aaf/AAFTypeDefinitions.h"
#include "host_interfaces/aaf/AAFTypeDefinitionsOfMany.h"
#include "host_interfaces/aaf/AAFTypeIds.h"
#include "tests/unit/aaf/support/FakeAAFObject.h"

namespace {

struct ClassName {
    GUID id;
    const char* name;
};
constexpr ClassName kClassNames[] = {
    {AUID_AAFMasterMob, "MasterMob"},
    {AUID_AAFSourceMob, "SourceMob"},
    {AUID_AAFMultipleDescriptor, "MultipleDescriptor"},
    {AUID_AAFImportDescriptor, "ImportDescriptor"},
    {AUID_AAFMPEGVideoDescriptor, "MPEGVideoDescriptor"},
    {AUID_AAFRGBADescriptor, "RGBADescriptor"},
    {AUID_AAFCDCIDescriptor, "CDCIDescriptor"},
    {AUID_AAFPCMDescriptor, "PCMDescriptor"},
    {AUID_AAFNetworkLocator, "NetworkLocator"},
    {AUID_AAFTaggedValue, "TaggedValue"},
    {AUID_AAFSequence, "Sequence"},
    {AUID_AAFTimecode, "Timecode"},
    {AUID_AAFFiller, "Filler"},
    {AUID_AAFContainerDef, "ContainerDef"},
    {AUID_AAFTypeDefRecord, "TypeDefRecord"},
    {AUID_AAFMob, "Mob"},
    {AUID_AAFDigitalImageDescriptor, "DigitalImageDescriptor"},
};

std::string NameOfClass(const GUID& id) {
    for (const ClassName& entry : kClassNames) {
        if (entry.id == id) {
            return entry.name;
        }
    }
    return Shown(id);
}

// Definitions that a new dictionary lacks: those of the module.
constexpr GUID kBoundsBoxType = ncfGuid("0E040301-0200-0000-060E-2B3401040101");

struct FileFace final : FakeAAFFace<IAAFFile> {
    using FakeAAFFace::FakeAAFFace;
    HRESULT GetHeader(IAAFHeader** header) override {
        const HRESULT refused = note("GetHeader");
        if (refused) {
            return refused;
        }
        FakeAAFObject* const made = self_.make("Header");
        made->keep(self_.definition(IID_IAAFDictionary));
        made->definitions = self_.definitions;
        *header = static_cast<IAAFHeader*>(made->face(IID_IAAFHeader));
        self_.keep(made);
        made->release();
        return AAFRESULT_SUCCESS;
    }
};

struct HeaderFace final : FakeAAFFace<IAAFHeader> {
    using FakeAAFFace::FakeAAFFace;
    HRESULT GetDictionary(IAAFDictionary** dictionary) override {
        const HRESULT refused = note("GetDictionary");
        if (!refused) {
            *dictionary = static_cast<IAAFDictionary*>(
                self_.definition(IID_IAAFDictionary)->face(IID_IAAFDictionary));
        }
        return refused;
    }
    HRESULT AddMob(IAAFMob* mob) override {
        const HRESULT refused = note("AddMob", (IUnknown*)mob);
        if (!refused) {
            self_.keep(FakeAAFObject::of(mob));
        }
        return refused;
    }
};

struct DictionaryFace final : FakeAAFFace<IAAFDictionary> {
    using FakeAAFFace::FakeAAFFace;

    HRESULT CreateInstance(aafUID_constref id, REFIID iid, IUnknown** object) override {
        const HRESULT refused = note("CreateInstance " + NameOfClass(id));
        return refused ? refused : self_.create(NameOfClass(id), iid, (void**)object);
    }
    HRESULT CreateMetaInstance(aafUID_constref id, REFIID iid, IUnknown** object) override {
        const HRESULT refused = note("CreateMetaInstance " + NameOfClass(id));
        return refused ? refused : self_.create(NameOfClass(id), iid, (void**)object);
    }
    HRESULT LookupClassDef(aafUID_constref id, IAAFClassDef** out) override {
        return lookUp("LookupClassDef " + NameOfClass(id), id, "ClassDef" + NameOfClass(id), true,
                      IID_IAAFClassDef, (void**)out);
    }
    HRESULT LookupTypeDef(aafUID_constref id, IAAFTypeDef** out) override {
        return lookUp("LookupTypeDef " + Shown(id), id, "TypeDef", !(id == kBoundsBoxType),
                      IID_IAAFTypeDef, (void**)out);
    }
    HRESULT LookupDataDef(aafUID_constref id, IAAFDataDef** out) override {
        return lookUp("LookupDataDef " + Shown(id), id, "DataDef", true, IID_IAAFDataDef,
                      (void**)out);
    }
    HRESULT LookupContainerDef(aafUID_constref id, IAAFContainerDef** out) override {
        return lookUp("LookupContainerDef " + Shown(id), id, "ContainerDef", false,
                      IID_IAAFContainerDef, (void**)out);
    }
    HRESULT RegisterTypeDef(IAAFTypeDef* type) override {
        const HRESULT refused = note("RegisterTypeDef " + Shown((IUnknown*)type));
        if (!refused) {
            define(kBoundsBoxType, FakeAAFObject::of(type));
        }
        return refused;
    }
    HRESULT RegisterContainerDef(IAAFContainerDef* container) override {
        const HRESULT refused = note("RegisterContainerDef " + Shown((IUnknown*)container));
        if (!refused) {
            FakeAAFObject* const object = FakeAAFObject::of(container);
            define(object->mobID.material, object);
        }
        return refused;
    }

private:
    HRESULT note(const std::string& call) { return self_.note(call, {}); }
    void define(const GUID& id, FakeAAFObject* object) {
        self_.keep(object);
        self_.definitions.emplace_back(id, object);
    }
    HRESULT lookUp(const std::string& call, const GUID& id, const std::string& className,
                   bool builtIn, const GUID& iid, void** out) {
        const HRESULT refused = note(call);
        if (refused) {
            return refused;
        }
        FakeAAFObject* found = self_.definition(id);
        if (!found && !builtIn) {
            return AAFRESULT_NO_MORE_OBJECTS;
        }
        if (!found) {
            found = self_.make(className);
            define(id, found);
            found->release();
        }
        *out = found->face(iid);
        return AAFRESULT_SUCCESS;
    }
};

struct ClassDefFace final : FakeAAFFace<IAAFClassDef> {
    using FakeAAFFace::FakeAAFFace;
    HRESULT CreateInstance(REFIID iid, IUnknown** object) override {
        const HRESULT refused = note("CreateInstance");
        // "ClassDefSequence1" makes "Sequence1".
        const std::string& name = self_.name();
        const std::string className = name.substr(8, name.find_last_not_of("0123456789") - 7);
        return refused ? refused : self_.create(className, iid, (void**)object);
    }
    HRESULT LookupPropertyDef(aafUID_constref id, IAAFPropertyDef** out) override {
        const HRESULT answer = note("LookupPropertyDef", id);
        if (answer < 0) {
            return answer;
        }
        FakeAAFObject* const found = self_.definition(id);
        if (!found) {
            return AAFRESULT_NO_MORE_OBJECTS;
        }
        *out = static_cast<IAAFPropertyDef*>(found->face(IID_IAAFPropertyDef));
        return answer;  // a positive one is a success with something to tell
    }
    HRESULT RegisterOptionalPropertyDef(aafUID_constref id, aafCharacter_constptr name,
                                        IAAFTypeDef* type, IAAFPropertyDef** out) override {
        const HRESULT refused = note("RegisterOptionalPropertyDef", id, name, (IUnknown*)type);
        if (refused) {
            return refused;
        }
        if (self_.definition(id)) {
            return AAFRESULT_INVALID_PARAM;
        }
        std::string className = Shown(name);
        className = "Property" + className.substr(1, className.size() - 2);
        FakeAAFObject* const property = self_.make(className);
        self_.keep(property);
        self_.definitions.emplace_back(id, property);
        *out = static_cast<IAAFPropertyDef*>(property->face(IID_IAAFPropertyDef));
        property->release();
        return AAFRESULT_SUCCESS;
    }
};

struct ContainerDefFace final : FakeAAFFace<IAAFContainerDef> {
    using FakeAAFFace::FakeAAFFace;
    HRESULT Initialize(aafUID_constref id, aafCharacter_constptr name,
                       aafCharacter_constptr description) override {
        self_.mobID.material = id;
        return note("Initialize", id, name, description);
    }
};

struct TypeDefFace final : FakeAAFFace<IAAFTypeDef> {
    using FakeAAFFace::FakeAAFFace;
};

std::string Bytes(aafMemPtr_t bytes, aafUInt32 size) {
    std::string text;
    for (aafUInt32 at = 0; at + sizeof(aafInt32) <= size; at += sizeof(aafInt32)) {
        aafInt32 number = 0;
        std::memcpy(&number, bytes + at, sizeof number);
        text += (at ? " " : "") + Shown(number);
    }
    return "[" + text + "]";
}

struct TypeDefIntFace final : FakeAAFFace<IAAFTypeDefInt> {
    using FakeAAFFace::FakeAAFFace;
    HRESULT CreateValue(aafMemPtr_t bytes, aafUInt32 size, IAAFPropertyValue** out) override {
        const HRESULT refused = self_.note("CreateValue", {Bytes(bytes, size)});
        return refused ? refused : self_.create("Value", IID_IAAFPropertyValue, (void**)out);
    }
};

struct TypeDefRecordFace final : FakeAAFFace<IAAFTypeDefRecord> {
    using FakeAAFFace::FakeAAFFace;
    HRESULT Initialize(aafUID_constref id, IAAFTypeDef** types, aafString_t* names, aafUInt32 count,
                       aafCharacter_constptr name) override {
        std::vector<std::string> arguments = {Shown(id), Shown(name)};
        for (aafUInt32 i = 0; i < count; ++i) {
            arguments.push_back(Shown((IUnknown*)types[i]) + ":" + Shown(names[i]));
        }
        return self_.note("Initialize", arguments);
    }
    HRESULT RegisterMembers(aafUInt32* offsets, aafUInt32 count, aafUInt32 size) override {
        return self_.note("RegisterMembers",
                          {Bytes(reinterpret_cast<aafMemPtr_t>(offsets), count * 4), Shown(size)});
    }
    HRESULT CreateValueFromStruct(aafMemPtr_t bytes, aafUInt32 size,
                                  IAAFPropertyValue** out) override {
        const HRESULT refused = self_.note("CreateValueFromStruct", {Bytes(bytes, size)});
        return refused ? refused : self_.create("Value", IID_IAAFPropertyValue, (void**)out);
    }
};

struct TypeDefVariableArrayFace final : FakeAAFFace<IAAFTypeDefVariableArray> {
    using FakeAAFFace::FakeAAFFace;
    HRESULT CreateEmptyValue(IAAFPropertyValue** out) override {
        const HRESULT refused = note("CreateEmptyValue");
        return refused ? refused : self_.create("ArrayValue", IID_IAAFPropertyValue, (void**)out);
    }
    HRESULT AppendElement(IAAFPropertyValue* array, IAAFPropertyValue* element) override {
        return note("AppendElement", (IUnknown*)array, (IUnknown*)element);
    }
};

struct TypeDefObjectRefFace final : FakeAAFFace<IAAFTypeDefObjectRef> {
    using FakeAAFFace::FakeAAFFace;
    HRESULT CreateValue(IUnknown* object, IAAFPropertyValue** out) override {
        const HRESULT refused = note("CreateValue", object);
        return refused ? refused : self_.create("ObjectValue", IID_IAAFPropertyValue, (void**)out);
    }
};

struct PropertyDefFace final : FakeAAFFace<IAAFPropertyDef> {
    using FakeAAFFace::FakeAAFFace;
};

struct PropertyValueFace final : FakeAAFFace<IAAFPropertyValue> {
    using FakeAAFFace::FakeAAFFace;
};

struct ObjectFace final : FakeAAFFace<IAAFObject> {
    using FakeAAFFace::FakeAAFFace;
    HRESULT SetPropertyValue(IAAFPropertyDef* property, IAAFPropertyValue* value) override {
        return note("SetPropertyValue", (IUnknown*)property, (IUnknown*)value);
    }
};

struct TaggedValueFace final : FakeAAFFace<IAAFTaggedValue> {
    using FakeAAFFace::FakeAAFFace;
    HRESULT Initialize(aafCharacter_constptr name, IAAFTypeDef* type, aafUInt32 size,
                       aafDataBuffer_t value) override {
        return self_.note("Initialize", {Shown(name), Shown((IUnknown*)type), Bytes(value, size)});
    }
};

struct UnknownFace final : FakeAAFFace<IUnknown> {
    using FakeAAFFace::FakeAAFFace;
};

}  // namespace

FakeAAFFaceMaker FindModelFace(const GUID& iid) {
    static const FakeAAFFaceEntry entries[] = {
        {IID_IUnknown, MakeFakeAAFFace<UnknownFace, IUnknown>},
        {IID_IAAFFile, MakeFakeAAFFace<FileFace, IAAFFile>},
        {IID_IAAFHeader, MakeFakeAAFFace<HeaderFace, IAAFHeader>},
        {IID_IAAFDictionary, MakeFakeAAFFace<DictionaryFace, IAAFDictionary>},
        {IID_IAAFClassDef, MakeFakeAAFFace<ClassDefFace, IAAFClassDef>},
        {IID_IAAFContainerDef, MakeFakeAAFFace<ContainerDefFace, IAAFContainerDef>},
        {IID_IAAFTypeDef, MakeFakeAAFFace<TypeDefFace, IAAFTypeDef>},
        {IID_IAAFTypeDefInt, MakeFakeAAFFace<TypeDefIntFace, IAAFTypeDefInt>},
        {IID_IAAFTypeDefRecord, MakeFakeAAFFace<TypeDefRecordFace, IAAFTypeDefRecord>},
        {IID_IAAFTypeDefVariableArray,
         MakeFakeAAFFace<TypeDefVariableArrayFace, IAAFTypeDefVariableArray>},
        {IID_IAAFTypeDefObjectRef, MakeFakeAAFFace<TypeDefObjectRefFace, IAAFTypeDefObjectRef>},
        {IID_IAAFPropertyDef, MakeFakeAAFFace<PropertyDefFace, IAAFPropertyDef>},
        {IID_IAAFPropertyValue, MakeFakeAAFFace<PropertyValueFace, IAAFPropertyValue>},
        {IID_IAAFObject, MakeFakeAAFFace<ObjectFace, IAAFObject>},
        {IID_IAAFTaggedValue, MakeFakeAAFFace<TaggedValueFace, IAAFTaggedValue>},
    };
    return FindFace(entries, iid);
}
