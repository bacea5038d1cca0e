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

// Copies a mob and, if wanted, those that it leads to: all of them or none. Those that are there
// already are taken as they are, so circles end; a way may be as long as a file has mobs.
class Cloning {
public:
    Cloning(ContentStorage& target, bool withEssence)
        : target_(target), withEssence_(withEssence) {}

    HRESULT Add(const Mob& mob) {
        RefPtr<Mob> copy;
        const HRESULT result = target_.AddCopy(mob, withEssence_, copy);
        if (result >= 0) {
            copies_.push_back(copy);
            waiting_.push_back(&mob);
        }
        return result;
    }

    HRESULT AddReferredTo(const ContentStorage& source) {
        HRESULT result = AAFRESULT_SUCCESS;
        while (result >= 0 && !waiting_.empty()) {
            const Mob& mob = *waiting_.back();
            waiting_.pop_back();
            ForEachReference(mob, [&](const SourceReference& reference) {
                aafMobID_t id{};
                reference.ReadStruct(prop::SourceReference_SourceID, &id);
                const Mob* const needed = source.FindMob(id);
                if (needed != nullptr && target_.FindMob(id) == nullptr && result >= 0) {
                    result = Add(*needed);
                }
            });
        }
        return result;
    }

    const RefPtr<Mob>& first() const { return copies_.front(); }
    void TakeBack() {
        for (const RefPtr<Mob>& copy : copies_) {
            target_.RemoveCopy(*copy);
        }
    }

private:
    ContentStorage& target_;
    bool withEssence_;
    std::vector<RefPtr<Mob>> copies_;
    std::vector<const Mob*> waiting_;  // whose references were not followed yet
};

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
    Cloning cloning(*target, includeMedia == kAAFIncludeMedia);
    HRESULT result = cloning.Add(*this);
    const auto* const source = dynamic_cast<const ContentStorage*>(owner());
    if (result >= 0 && resolveDependencies == kAAFFollowDepend && source != nullptr) {
        result = cloning.AddReferredTo(*source);
    }
    if (result < 0) {
        cloning.TakeBack();
        return result;
    }
    return GiveOut(cloning.first().get(), destMob);
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
