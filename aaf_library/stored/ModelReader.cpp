// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/ModelReader.h"

#include "aaf_library/model/ClassDefinition.h"
#include "aaf_library/model/Dictionary.h"
#include "aaf_library/model/Model.h"
#include "aaf_library/model/TypeDefinition.h"
#include "aaf_library/stored/MetaPids.h"
#include "aaf_library/stored/MetaRegistration.h"
#include "aaf_library/stored/ModelNames.h"
#include "aaf_library/stored/ModelTypes.h"
#include "aaf_library/stored/StoredError.h"
#include "aaf_library/stored/StoredNames.h"
#include "host_interfaces/aaf/AAFClassIds.h"

namespace aaf::stored {

namespace {

const StoredObject& ContainedIn(const StoredObject& holder, std::uint16_t pid, const char* what) {
    const StoredProperty* property = holder.Find(pid);
    if (property == nullptr || property->form != StoredForm::StrongReference) {
        throw StoredError(std::string("has no ") + what);
    }
    return property->objects.front();
}

class ModelReader {
public:
    ModelReader(const MetaRecords& records, Model& model)
        : model_(model), definitions_(records, model) {}

    RefPtr<Object> ReadHeader(const StoredObject& from) {
        MergeDictionary(ContainedIn(from, prop::Header_Dictionary.pid, "dictionary"));
        RefPtr<Object> header = NewObject(from, AUID_AAFHeader);
        Fill(*header, from, prop::Header_Dictionary.id);
        header->PutObject(prop::Header_Dictionary, model_.dictionary().Identity());
        if (header->ObjectAt(prop::Header_Content) == nullptr) {
            throw StoredError("has no content");
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
        for (const StoredProperty& property : from.properties) {
            PropertyDefinition* definition =
                definitions_.property(object.classDefinition(), property.pid);
            if (definition == nullptr || definition->type() == nullptr ||
                definition->id() == leftOut ||
                definition->id() == prop::InterchangeObject_ObjClass.id) {
                continue;
            }
            try {
                const RefPtr<PropertyValue> value = ValueOf(*definition->type(), property);
                if (object.PutValue(definition->pid(), value.get()) < 0) {
                    throw StoredError("an object cannot hold it");
                }
            } catch (const StoredError& problem) {
                throw StoredError(ToUtf8(definition->name()) + ": " + problem.what());
            }
        }
    }

    RefPtr<PropertyValue> ValueOf(TypeDefinition& type, const StoredProperty& from) {
        if (StoredFormOf(type) != from.form) {
            throw StoredError("is stored in another form than its type has");
        }
        if (from.form == StoredForm::Data) {
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
                value->BytesToChange() = TargetsOf(from);
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

    static Bytes TargetsOf(const StoredProperty& from) {
        Bytes ids;
        for (const Bytes& key : from.keys) {
            if (key.size() != sizeof(StoredAuid)) {
                throw StoredError("a weak reference by something else than an id");
            }
            ids.insert(ids.end(), key.begin(), key.end());
        }
        return ids;
    }

    void AddObjects(PropertyValue& value, const TypeDefinition& type, const StoredProperty& from) {
        const GUID expected = FactsOf(ReferenceIn(type)).target;
        for (std::size_t i = 0; i < from.objects.size(); ++i) {
            const RefPtr<Object> object = NewObject(from.objects[i], expected);
            Fill(*object, from.objects[i]);
            if (from.form == StoredForm::StrongSet && object->UniqueKey() != from.keys[i]) {
                throw StoredError("an element whose key differs from that in the index");
            }
            if (value.InsertObject(i, object.get()) < 0) {
                throw StoredError("an object that cannot be contained");
            }
        }
        if (from.form == StoredForm::StrongSet) {
            value.SortByKey();
        }
    }

    // The model has a dictionary with the built-in definitions. Those of the
    // file that are known get what the file says of them, others are added.
    void MergeDictionary(const StoredObject& from) {
        Dictionary& dictionary = model_.dictionary();
        StoredObject others;
        for (const StoredProperty& property : from.properties) {
            PropertyDefinition* definition =
                definitions_.property(dictionary.classDefinition(), property.pid);
            if (definition == nullptr || definition->type() == nullptr) {
                continue;
            }
            if (property.form != StoredForm::StrongSet ||
                StoredFormOf(*definition->type()) != StoredForm::StrongSet) {
                others.properties.push_back(property);
                continue;
            }
            try {
                MergeSet(dictionary, *definition, property);
            } catch (const StoredError& problem) {
                throw StoredError(ToUtf8(definition->name()) + ": " + problem.what());
            }
        }
        Fill(dictionary, others);
    }

    void MergeSet(Dictionary& dictionary, const PropertyDefinition& definition,
                  const StoredProperty& from) {
        const GUID expected = FactsOf(ReferenceIn(*definition.type())).target;
        for (std::size_t i = 0; i < from.objects.size(); ++i) {
            const Bytes& key = from.keys[i];
            Object* known = dictionary.FindInSet(definition.key(), key.data(), key.size());
            RefPtr<Object> object(known);
            if (known == nullptr) {
                object = NewObject(from.objects[i], expected);
            }
            Fill(*object, from.objects[i]);
            if (object->UniqueKey() != key) {
                throw StoredError("an element whose key differs from that in the index");
            }
            if (known == nullptr && dictionary.AddToSet(definition.key(), object->Identity()) < 0) {
                throw StoredError("a definition that cannot be added");
            }
        }
    }

    Model& model_;
    MetaRegistration definitions_;
};

}  // namespace

RefPtr<Object> ReadModel(const StoredObject& root, Model& model) {
    const MetaRecords records =
        ReadMetaDictionary(ContainedIn(root, meta::kRootMetaDictionary, "meta-dictionary"));
    const StoredObject& header = ContainedIn(root, meta::kRootHeader, "header");
    ModelReader reader(records, model);
    return reader.ReadHeader(header);
}

}  // namespace aaf::stored
