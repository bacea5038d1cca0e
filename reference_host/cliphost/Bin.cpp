// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/Bin.h"

#include <fmt/format.h>

#include <set>

#include "host_interfaces/aaf/AAFClassIds.h"
#include "host_interfaces/aaf/AAFDescriptors.h"
#include "host_interfaces/aaf/AAFDictionary.h"
#include "host_interfaces/aaf/AAFMasterMobs.h"
#include "host_interfaces/aaf/AAFResultCodes.h"
#include "reference_host/cliphost/AafLocators.h"
#include "reference_host/cliphost/AafQuery.h"
#include "reference_host/cliphost/Failure.h"

namespace cliphost {
namespace {

std::string KeyOf(IAAFMob& mob) {
    aafMobID_t id{};
    mob.GetMobID(&id);
    return std::string(reinterpret_cast<const char*>(&id), sizeof id);
}

}  // namespace

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
    host::Ref<IAAFMob> mob;
    while (mobs->NextOne(mob.Out()) >= 0) {
        aafMobID_t id{};
        check(mob->GetMobID(&id), "reading a mob's id");
        host::Ref<IAAFMob> there;
        const bool isMaster = As<IAAFMasterMob>(mob.get()).get() != nullptr;
        if (to->LookupMob(id, there.Out()) >= 0) {
            if (isMaster) {
                same = movies_[KeyOf(*mob)];
            }
            AddLocators(*mob, *there);
            continue;
        }
        check(mob->CloneExternal(kAAFNoFollowDepend, kAAFNoIncludeMedia, file_.get(), there.Out()),
              "copying a mob");
        if (isMaster) {
            movies_.emplace(KeyOf(*mob), movie.native());
            clips_.push_back(std::move(there));
        }
    }
    return same;
}

void Bin::AddLocators(IAAFMob& from, IAAFMob& to) {
    std::set<std::string> known;
    ForEachLocatorOf(to, [&](IAAFMob&, IAAFLocator& locator) { known.insert(PathOf(locator)); });
    const auto source = As<IAAFSourceMob>(&to);
    host::Ref<IAAFEssenceDescriptor> descriptor;
    host::Ref<IAAFDictionary> dictionary;
    if (!source || source->GetEssenceDescriptor(descriptor.Out()) < 0 ||
        file_->GetDictionary(dictionary.Out()) < 0) {
        return;
    }
    ForEachLocatorOf(from, [&](IAAFMob&, IAAFLocator& locator) {
        const std::string url = PathOf(locator);
        host::Ref<IAAFLocator> added;
        if (known.insert(url).second &&
            dictionary->CreateInstance(AUID_AAFNetworkLocator, IID_IAAFLocator,
                                       reinterpret_cast<IUnknown**>(added.Out())) >= 0) {
            SetPath(*added, url);
            descriptor->AppendLocator(added.get());
        }
    });
}

}  // namespace cliphost
