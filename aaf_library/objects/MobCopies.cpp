// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
// The operations of a mob that reach other mobs and files.
#include <functional>
#include <vector>

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

// Copies the mobs that a mob leads to. Those that are there already are taken as they are, so
// circles end; a way may be as long as a file has mobs.
HRESULT CopyReferredTo(const Mob& first, bool withEssence, ContentStorage& target) {
    const auto* const source = dynamic_cast<const ContentStorage*>(first.owner());
    std::vector<const Mob*> waiting;
    if (source != nullptr) {
        waiting.push_back(&first);
    }
    HRESULT result = AAFRESULT_SUCCESS;
    while (result >= 0 && !waiting.empty()) {
        const Mob& mob = *waiting.back();
        waiting.pop_back();
        ForEachReference(mob, [&](const SourceReference& reference) {
            aafMobID_t id{};
            reference.ReadStruct(prop::SourceReference_SourceID, &id);
            const Mob* const needed = source->FindMob(id);
            if (needed == nullptr || target.FindMob(id) != nullptr || result < 0) {
                return;
            }
            RefPtr<Mob> copy;
            result = target.AddCopy(*needed, withEssence, copy);
            waiting.push_back(needed);
        });
    }
    return result;
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
    const bool withEssence = includeMedia == kAAFIncludeMedia;
    RefPtr<Mob> copy;
    HRESULT result = target->AddCopy(*this, withEssence, copy);
    if (result >= 0 && resolveDependencies == kAAFFollowDepend) {
        result = CopyReferredTo(*this, withEssence, *target);
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
