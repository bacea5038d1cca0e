// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/Object.h"
#include "host_interfaces/aaf/AAFFile.h"
#include "not_implemented/AAFFile.h"

namespace aaf {

class Mob;

// The mobs of a file and the essence in it, each a set ordered by the bytes of
// the mob ids. Owned by the header.
class ContentStorage : public Implements<Object, IAAFContentStorage> {
public:
    void SetDefaults() override;

    Mob* FindMob(const aafMobID_t& id) const;
    aafUInt32 MobCount() const { return CountObjects(prop::ContentStorage_Mobs); }
    Mob* MobAt(aafUInt32 index) const;
    // The essence data of a file mob.
    Object* FindEssence(const aafMobID_t& fileMob) const;
    // Whether there is nothing else in it: no essence and no properties of other kinds.
    bool HoldsMobsAlone() const;
    // Adds a copy of a mob of any file, with its essence if that is wanted.
    HRESULT AddCopy(const Mob& source, bool withEssence, RefPtr<Mob>& copy);
    // Takes such a copy out again.
    void RemoveCopy(Mob& copy);

    HRESULT LookupMob(aafMobID_constref mobID, IAAFMob** mob) override;
    HRESULT CountMobs(aafMobKind_t mobKind, aafNumSlots_t* result) override;
    HRESULT GetMobs(aafSearchCrit_t* searchCriteria, IEnumAAFMobs** enumerator) override;
    HRESULT AddMob(IAAFMob* mob) override;
    HRESULT RemoveMob(IAAFMob* mob) override;
    HRESULT CountEssenceData(aafUInt32* result) override;
    HRESULT IsEssenceDataPresent(aafMobID_constref fileMobID, aafFileFormat_t fmt,
                                 aafBoolean_t* result) override;
    HRESULT EnumEssenceData(IEnumAAFEssenceData** enumerator) override;
    HRESULT AddEssenceData(IAAFEssenceData* essenceData) override;
    HRESULT RemoveEssenceData(IAAFEssenceData* essenceData) override;
    HRESULT LookupEssenceData(aafMobID_constref mobID, IAAFEssenceData** essenceData) override;
};

}  // namespace aaf
