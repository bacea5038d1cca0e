// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
// The operations of a mob that reach other mobs and files.
#include <functional>

#include "aaf_library/model/Model.h"
#include "aaf_library/objects/Checks.h"
#include "aaf_library/objects/ContentStorage.h"
#include "aaf_library/objects/File.h"
#include "aaf_library/objects/Fresh.h"
#include "aaf_library/objects/Mob.h"
#include "aaf_library/objects/MobId.h"
#include "aaf_library/objects/SourceClip.h"
#include "host_interfaces/aaf/AAFFile.h"

namespace aaf {

namespace {

// Calls for each source reference in an object and in all that it contains.
void ForEachReference(const Object& object, const std::function<void(SourceReference&)>& call) {
    for (const auto& [pid, value] : object.values()) {
        for (const RefPtr<Object>& part : value->objects()) {
            if (SourceReference* const reference = dynamic_cast<SourceReference*>(part.get())) {
                call(*reference);
            }
            ForEachReference(*part, call);
        }
    }
}

}  // namespace

HRESULT Mob::ChangeRef(aafMobID_constref oldMobID, aafMobID_constref newMobID) {
    ForEachReference(*this, [&](SourceReference& reference) {
        aafMobID_t id{};
        if (reference.GetSourceID(&id) >= 0 && id == oldMobID) {
            reference.SetSourceID(newMobID);
        }
    });
    return AAFRESULT_SUCCESS;
}

HRESULT Mob::CloneExternal(aafDepend_t resolveDependencies, aafIncMedia_t includeMedia,
                           IAAFFile* destFile, IAAFMob** destMob) {
    if (!IsWithin(resolveDependencies, kAAFNoFollowDepend, kAAFFollowDepend) ||
        !IsWithin(includeMedia, kAAFNoIncludeMedia, kAAFIncludeMedia)) {
        return AAFRESULT_INVALID_ENUM_VALUE;
    }
    if (destFile == nullptr || destMob == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    File* const file = ImplementationAs<File>(destFile);
    if (file == nullptr) {
        return AAFRESULT_INVALID_OBJ;
    }
    ContentStorage* const target = file->OpenStorage();
    if (target == nullptr) {
        return AAFRESULT_NOT_OPEN;
    }
    RefPtr<Mob> copy;
    HRESULT result = target->AddCopy(*this, includeMedia == kAAFIncludeMedia, copy);
    if (result < 0) {
        return result;
    }
    // Mobs that are there already are taken as they are, so circles end.
    ContentStorage* const source = dynamic_cast<ContentStorage*>(owner());
    if (resolveDependencies == kAAFFollowDepend && source != nullptr) {
        ForEachReference(*this, [&](SourceReference& reference) {
            aafMobID_t id{};
            reference.GetSourceID(&id);
            Mob* const needed = source->FindMob(id);
            if (needed == nullptr || target->FindMob(id) != nullptr || result < 0) {
                return;
            }
            IAAFMob* ignored = nullptr;
            result = needed->CloneExternal(resolveDependencies, includeMedia, destFile, &ignored);
            if (ignored != nullptr) {
                ignored->Release();
            }
        });
    }
    return result < 0 ? result : GiveOut(copy.get(), destMob);
}

HRESULT Mob::Copy(aafCharacter_constptr destMobName, IAAFMob** destMob) {
    if (destMobName == nullptr || destMob == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const RefPtr<Object> copied = model()->CopyObject(*this);
    const RefPtr<Mob> copy(dynamic_cast<Mob*>(copied.get()));
    if (!copy) {
        return AAFRESULT_INTERNAL_ERROR;
    }
    const aafTimeStamp_t now = CurrentTime();
    copy->SetMobID(NewMobId());
    copy->SetName(destMobName);
    copy->SetCreateTime(now);
    copy->SetModTime(now);
    if (ContentStorage* const storage = dynamic_cast<ContentStorage*>(owner())) {
        const HRESULT result = storage->AddToSet(prop::ContentStorage_Mobs, copy->Identity());
        if (result < 0) {
            return result;
        }
    }
    return GiveOut(copy.get(), destMob);
}

}  // namespace aaf
