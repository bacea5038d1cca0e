// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/Bin.h"

#include <fmt/format.h>

#include <set>

#include "host_interfaces/aaf/AAFDescriptors.h"
#include "host_interfaces/aaf/AAFMasterMobs.h"
#include "host_interfaces/aaf/AAFResultCodes.h"
#include "reference_host/cliphost/AafClips.h"
#include "reference_host/cliphost/AafLocators.h"
#include "reference_host/cliphost/AafQuery.h"
#include "reference_host/cliphost/Failure.h"

namespace cliphost {
std::filesystem::path Bin::Add(IAAFFile* description, const std::filesystem::path& movie) {
    const auto check = [&](HRESULT result, const char* step) {
        if (result < 0) {
            throw Failure(kExitFile, movie,
                          fmt::format("is not in the bin: {} failed: {}", step,
                                      library_.TextOfResult(result)));
        }
    };
    host::Ref<IAAFHeader> from;
    host::Ref<IAAFHeader> to;
    host::Ref<IEnumAAFMobs> mobs;
    check(description->GetHeader(from.Out()), "reading the description");
    check(from->GetMobs(nullptr, mobs.Out()), "reading the description");
    check(file_->GetHeader(to.Out()), "reading the bin");
    std::filesystem::path same;
    bool hasMore = false;
    host::Ref<IAAFMob> mob;
    while (mobs->NextOne(mob.Out()) >= 0) {
        aafMobID_t id{};
        check(mob->GetMobID(&id), "reading a mob's id");
        host::Ref<IAAFMob> there;
        const bool isMaster = As<IAAFMasterMob>(mob.get()).get() != nullptr;
        if (to->LookupMob(id, there.Out()) >= 0) {
            if (isMaster) {
                same = movies_[KeyOf(id)];
            }
            hasMore = AddLocators(*mob, *there) || hasMore;
            continue;
        }
        check(mob->CloneExternal(kAAFNoFollowDepend, kAAFNoIncludeMedia, file_.get(), there.Out()),
              "copying a mob");
        if (isMaster) {
            movies_.emplace(KeyOf(id), movie.native());
            clips_.push_back(std::move(there));
        }
    }
    return hasMore ? same : std::filesystem::path();
}

// Whether there is one that was not there.
bool Bin::AddLocators(IAAFMob& from, IAAFMob& to) {
    aafMobID_t id{};
    to.GetMobID(&id);
    std::set<std::string>& known = urls_[KeyOf(id)];
    if (known.empty()) {
        ForEachLocatorOf(to,
                         [&](IAAFMob&, IAAFLocator& locator) { known.insert(PathOf(locator)); });
    }
    bool hasMore = false;
    const auto source = As<IAAFSourceMob>(&to);
    host::Ref<IAAFEssenceDescriptor> descriptor;
    if (!source || source->GetEssenceDescriptor(descriptor.Out()) < 0) {
        return false;
    }
    ForEachLocatorOf(from, [&](IAAFMob&, IAAFLocator& locator) {
        const std::string url = PathOf(locator);
        if (known.insert(url).second) {
            AppendLocator(file_.get(), *descriptor, url);
            hasMore = true;
        }
    });
    return hasMore;
}

}  // namespace cliphost
