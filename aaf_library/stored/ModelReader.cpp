// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/ModelReader.h"

#include "aaf_library/model/ClassDefinition.h"
#include "aaf_library/model/Dictionary.h"
#include "aaf_library/model/Model.h"
#include "aaf_library/model/TypeReference.h"
#include "aaf_library/stored/KeptProperty.h"
#include "aaf_library/stored/MetaPids.h"
#include "aaf_library/stored/MetaRegistration.h"
#include "aaf_library/stored/ModelNames.h"
#include "aaf_library/stored/ModelTypes.h"
#include "aaf_library/stored/PropertyFormat.h"
#include "aaf_library/stored/StoredError.h"
#include "aaf_library/stored/StoredNames.h"
#include "host_interfaces/aaf/AAFClassIds.h"
#include "host_interfaces/aaf/AAFTypeIds.h"

#include <set>
#include <unordered_set>

namespace aaf::stored {

namespace {

// A file that is damaged all over would have thousands.
constexpr std::size_t kMostNotes = 100;

constexpr const char* kOtherForm = "is stored in another form than its type has";

const StoredObject& ContainedIn(const StoredObject& holder, std::uint16_t pid, const char* what) {
    const StoredProperty* property = holder.Find(pid);
    if (property == nullptr || property->form != StoredForm::StrongReference) {
        throw StoredError(std::string("has no ") + what);
    }
    return property->objects.front();
}

class ModelReader {
public:
    ModelReader(const MetaRecords& records, Model& model, std::vector<std::string>& notes)
        : model_(model), definitions_(records, model), notes_(notes) {
        for (const std::string& note : records.notes) {
            Note(note);
        }
        for (const std::string& note : definitions_.notes()) {
            Note(note);
        }
    }

    RefPtr<Object> ReadHeader(const StoredObject& from) {
        MergeDictionary(ContainedIn(from, prop::Header_Dictionary.pid, "dictionary"));
        RefPtr<Object> header = NewObject(from, AUID_AAFHeader);
        Fill(*header, from, prop::Header_Dictionary.id);
        header->PutObject(prop::Header_Dictionary, model_.dictionary().Identity());
        if (header->ObjectAt(prop::Header_Content) == nullptr) {
            throw StoredError("has no content");
        }
        if (notMentioned_ != 0) {
            notes_.push_back("and " + std::to_string(notMentioned_) + " more of the kind");
        }
        return header;
    }

private:
    // An empty object of the class, which has to be of the expected kind: the
    // operations of objects rely on what they find in their properties.
    RefPtr<Object> NewObject(const StoredObject& from, const GUID& expected) {
        ClassDefinition* definition = model_.FindClass(GuidOf(from.classId));
        if (definition == nullptr || !definition->IsKindOf(AUID_AAFInterchangeObject)) {
            throw StoredError("an object of a class that is not defined");
        }
        if (!definition->IsKindOf(expected)) {
            throw StoredError("an object of the class " + ToUtf8(definition->name()) +
                              " in a place for others");
        }
        RefPtr<Object> object = model_.CreateObject(*definition, false);
        if (!object) {
            throw StoredError("an object of the class " + ToUtf8(definition->name()) +
                              " cannot be made");
        }
        return object;
    }

    void Fill(Object& object, const StoredObject& from, const GUID& leftOut = {}) {
        std::unordered_set<PropertyId> met;
        for (const StoredProperty& property : from.properties) {
            const PropertyDefinition* definition =
                definitions_.property(object.classDefinition(), property.pid);
            if (definition == nullptr) {
                Note(Place() + ToUtf8(object.classDefinition().name()) + ": " +
                     PropertyText(property.pid) + " is defined nowhere; it is left out");
                continue;
            }
            if (definition->id() == leftOut ||
                definition->id() == prop::InterchangeObject_ObjClass.id) {
                continue;
            }
            place_.push_back(definition);
            ReadProperty(object, *definition, property, met.insert(definition->pid()).second);
            place_.pop_back();
        }
    }

    void ReadProperty(Object& object, const PropertyDefinition& definition,
                      const StoredProperty& from, bool isFirst) {
        try {
            if (definition.type() == nullptr) {
                throw StoredError("has a type that is defined nowhere");
            }
            const RefPtr<PropertyValue> value = ValueOf(*definition.type(), from);
            if (object.PutValue(definition.pid(), value.get()) < 0) {
                throw StoredError("an object cannot hold it");
            }
        } catch (const StoredError& problem) {
            KeepAsStored(object, definition, from, isFirst, problem.what());
        }
    }

    // In place of what a built-in definition says of itself, but for its id, by which it is found.
    // Sets of definitions stay too.
    void KeepAsStored(Object& object, const PropertyDefinition& definition,
                      const StoredProperty& from, bool isFirst, const std::string& problem) {
        const PropertyValue* const present = object.MadeValues().Find(definition.pid());
        if (present != nullptr && (!isFirst || definition.IsUnique() || present->HoldsObjects())) {
            Note(Place() + problem + "; it is left out");
            return;
        }
        const RefPtr<PropertyValue> value =
            model_.NewValue(*model_.FindType(kAAFTypeID_UInt8Array));
        value->BytesToChange() = BytesToShow(from);
        value->KeepAsStored(Keep(from, [this](const StoredObject& holder, std::uint16_t pid) {
            ClassDefinition* known = model_.FindClass(GuidOf(holder.classId));
            const PropertyDefinition* meant =
                known == nullptr ? nullptr : definitions_.property(*known, pid);
            return meant == nullptr ? GUID{} : meant->id();
        }));
        object.PutValue(definition.pid(), value.get());
        Note(Place() + problem + "; it is kept as it stands");
    }

    // Where the reader is: "Content: Mobs: Slots: ".
    std::string Place() const {
        std::string text;
        for (const PropertyDefinition* step : place_) {
            text += ToUtf8(step->name()) + ": ";
        }
        return text;
    }

    void Note(std::string note) {
        if (notes_.size() < kMostNotes) {
            notes_.push_back(std::move(note));
        } else {
            ++notMentioned_;
        }
    }

    RefPtr<PropertyValue> ValueOf(TypeDefinition& type, const StoredProperty& from) {
        if (!from.problem.empty()) {
            throw StoredError(from.problem);
        }
        // Many files hold a set of objects where the type says vector.
        const StoredForm form = StoredFormOf(type);
        const bool fits = from.form == form ||
                          (form == StoredForm::StrongVector && from.form == StoredForm::StrongSet);
        if (!fits) {
            throw StoredError(kOtherForm);
        }
        if (form == StoredForm::Data) {
            CheckSize(type, from.bytes.size());
        }
        RefPtr<PropertyValue> value = model_.NewValue(type);
        switch (from.form) {
            case StoredForm::Data:
            case StoredForm::Stream:
                value->BytesToChange() = from.bytes;
                break;
            case StoredForm::WeakReference:
            case StoredForm::WeakVector:
            case StoredForm::WeakSet:
                value->BytesToChange() = TargetsOf(type, from);
                break;
            case StoredForm::StrongReference:
            case StoredForm::StrongVector:
            case StoredForm::StrongSet:
                AddObjects(*value, type, from);
                break;
        }
        return value;
    }

    static void CheckSize(const TypeDefinition& type, std::size_t size) {
        const TypeDefinition& plain = type.Resolved();
        const bool isList =
            plain.kind() == TypeKind::VariableArray || plain.kind() == TypeKind::Set;
        const bool isText = plain.kind() == TypeKind::String;
        const std::size_t each = isText ? 2
                                 : isList && plain.element() != nullptr
                                     ? plain.element()->StoredSize()
                                     : 0;
        const std::size_t whole = plain.StoredSize();
        if ((whole != 0 && size != whole) || (each != 0 && size % each != 0)) {
            throw StoredError(std::to_string(size) + " bytes are no value of its type");
        }
    }

    Bytes TargetsOf(const TypeDefinition& type, const StoredProperty& from) {
        const GUID& targetClass =
            static_cast<const TypeReference&>(ReferenceIn(type)).targetClass();
        Bytes ids;
        for (const Bytes& key : from.keys) {
            if (key.size() != sizeof(StoredAuid)) {
                throw StoredError("a weak reference by something else than an id");
            }
            if (model_.FindTarget(targetClass, GuidOf(key)) == nullptr) {
                throw StoredError("a weak reference to what the file does not have");
            }
            ids.insert(ids.end(), key.begin(), key.end());
        }
        return ids;
    }

    void AddObjects(PropertyValue& value, const TypeDefinition& type, const StoredProperty& from) {
        const GUID expected = FactsOf(ReferenceIn(type)).target;
        const bool isSet = StoredFormOf(type) == StoredForm::StrongSet;
        std::set<Bytes> keys;
        for (std::size_t i = 0; i < from.objects.size(); ++i) {
            const RefPtr<Object> object = NewObject(from.objects[i], expected);
            Fill(*object, from.objects[i]);
            if (isSet && !keys.insert(KeyOfElement(*object, from.keys[i])).second) {
                throw StoredError("two elements have one key");
            }
            if (value.InsertObject(i, object.get()) < 0) {
                throw StoredError("an object that cannot be contained");
            }
        }
        if (isSet) {
            value.SortByKey();
        }
    }

    // An element stores its key, and the index has it too. Where they differ
    // the element's own counts, and the index's where it has none.
    Bytes KeyOfElement(Object& object, const Bytes& inIndex) {
        const Bytes own = object.UniqueKey();
        if (own == inIndex) {
            return own;
        }
        if (!own.empty()) {
            Note(Place() + "an element whose key differs from that in the index; its own counts");
            return own;
        }
        const PropertyDefinition* key = object.classDefinition().FindUniqueProperty();
        if (key == nullptr || key->type() == nullptr ||
            key->type()->StoredSize() != inIndex.size()) {
            throw StoredError("an element without a key");
        }
        Note(Place() + "an element without a key; that in the index counts");
        object.RequireValue(key->key())->BytesToChange() = inIndex;
        return inIndex;
    }

    // The model has a dictionary with the built-in definitions. Those of the
    // file that are known get what the file says of them, others are added.
    // They may refer to one another, so all are there before any is filled.
    void MergeDictionary(const StoredObject& from) {
        Dictionary& dictionary = model_.dictionary();
        StoredObject others;
        std::vector<Entered> entered;
        for (const StoredProperty& property : from.properties) {
            const PropertyDefinition* definition =
                definitions_.property(dictionary.classDefinition(), property.pid);
            const bool isSet =
                definition != nullptr && Dictionary::IsSetOfDefinitions(definition->pid());
            const bool isRead = isSet && property.problem.empty() &&
                                (property.form == StoredForm::StrongSet ||
                                 property.form == StoredForm::StrongVector);
            if (isRead) {
                EnterSet(dictionary, *definition, property, entered);
            } else if (isSet && HasBuiltIn(definition->pid())) {
                Note(ToUtf8(definition->name()) + ": " +
                     (property.problem.empty() ? kOtherForm : property.problem) +
                     "; it is left out");
            } else {
                others.properties.push_back(property);
            }
        }
        for (const Entered& entry : entered) {
            place_.assign(1, entry.set);
            Fill(*entry.object, *entry.stored);
        }
        place_.clear();
        Fill(dictionary, others);
    }

    // The model's own definitions take the place of whatever would be kept there.
    static bool HasBuiltIn(PropertyId set) {
        return set == prop::Dictionary_DataDefinitions.pid ||
               set == prop::Dictionary_ContainerDefinitions.pid;
    }

    struct Entered {
        const PropertyDefinition* set;
        RefPtr<Object> object;
        const StoredObject* stored;
    };

    void EnterSet(Dictionary& dictionary, const PropertyDefinition& definition,
                  const StoredProperty& from, std::vector<Entered>& entered) {
        const GUID expected = FactsOf(ReferenceIn(*definition.type())).target;
        place_.assign(1, &definition);
        for (std::size_t i = 0; i < from.objects.size(); ++i) {
            const StoredObject& stored = from.objects[i];
            try {
                const RefPtr<Object> object = NewObject(stored, expected);
                const Bytes* const inIndex = from.keys.empty() ? nullptr : &from.keys[i];
                const Bytes key = KeyOfDefinition(*object, stored, inIndex);
                RefPtr<Object> known(dictionary.FindDefinition(definition.pid(), GuidOf(key)));
                if (!known) {
                    if (dictionary.AddDefinition(definition.pid(), object.get()) < 0) {
                        throw StoredError("a definition that cannot be added");
                    }
                    known = object;
                }
                entered.push_back({&definition, known, &stored});
            } catch (const StoredError& problem) {
                Note(Place() + problem.what() + "; it is left out");
            }
        }
        place_.clear();
    }

    // The only property that a definition needs to be found. A vector has no index of keys.
    Bytes KeyOfDefinition(Object& object, const StoredObject& stored, const Bytes* inIndex) {
        for (const StoredProperty& property : stored.properties) {
            const PropertyDefinition* definition =
                definitions_.property(object.classDefinition(), property.pid);
            if (definition != nullptr && definition->IsUnique() && property.problem.empty() &&
                property.form == StoredForm::Data && property.bytes.size() == kAuidKeySize) {
                object.RequireValue(definition->key())->BytesToChange() = property.bytes;
            }
        }
        const Bytes own = object.UniqueKey();
        if (inIndex == nullptr && own.empty()) {
            throw StoredError("a definition without a key");
        }
        return KeyOfElement(object, inIndex == nullptr ? own : *inIndex);
    }

    Model& model_;
    MetaRegistration definitions_;
    std::vector<std::string>& notes_;
    std::size_t notMentioned_ = 0;
    std::vector<const PropertyDefinition*> place_;
};

}  // namespace

RefPtr<Object> ReadModel(const StoredObject& root, Model& model, std::vector<std::string>& notes) {
    const MetaRecords records =
        ReadMetaDictionary(ContainedIn(root, meta::kRootMetaDictionary, "meta-dictionary"));
    const StoredObject& header = ContainedIn(root, meta::kRootHeader, "header");
    ModelReader reader(records, model, notes);
    return reader.ReadHeader(header);
}

}  // namespace aaf::stored
