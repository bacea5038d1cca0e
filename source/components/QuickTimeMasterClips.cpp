// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/components/QuickTimeMasterClips.h"

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
        if (!NMAStringUtils::IsStartWith(name, ".")) {
            _MCList.push_back(NMAStringUtils::CombinePath(folder_, name));
        }
    }
}

ncfSInt32 QuickTimeMasterClips::GetCount() {
    return static_cast<ncfSInt32>(_MCList.size());
}

NCFRESULT QuickTimeMasterClips::GetClipPath(ncfSInt32 index, INCFString* path) {
    if (index < 0 || index >= GetCount() || !path) {
        return NCF_E_INVALIDARG;
    }
    return ResultOf([&] { return path->Assign(_MCList[static_cast<std::size_t>(index)].InArg()); });
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
        NCF_RETURN(LoadMedia(_MCList[index].InArg(), _pConsole, _pComponentFactory, media));
        *ppData = nullptr;
        NCF_RETURN_TEXT("NewAAFFromMovie(media, _pConsole, ppData, _pComponentFactory)",
                        NewAAFFromMovie(media, _pConsole, ppData, _pComponentFactory.inArg()));
        return NCF_OK;
    });
}

}  // namespace NMA::Impl
