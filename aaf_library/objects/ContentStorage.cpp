// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/ContentStorage.h"

#include "aaf_library/model/Enumerator.h"
#include "aaf_library/model/Model.h"
#include "aaf_library/objects/Checks.h"
#include "aaf_library/objects/EssenceData.h"
#include "aaf_library/objects/Mob.h"
#include "aaf_library/objects/MobId.h"
#include "aaf_library/objects/MobSearch.h"
#include "host_interfaces/aaf/AAFEssenceData.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "not_implemented/AAFEssenceData.h"

namespace aaf {

void ContentStorage::SetDefaults() {
    Object::SetDefaults();
    RequireValue(prop::ContentStorage_Mobs);
}

Mob* ContentStorage::FindMob(const aafMobID_t& id) const {
    return dynamic_cast<Mob*>(FindInSet(prop::ContentStorage_Mobs, &id, sizeof id));
}

Object* ContentStorage::FindEssence(const aafMobID_t& fileMob) const {
    return FindInSet(prop::ContentStorage_EssenceData, &fileMob, sizeof fileMob);
}

Mob* ContentStorage::MobAt(aafUInt32 index) const {
    return dynamic_cast<Mob*>(ObjectAt(prop::ContentStorage_Mobs, index));
}

bool ContentStorage::HoldsMobsAlone() const {
    for (const auto& [pid, value] : values()) {
        const bool isEmptySet =
            pid == prop::ContentStorage_EssenceData.pid && value->objects().empty();
        if (pid != prop::ContentStorage_Mobs.pid && !isEmptySet) {
            return false;
        }
    }
    for (aafUInt32 at = 0; at < MobCount(); ++at) {
        if (MobAt(at) == nullptr) {
            return false;
        }
    }
    return true;
}

HRESULT ContentStorage::LookupMob(aafMobID_constref mobID, IAAFMob** mob) {
    if (mob == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    Mob* const found = FindMob(mobID);
    return found == nullptr ? AAFRESULT_MOB_NOT_FOUND : GiveOut(found, mob);
}

HRESULT ContentStorage::CountMobs(aafMobKind_t mobKind, aafNumSlots_t* result) {
    if (!IsWithin(mobKind, kAAFCompMob, kAAFPhysicalMob)) {
        return AAFRESULT_INVALID_ENUM_VALUE;
    }
    if (result == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *result = 0;
    for (aafUInt32 at = 0; at < MobCount(); ++at) {
        const Mob* const mob = MobAt(at);
        if (mob != nullptr && (mobKind == kAAFAllMob || mob->MobKind() == mobKind)) {
            ++*result;
        }
    }
    return AAFRESULT_SUCCESS;
}

HRESULT ContentStorage::GetMobs(aafSearchCrit_t* searchCriteria, IEnumAAFMobs** enumerator) {
    if (enumerator == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    MobSearch search;
    const HRESULT result = search.Set(searchCriteria);
    if (result < 0) {
        return result;
    }
    if (search.IsForAll()) {
        return MakeEnumerator<IAAFMob>(this, prop::ContentStorage_Mobs, enumerator);
    }
    return MakeEnumerator<IAAFMob>(
        [holder = RefPtr<ContentStorage>(this), search](std::size_t index) {
            for (aafUInt32 at = 0; at < holder->MobCount(); ++at) {
                Mob* const mob = holder->MobAt(at);
                if (mob != nullptr && search.Matches(*mob) && index-- == 0) {
                    return RefPtr<Unknown>(mob);
                }
            }
            return RefPtr<Unknown>();
        },
        enumerator);
}

HRESULT ContentStorage::AddMob(IAAFMob* mob) {
    if (mob == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const Mob* const added = ImplementationAs<Mob>(mob);
    if (added == nullptr) {
        return AAFRESULT_INVALID_OBJ;
    }
    if (FindMob(added->id()) != nullptr) {
        return AAFRESULT_DUPLICATE_MOBID;
    }
    return AddToSet(prop::ContentStorage_Mobs, mob);
}

HRESULT ContentStorage::RemoveMob(IAAFMob* mob) {
    if (mob == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const Mob* const removed = ImplementationAs<Mob>(mob);
    if (removed == nullptr || removed->owner() != this) {
        return AAFRESULT_MOB_NOT_FOUND;
    }
    return RemoveObject(prop::ContentStorage_Mobs, mob);
}

HRESULT ContentStorage::AddCopy(const Mob& source, bool withEssence, RefPtr<Mob>& copy) {
    const aafMobID_t id = source.id();
    const auto* const from = dynamic_cast<const ContentStorage*>(source.owner());
    const Object* const essence = withEssence && from != nullptr ? from->FindEssence(id) : nullptr;
    if (FindMob(id) != nullptr || (essence != nullptr && FindEssence(id) != nullptr)) {
        return AAFRESULT_DUPLICATE_MOBID;
    }
    const RefPtr<Object> copied = model()->CopyObject(source);
    const RefPtr<Object> copiedEssence =
        essence == nullptr ? nullptr : model()->CopyObject(*essence);
    copy = RefPtr<Mob>(dynamic_cast<Mob*>(copied.get()));
    if (!copy || (essence != nullptr && !copiedEssence)) {
        return AAFRESULT_INTERNAL_ERROR;
    }
    const HRESULT result = AddToSet(prop::ContentStorage_Mobs, copy->Identity());
    return result < 0 || !copiedEssence
               ? result
               : AddToSet(prop::ContentStorage_EssenceData, copiedEssence->Identity());
}

void ContentStorage::RemoveCopy(Mob& copy) {
    if (Object* const essence = FindEssence(copy.id())) {
        RemoveObject(prop::ContentStorage_EssenceData, essence->Identity());
    }
    RemoveObject(prop::ContentStorage_Mobs, copy.Identity());
}

HRESULT ContentStorage::CountEssenceData(aafUInt32* result) {
    return ReadCount(prop::ContentStorage_EssenceData, result);
}

HRESULT ContentStorage::IsEssenceDataPresent(aafMobID_constref fileMobID, aafFileFormat_t fmt,
                                             aafBoolean_t* result) {
    if (!IsWithin(fmt, kAAFEssence, kAAFForeignMedia)) {
        return AAFRESULT_INVALID_ENUM_VALUE;
    }
    if (result == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const bool present = fmt == kAAFEssence && FindEssence(fileMobID) != nullptr;
    *result = present ? kAAFTrue : kAAFFalse;
    return AAFRESULT_SUCCESS;
}

HRESULT ContentStorage::EnumEssenceData(IEnumAAFEssenceData** enumerator) {
    return MakeEnumerator<IAAFEssenceData>(this, prop::ContentStorage_EssenceData, enumerator);
}

HRESULT ContentStorage::AddEssenceData(IAAFEssenceData* essenceData) {
    if (essenceData == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const EssenceData* const added = ImplementationAs<EssenceData>(essenceData);
    if (added == nullptr) {
        return AAFRESULT_INVALID_OBJ;
    }
    if (FindEssence(added->mobId()) != nullptr) {
        return AAFRESULT_DUPLICATE_MOBID;
    }
    return AddToSet(prop::ContentStorage_EssenceData, essenceData);
}

HRESULT ContentStorage::RemoveEssenceData(IAAFEssenceData* essenceData) {
    if (essenceData == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const EssenceData* const removed = ImplementationAs<EssenceData>(essenceData);
    if (removed == nullptr || removed->owner() != this) {
        return AAFRESULT_ESSENCE_NOT_FOUND;
    }
    return RemoveObject(prop::ContentStorage_EssenceData, essenceData);
}

HRESULT ContentStorage::LookupEssenceData(aafMobID_constref mobID, IAAFEssenceData** essenceData) {
    if (essenceData == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    Object* const found = FindEssence(mobID);
    return found == nullptr ? AAFRESULT_ESSENCE_NOT_FOUND : GiveOut(found, essenceData);
}

}  // namespace aaf
