// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/components/QuickTimeMasterClips.h"

#include <cstring>

#include "host_interfaces/util/NMAStringUtils.h"
#include "host_interfaces/util/NMAVolume.h"
#include "source/aaf/NewAAFFromMovie.h"
#include "source/clips/LoadMedia.h"
#include "source/components/HostServices.h"
#include "source/components/MoviePattern.h"
#include "source/plugin/ResultOf.h"

namespace NMA::Impl {

NCFRESULT QuickTimeMasterClips::InitializeInstance(INCFUnknown* host) {
    return ResultOf([&] {
        TakeComponentFactory(host, _pComponentFactory);
        TakeConsole(host, _pConsole);
        return NCF_OK;
    });
}

NCFRESULT QuickTimeMasterClips::InternalQueryInterface(const GUID& iid, void** out) {
    return QueryListedInterfaces<IAAFClips>(this, iid, out);
}

void QuickTimeMasterClips::Scan() {
    NMAVolume volume(folder_.InArg());
    void* handle = nullptr;
    for (INCFString* file = volume.GetFirstFile(kMoviePattern, handle); file;
         file = volume.GetNextFile(handle)) {
        const NMAString name(file, kNCFUTF16);
        file->Release();
        if (NMAStringUtils::IsStartWith(name, ".")) {
            continue;
        }
        const char* utf8 = name.GetUTF8String();
        if (NMAString(utf8) != name) {
            otherNames_.emplace(GetCount(), name);
            utf8 = "";
        }
        starts_.push_back(names_.size());
        names_.append(utf8, std::strlen(utf8) + 1);
    }
    names_.shrink_to_fit();
    starts_.shrink_to_fit();
}

NMAString QuickTimeMasterClips::PathOf(ncfSInt32 index) const {
    const auto other = otherNames_.find(index);
    return NMAStringUtils::CombinePath(
        folder_, other != otherNames_.end()
                     ? other->second
                     : NMAString(&names_[starts_[static_cast<std::size_t>(index)]]));
}

ncfSInt32 QuickTimeMasterClips::GetCount() {
    return static_cast<ncfSInt32>(starts_.size());
}

NCFRESULT QuickTimeMasterClips::GetClipPath(ncfSInt32 index, INCFString* path) {
    if (index < 0 || index >= GetCount() || !path) {
        return NCF_E_INVALIDARG;
    }
    return ResultOf([&] { return path->Assign(PathOf(index).InArg()); });
}

NCFRESULT QuickTimeMasterClips::GetMetadata(ncfSInt32 index, IAAFFile** ppData) {
    NCF_FUNCTION("NMA::Impl::QuickTimeMasterClips::GetMetadata");
    if (!ppData) {
        return NCF_E_INVALIDARG;
    }
    if (index < 0 || index >= GetCount()) {
        return NCF_E_NOTFOUND;
    }
    return ResultOf([&]() -> NCFRESULT {
        std::tr1::shared_ptr<BaseClip> media;
        const NMAString path = PathOf(index);
        NCF_RETURN_TEXT("LoadMedia(_MCList[index].InArg(), _pConsole, _pComponentFactory, media)",
                        LoadMedia(path.InArg(), _pConsole, _pComponentFactory, media));
        *ppData = nullptr;
        NCF_RETURN_TEXT("NewAAFFromMovie(media, _pConsole, ppData, _pComponentFactory)",
                        NewAAFFromMovie(media, _pConsole, ppData, _pComponentFactory.inArg()));
        return NCF_OK;
    });
}

}  // namespace NMA::Impl
