// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/AafLocators.h"

#include "host_interfaces/aaf/AAFDescriptors.h"
#include "reference_host/cliphost/AafQuery.h"
#include "reference_host/cliphost/Failure.h"
#include "text/Encodings.h"

namespace cliphost {
namespace {

constexpr int kDeepestDescriptors = 32;  // descriptors inside descriptors

void VisitDescriptor(IAAFMob& mob, IUnknown* object, const TakeLocator& take, int depth) {
    const auto descriptor = As<IAAFEssenceDescriptor>(object);
    aafUInt32 count = 0;
    if (!descriptor || depth > kDeepestDescriptors || descriptor->CountLocators(&count) < 0) {
        return;
    }
    for (aafUInt32 i = 0; i < count; ++i) {
        host::Ref<IAAFLocator> locator;
        if (descriptor->GetLocatorAt(i, locator.Out()) >= 0) {
            take(mob, *locator);
        }
    }
    const auto multiple = As<IAAFMultipleDescriptor>(object);
    if (!multiple || multiple->CountFileDescriptors(&count) < 0) {
        return;
    }
    for (aafUInt32 i = 0; i < count; ++i) {
        host::Ref<IAAFFileDescriptor> part;
        if (multiple->GetFileDescriptorAt(i, part.Out()) >= 0) {
            VisitDescriptor(mob, part.get(), take, depth + 1);
        }
    }
}

}  // namespace

void ForEachLocatorOf(IAAFMob& mob, const TakeLocator& take) {
    const auto source = As<IAAFSourceMob>(&mob);
    host::Ref<IAAFEssenceDescriptor> descriptor;
    if (source && source->GetEssenceDescriptor(descriptor.Out()) >= 0) {
        VisitDescriptor(mob, descriptor.get(), take, 0);
    }
}

void ForEachLocator(IAAFFile* file, const TakeLocator& take) {
    host::Ref<IAAFHeader> header;
    host::Ref<IEnumAAFMobs> mobs;
    if (!file || file->GetHeader(header.Out()) < 0 || header->GetMobs(nullptr, mobs.Out()) < 0) {
        return;
    }
    host::Ref<IAAFMob> mob;
    while (mobs->NextOne(mob.Out()) >= 0) {
        ForEachLocatorOf(*mob, take);
    }
}

std::string PathOf(IAAFLocator& locator) {
    return TextOf(&locator, &IAAFLocator::GetPathBufLen, &IAAFLocator::GetPath);
}

void SetPath(IAAFLocator& locator, const std::string& url) {
    if (locator.SetPath(encodings::ToWideLossy(encodings::FromUtf8(url)).c_str()) < 0) {
        throw Failure(kExitFile, url, "the AAF library does not take this as a locator's path");
    }
}

void MapLocators(IAAFFile* file, PathMaps& maps) {
    if (maps.IsEmpty()) {
        return;
    }
    ForEachLocator(file, [&](IAAFMob&, IAAFLocator& locator) {
        std::string url = PathOf(locator);
        if (maps.MapToOther(url)) {
            SetPath(locator, url);
        }
    });
}

}  // namespace cliphost
