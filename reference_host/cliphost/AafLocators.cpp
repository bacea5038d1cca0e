// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/AafLocators.h"

#include "host_interfaces/aaf/AAFClassIds.h"
#include "host_interfaces/aaf/AAFDictionary.h"
#include "reference_host/cliphost/AafQuery.h"
#include "reference_host/cliphost/Failure.h"
#include "reference_host/system/Paths.h"
#include "text/Encodings.h"

namespace cliphost {
namespace {

constexpr int kDeepestDescriptors = 32;  // descriptors inside descriptors

using TakeDescriptor = std::function<void(IAAFEssenceDescriptor& descriptor)>;

void VisitDescriptor(IUnknown* object, const TakeDescriptor& take, int depth) {
    const auto descriptor = As<IAAFEssenceDescriptor>(object);
    if (!descriptor || depth > kDeepestDescriptors) {
        return;
    }
    take(*descriptor);
    const auto multiple = As<IAAFMultipleDescriptor>(object);
    aafUInt32 count = 0;
    if (!multiple || multiple->CountFileDescriptors(&count) < 0) {
        return;
    }
    for (aafUInt32 i = 0; i < count; ++i) {
        host::Ref<IAAFFileDescriptor> part;
        if (multiple->GetFileDescriptorAt(i, part.Out()) >= 0) {
            VisitDescriptor(part.get(), take, depth + 1);
        }
    }
}

}  // namespace

void ForEachDescriptorOf(IAAFMob& mob, const TakeDescriptor& take) {
    const auto source = As<IAAFSourceMob>(&mob);
    host::Ref<IAAFEssenceDescriptor> descriptor;
    if (source && source->GetEssenceDescriptor(descriptor.Out()) >= 0) {
        VisitDescriptor(descriptor.get(), take, 0);
    }
}

void ForEachLocatorOf(IAAFMob& mob, const TakeLocator& take) {
    ForEachDescriptorOf(mob, [&](IAAFEssenceDescriptor& descriptor) {
        aafUInt32 count = 0;
        descriptor.CountLocators(&count);
        for (aafUInt32 i = 0; i < count; ++i) {
            host::Ref<IAAFLocator> locator;
            if (descriptor.GetLocatorAt(i, locator.Out()) >= 0) {
                take(mob, *locator);
            }
        }
    });
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

void AppendLocator(IAAFFile* file, IAAFEssenceDescriptor& descriptor, const std::string& url) {
    host::Ref<IAAFDictionary> dictionary;
    host::Ref<IAAFLocator> added;
    if (file->GetDictionary(dictionary.Out()) < 0 ||
        dictionary->CreateInstance(AUID_AAFNetworkLocator, IID_IAAFLocator,
                                   reinterpret_cast<IUnknown**>(added.Out())) < 0) {
        throw Failure(kExitFile, host::system::PathOfText(url),
                      "the AAF library makes no locator for it");
    }
    SetPath(*added, url);
    if (descriptor.AppendLocator(added.get()) < 0) {
        throw Failure(kExitFile, host::system::PathOfText(url),
                      "the AAF library does not take a locator for it");
    }
}

void SetPath(IAAFLocator& locator, const std::string& url) {
    if (locator.SetPath(encodings::ToWideLossy(encodings::FromUtf8(url)).c_str()) < 0) {
        throw Failure(kExitFile, host::system::PathOfText(url),
                      "the AAF library does not take this as a locator's path");
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
