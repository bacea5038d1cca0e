// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/EssenceData.h"

#include "aaf_library/objects/ContentStorage.h"
#include "aaf_library/objects/MobId.h"
#include "aaf_library/objects/SourceMob.h"
#include "aaf_library/objects/StreamAccess.h"
#include "host_interfaces/aaf/AAFMobs.h"

namespace aaf {

void EssenceData::SetDefaults() {
    Object::SetDefaults();
    RequireValue(prop::EssenceData_Data);
}

aafMobID_t EssenceData::mobId() const {
    aafMobID_t found{};
    ReadStruct(prop::EssenceData_MobID, &found);
    return found;
}

HRESULT EssenceData::SetFileMob(IAAFSourceMob* fileMob) {
    if (fileMob == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const Mob* const mob = ImplementationAs<Mob>(fileMob);
    if (mob == nullptr) {
        return AAFRESULT_INVALID_OBJ;
    }
    // The content storage finds its essence by this id.
    auto* const storage = dynamic_cast<ContentStorage*>(owner());
    const aafMobID_t id = mob->id();
    if (storage != nullptr && !(id == mobId()) && storage->FindEssence(id) != nullptr) {
        return AAFRESULT_DUPLICATE_MOBID;
    }
    const HRESULT result = PutStruct(prop::EssenceData_MobID, id);
    if (storage != nullptr) {
        storage->SortSet(prop::ContentStorage_EssenceData);
    }
    return result;
}

HRESULT EssenceData::GetFileMob(IAAFSourceMob** fileMob) {
    if (fileMob == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    ContentStorage* const storage = FindOwner<ContentStorage>();
    if (storage == nullptr) {
        return AAFRESULT_OBJECT_NOT_ATTACHED;
    }
    Mob* const mob = storage->FindMob(mobId());
    return mob == nullptr ? AAFRESULT_MOB_NOT_FOUND : GiveOut(mob, fileMob);
}

HRESULT EssenceData::GetFileMobID(aafMobID_t* fileMobID) {
    return ReadStruct(prop::EssenceData_MobID, fileMobID);
}

HRESULT EssenceData::Write(aafUInt32 bytes, aafDataBuffer_t buffer, aafUInt32* bytesWritten) {
    return WriteStream(*this, Required(*this, prop::EssenceData_Data), bytes, buffer, bytesWritten);
}

HRESULT EssenceData::Read(aafUInt32 bytes, aafDataBuffer_t buffer, aafUInt32* bytesRead) {
    return ReadStream(*this, Required(*this, prop::EssenceData_Data), bytes, buffer, bytesRead);
}

HRESULT EssenceData::SetPosition(aafPosition_t offset) {
    return SetStreamPosition(*this, Required(*this, prop::EssenceData_Data), offset);
}

HRESULT EssenceData::GetPosition(aafPosition_t* offset) {
    return ReadStreamPosition(*this, Required(*this, prop::EssenceData_Data), offset);
}

HRESULT EssenceData::GetSize(aafLength_t* size) {
    return ReadStreamSize(*this, Required(*this, prop::EssenceData_Data), size);
}

HRESULT EssenceData::WriteSampleIndex(aafUInt32 bytes, aafDataBuffer_t buffer,
                                      aafUInt32* bytesWritten) {
    return WriteStream(*this, prop::EssenceData_SampleIndex, bytes, buffer, bytesWritten);
}

HRESULT EssenceData::ReadSampleIndex(aafUInt32 bytes, aafDataBuffer_t buffer,
                                     aafUInt32* bytesRead) {
    return ReadStream(*this, prop::EssenceData_SampleIndex, bytes, buffer, bytesRead);
}

HRESULT EssenceData::SetSampleIndexPosition(aafPosition_t offset) {
    return SetStreamPosition(*this, prop::EssenceData_SampleIndex, offset);
}

HRESULT EssenceData::GetSampleIndexPosition(aafPosition_t* offset) {
    return ReadStreamPosition(*this, prop::EssenceData_SampleIndex, offset);
}

HRESULT EssenceData::GetSampleIndexSize(aafLength_t* size) {
    return ReadStreamSize(*this, prop::EssenceData_SampleIndex, size);
}

}  // namespace aaf
