// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/Header.h"

#include <algorithm>
#include <cstring>
#include <vector>

#include "aaf_library/model/DefinitionObjects.h"
#include "aaf_library/model/Model.h"
#include "aaf_library/objects/Arrays.h"
#include "aaf_library/objects/ContentStorage.h"
#include "aaf_library/objects/EssenceDescriptor.h"
#include "aaf_library/objects/Identification.h"
#include "aaf_library/objects/SourceMob.h"

namespace aaf {

namespace {

// "II" or "MM" as a number of the machine that wrote the file.
constexpr aafInt16 kLittleEndian = 0x4949;

constexpr aafUInt32 kObjectModelVersion = 1;
constexpr aafVersionType_t kFileVersion{1, 1};

bool PrecedesInBytes(const aafUID_t& left, const aafUID_t& right) {
    return std::memcmp(&left, &right, sizeof left) < 0;
}

// The ids of the containers that a descriptor and its parts name.
void CollectContainers(const EssenceDescriptor* descriptor, std::vector<aafUID_t>& ids) {
    if (descriptor == nullptr) {
        return;
    }
    const auto* const container = dynamic_cast<const ContainerDefinition*>(
        descriptor->WeakTarget(prop::FileDescriptor_ContainerFormat));
    if (container != nullptr) {
        ids.push_back(container->Identification());
    }
    const aafUInt32 parts = descriptor->CountObjects(prop::MultipleDescriptor_FileDescriptors);
    for (aafUInt32 at = 0; at < parts; ++at) {
        CollectContainers(dynamic_cast<const EssenceDescriptor*>(
                              descriptor->ObjectAt(prop::MultipleDescriptor_FileDescriptors, at)),
                          ids);
    }
}

}  // namespace

aafProductVersion_t LibraryVersion() {
    return aafProductVersion_t{1, 1, 6, 0, kAAFVersionBeta};
}

void Header::SetDefaults() {
    Object::SetDefaults();
    PutInteger(prop::Header_ByteOrder, kLittleEndian);
    PutStruct(prop::Header_LastModified, CurrentTime());
    PutStruct(prop::Header_Version, kFileVersion);
    PutInteger(prop::Header_ObjectModelVersion, kObjectModelVersion);
    const RefPtr<ContentStorage> storage =
        model()->NewObject<ContentStorage>(AUID_AAFContentStorage);
    PutObject(prop::Header_Content, storage->Identity());
    RequireValue(prop::Header_IdentificationList);
}

ContentStorage* Header::content() const {
    return dynamic_cast<ContentStorage*>(ObjectAt(prop::Header_Content));
}

HRESULT Header::AddIdentification(const aafProductIdentification_t& product) {
    const RefPtr<Identification> identification =
        model()->NewObject<Identification>(AUID_AAFIdentification);
    const HRESULT result = identification->SetProduct(product);
    return result < 0 ? result
                      : AppendObject(prop::Header_IdentificationList, identification->Identity());
}

HRESULT Header::AddIdentificationsOf(const Header& other) {
    const aafUInt32 own = IdentificationCount();
    for (aafUInt32 at = 0; at < other.IdentificationCount(); ++at) {
        const RefPtr<Object> copy =
            model()->CopyObject(*other.ObjectAt(prop::Header_IdentificationList, at));
        const HRESULT result = copy
                                   ? AppendObject(prop::Header_IdentificationList, copy->Identity())
                                   : AAFRESULT_INVALID_OBJ;
        if (result < 0) {
            KeepIdentifications(own);
            return result;
        }
    }
    return AAFRESULT_SUCCESS;
}

void Header::KeepIdentifications(aafUInt32 count) {
    while (IdentificationCount() > count) {
        RemoveObjectAt(prop::Header_IdentificationList, IdentificationCount() - 1);
    }
}

void Header::AddSummaryOf(const Header& other) {
    aafUID_t pattern{};
    if (other.ReadStruct(prop::Header_OperationalPattern, &pattern) >= 0) {
        SetOperationalPattern(pattern);
    }
    for (const PropertyKey& set :
         {prop::Header_EssenceContainers, prop::Header_DescriptiveSchemes}) {
        std::vector<aafUID_t> theirs;
        std::vector<aafUID_t> ids;
        if (ReadElements(other, set, theirs) >= 0) {
            ReadElements(*this, set, ids);
            ids.insert(ids.end(), theirs.begin(), theirs.end());
            PutSet(*this, set, std::move(ids), PrecedesInBytes);
        }
    }
}

void Header::RemoveSummary() {
    for (const PropertyKey& key : {prop::Header_OperationalPattern, prop::Header_EssenceContainers,
                                   prop::Header_DescriptiveSchemes}) {
        RemoveValue(key);
    }
}

void Header::Touch() {
    PutStruct(prop::Header_LastModified, CurrentTime());
}

template <class Operation>
HRESULT Header::OnContent(Operation operation) const {
    ContentStorage* const storage = content();
    return storage == nullptr ? AAFRESULT_OBJECT_NOT_FOUND : operation(*storage);
}

HRESULT Header::LookupMob(aafMobID_constref mobID, IAAFMob** mob) {
    return OnContent([&](ContentStorage& storage) { return storage.LookupMob(mobID, mob); });
}

HRESULT Header::CountMobs(aafMobKind_t mobKind, aafNumSlots_t* result) {
    return OnContent([&](ContentStorage& storage) { return storage.CountMobs(mobKind, result); });
}

HRESULT Header::GetMobs(aafSearchCrit_t* searchCriteria, IEnumAAFMobs** enumerator) {
    return OnContent(
        [&](ContentStorage& storage) { return storage.GetMobs(searchCriteria, enumerator); });
}

HRESULT Header::AddMob(IAAFMob* mob) {
    return OnContent([&](ContentStorage& storage) { return storage.AddMob(mob); });
}

HRESULT Header::RemoveMob(IAAFMob* mob) {
    return OnContent([&](ContentStorage& storage) { return storage.RemoveMob(mob); });
}

HRESULT Header::CountEssenceData(aafUInt32* result) {
    return OnContent([&](ContentStorage& storage) { return storage.CountEssenceData(result); });
}

HRESULT Header::IsEssenceDataPresent(aafMobID_constref fileMobID, aafFileFormat_t fmt,
                                     aafBoolean_t* result) {
    return OnContent([&](ContentStorage& storage) {
        return storage.IsEssenceDataPresent(fileMobID, fmt, result);
    });
}

HRESULT Header::EnumEssenceData(IEnumAAFEssenceData** enumerator) {
    return OnContent([&](ContentStorage& storage) { return storage.EnumEssenceData(enumerator); });
}

HRESULT Header::AddEssenceData(IAAFEssenceData* essenceData) {
    return OnContent([&](ContentStorage& storage) { return storage.AddEssenceData(essenceData); });
}

HRESULT Header::RemoveEssenceData(IAAFEssenceData* essenceData) {
    return OnContent(
        [&](ContentStorage& storage) { return storage.RemoveEssenceData(essenceData); });
}

HRESULT Header::LookupEssenceData(aafMobID_constref mobID, IAAFEssenceData** essenceData) {
    return OnContent(
        [&](ContentStorage& storage) { return storage.LookupEssenceData(mobID, essenceData); });
}

HRESULT Header::GetLastIdentification(IAAFIdentification** identification) {
    if (identification == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const aafUInt32 count = CountObjects(prop::Header_IdentificationList);
    return count == 0 ? AAFRESULT_OBJECT_NOT_FOUND : GetIdentificationAt(count - 1, identification);
}

HRESULT Header::LookupIdentification(aafUID_constref generation,
                                     IAAFIdentification** identification) {
    if (identification == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const aafUInt32 count = CountObjects(prop::Header_IdentificationList);
    for (aafUInt32 at = 0; at < count; ++at) {
        Object* const candidate = ObjectAt(prop::Header_IdentificationList, at);
        aafUID_t id{};
        if (candidate->ReadStruct(prop::Identification_GenerationAUID, &id) >= 0 &&
            id == generation) {
            return GiveOut(candidate, identification);
        }
    }
    return AAFRESULT_OBJECT_NOT_FOUND;
}

HRESULT Header::GetIdentifications(IEnumAAFIdentifications** enumerator) {
    return MakeEnumerator<IAAFIdentification>(this, prop::Header_IdentificationList, enumerator);
}

HRESULT Header::GetRefImplVersion(aafProductVersion_t* version) {
    if (version == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *version = LibraryVersion();
    return AAFRESULT_SUCCESS;
}

HRESULT Header::GetStoredByteOrder(eAAFByteOrder_t* order) {
    aafInt16 stored = 0;
    if (order == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const HRESULT result = ReadInteger(prop::Header_ByteOrder, &stored);
    if (result >= 0) {
        *order = stored == kLittleEndian ? kAAFByteOrderLittle : kAAFByteOrderBig;
    }
    return result;
}

HRESULT Header::GetNativeByteOrder(eAAFByteOrder_t* order) {
    if (order == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const aafUInt16 probe = 1;
    const bool little = *reinterpret_cast<const aafUInt8*>(&probe) == 1;
    *order = little ? kAAFByteOrderLittle : kAAFByteOrderBig;
    return AAFRESULT_SUCCESS;
}

HRESULT Header::UpdateEssenceContainers() {
    return OnContent([&](const ContentStorage& storage) {
        std::vector<aafUID_t> ids;
        for (aafUInt32 at = 0; at < storage.MobCount(); ++at) {
            if (const auto* const mob = dynamic_cast<const SourceMob*>(storage.MobAt(at))) {
                CollectContainers(mob->descriptor(), ids);
            }
        }
        return PutSet(*this, prop::Header_EssenceContainers, std::move(ids), PrecedesInBytes);
    });
}

HRESULT Header::CountEssenceContainers(aafUInt32* count) {
    return CountElements(*this, prop::Header_EssenceContainers, sizeof(aafUID_t), count);
}

HRESULT Header::GetEssenceContainers(aafUInt32 maximum, aafUID_t* ids) {
    return ReadArray(*this, prop::Header_EssenceContainers, ids,
                     std::size_t{maximum} * sizeof *ids);
}

HRESULT Header::IsEssenceContainerPresent(aafUID_constref id, aafBoolean_t* isPresent) {
    return IsElement(*this, prop::Header_EssenceContainers, id, isPresent);
}

HRESULT Header::CountDescriptiveSchemes(aafUInt32* count) {
    return CountElements(*this, prop::Header_DescriptiveSchemes, sizeof(aafUID_t), count);
}

HRESULT Header::GetDescriptiveSchemes(aafUInt32 maximum, aafUID_t* ids) {
    return ReadArray(*this, prop::Header_DescriptiveSchemes, ids,
                     std::size_t{maximum} * sizeof *ids);
}

HRESULT Header::IsDescriptiveSchemePresent(aafUID_constref id, aafBoolean_t* isPresent) {
    return IsElement(*this, prop::Header_DescriptiveSchemes, id, isPresent);
}

HRESULT Header::AddDescriptiveScheme(aafUID_constref id) {
    return AddElement(*this, prop::Header_DescriptiveSchemes, id, PrecedesInBytes);
}

HRESULT Header::RemoveDescriptiveScheme(aafUID_constref id) {
    return RemoveElement(*this, prop::Header_DescriptiveSchemes, id, PrecedesInBytes);
}

}  // namespace aaf
