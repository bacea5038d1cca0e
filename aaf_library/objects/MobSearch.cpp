// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/MobSearch.h"

#include "aaf_library/objects/Checks.h"
#include "aaf_library/objects/Definitions.h"
#include "aaf_library/objects/Mob.h"
#include "aaf_library/objects/MobId.h"
#include "aaf_library/objects/MobSlot.h"
#include "host_interfaces/aaf/AAFClassIds.h"
#include "host_interfaces/aaf/AAFDefinitions.h"

namespace aaf {

namespace {

bool HasSlotOf(const Mob& mob, const aafUID_t& dataDefinition) {
    const aafUInt32 count = mob.CountObjects(prop::Mob_Slots);
    for (aafUInt32 at = 0; at < count; ++at) {
        IAAFDataDef* found = nullptr;
        MobSlot* const slot = mob.SlotAt(at);
        if (slot == nullptr || slot->GetDataDef(&found) < 0) {
            continue;
        }
        const RefPtr<IAAFDataDef> holder = RefPtr<IAAFDataDef>::Adopt(found);
        aafUID_t id{};
        if (ReadDefinitionId(found, id) && id == dataDefinition) {
            return true;
        }
    }
    return false;
}

bool HasUsageCode(const Mob& mob, const aafUID_t& usageCode, const aafUID_t& mobClass) {
    aafUID_t code{};
    return mob.IsKindOf(mobClass) && mob.ReadStruct(prop::Mob_UsageCode, &code) >= 0 &&
           code == usageCode;
}

}  // namespace

HRESULT MobSearch::Set(const aafSearchCrit_t* criterion) {
    if (criterion == nullptr) {
        return AAFRESULT_SUCCESS;
    }
    if (!IsWithin(criterion->searchTag, kAAFNoSearch, kAAFByCompositionMobUsageCode)) {
        return AAFRESULT_INVALID_PARAM;
    }
    if (criterion->searchTag == kAAFByMediaCrit) {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    if (criterion->searchTag == kAAFByMobKind &&
        !IsWithin(criterion->tags.mobKind, kAAFCompMob, kAAFPhysicalMob)) {
        return AAFRESULT_INVALID_ENUM_VALUE;
    }
    if (criterion->searchTag == kAAFByName) {
        if (criterion->tags.name == nullptr) {
            return AAFRESULT_NULL_PARAM;
        }
        name_ = criterion->tags.name;
    }
    criterion_ = *criterion;
    return AAFRESULT_SUCCESS;
}

bool MobSearch::IsForAll() const {
    return criterion_.searchTag == kAAFNoSearch;
}

bool MobSearch::Matches(Mob& mob) const {
    const auto& wanted = criterion_.tags;
    switch (criterion_.searchTag) {
        case kAAFByMobID:
            return mob.id() == wanted.mobID;
        case kAAFByMobKind:
            return wanted.mobKind == kAAFAllMob || mob.MobKind() == wanted.mobKind;
        case kAAFByName:
            return mob.IsPresent(prop::Mob_Name) && mob.StringOr(prop::Mob_Name, L"") == name_;
        case kAAFByClass:
            return mob.IsKindOf(wanted.objClass);
        case kAAFByDataDef:
            return HasSlotOf(mob, wanted.datadef);
        case kAAFByUsageCode:
            return HasUsageCode(mob, wanted.usageCode, AUID_AAFMob);
        case kAAFByMasterMobUsageCode:
            return HasUsageCode(mob, wanted.usageCode, AUID_AAFMasterMob);
        case kAAFBySourceMobUsageCode:
            return HasUsageCode(mob, wanted.usageCode, AUID_AAFSourceMob);
        case kAAFByCompositionMobUsageCode:
            return HasUsageCode(mob, wanted.usageCode, AUID_AAFCompositionMob);
        default:
            return true;
    }
}

}  // namespace aaf
