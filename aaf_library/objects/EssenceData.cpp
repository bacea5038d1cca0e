// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/EssenceData.h"

#include <algorithm>

#include "aaf_library/objects/ContentStorage.h"
#include "aaf_library/objects/SourceMob.h"
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
    return PutStruct(prop::EssenceData_MobID, mob->id());
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
    if (buffer == nullptr || bytesWritten == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    PropertyValue* const stream = RequireValue(prop::EssenceData_Data);
    const auto at = static_cast<std::size_t>(stream->position());
    Bytes& content = stream->BytesToChange();
    if (content.size() < at + bytes) {
        content.resize(at + bytes);
    }
    std::copy_n(buffer, bytes, content.begin() + static_cast<std::ptrdiff_t>(at));
    stream->SetPosition(at + bytes);
    *bytesWritten = bytes;
    return AAFRESULT_SUCCESS;
}

HRESULT EssenceData::Read(aafUInt32 bytes, aafDataBuffer_t buffer, aafUInt32* bytesRead) {
    if (buffer == nullptr || bytesRead == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    PropertyValue* const stream = RequireValue(prop::EssenceData_Data);
    const Bytes& content = stream->bytes();
    const std::size_t at = std::min(static_cast<std::size_t>(stream->position()), content.size());
    const std::size_t there = std::min<std::size_t>(bytes, content.size() - at);
    std::copy_n(content.begin() + static_cast<std::ptrdiff_t>(at), there, buffer);
    stream->SetPosition(at + there);
    *bytesRead = static_cast<aafUInt32>(there);
    return there == 0 && bytes > 0 ? AAFRESULT_END_OF_DATA : AAFRESULT_SUCCESS;
}

HRESULT EssenceData::SetPosition(aafPosition_t offset) {
    PropertyValue* const stream = RequireValue(prop::EssenceData_Data);
    if (offset < 0 || static_cast<std::uint64_t>(offset) > stream->bytes().size()) {
        return AAFRESULT_BADSAMPLEOFFSET;
    }
    stream->SetPosition(static_cast<std::uint64_t>(offset));
    return AAFRESULT_SUCCESS;
}

HRESULT EssenceData::GetPosition(aafPosition_t* offset) {
    if (offset == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *offset = static_cast<aafPosition_t>(RequireValue(prop::EssenceData_Data)->position());
    return AAFRESULT_SUCCESS;
}

HRESULT EssenceData::GetSize(aafLength_t* size) {
    if (size == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *size = static_cast<aafLength_t>(RequireValue(prop::EssenceData_Data)->bytes().size());
    return AAFRESULT_SUCCESS;
}

}  // namespace aaf
