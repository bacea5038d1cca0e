// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/components/QuickTimeVolumeInfo.h"

#include <algorithm>
#include <string>

#include "host_interfaces/util/NMAVolume.h"
#include "source/components/MoviePattern.h"
#include "source/plugin/NCFSmartPtr.h"
#include "source/plugin/ResultChecks.h"
#include "source/plugin/ResultOf.h"

namespace NMA::Impl {

NCFRESULT QuickTimeVolumeInfo::InternalQueryInterface(const GUID& iid, void** out) {
    return QueryListedInterfaces<IVolumeInfo, IVolumeInfo2>(this, iid, out);
}

NCFRESULT QuickTimeVolumeInfo::GetSerialNumber(ncfUInt32* serial) {
    if (!serial) {
        return NCF_E_INVALIDARG;
    }
    return ResultOf([&] {
        *serial = NMAVolume(volumePath_.InArg()).GetVolumeSerialNumber();
        return NCF_OK;
    });
}

NCFRESULT QuickTimeVolumeInfo::GetLabel(INCFString** label) {
    if (!label) {
        return NCF_E_INVALIDARG;
    }
    return ResultOf([&] {
        *label = nullptr;
        *label = NMAVolume(volumePath_.InArg()).GetVolumeLabel();
        return NCF_OK;
    });
}

NCFRESULT QuickTimeVolumeInfo::GetType(ncfUInt32* type) {
    if (!type) {
        return NCF_E_INVALIDARG;
    }
    return ResultOf([&] {
        *type = NMAVolume(volumePath_.InArg()).GetVolumeType();
        return NCF_OK;
    });
}

// The date of the newest movie: the larger of the low halves of the dates.
NCFRESULT QuickTimeVolumeInfo::GetModificationDate(ncfUInt32* date) {
    if (!date) {
        return NCF_E_INVALIDARG;
    }
    return ResultOf([&] {
        ncfUInt32 newest = 0;
        NMAVolume volume(volumePath_.InArg());
        void* handle = nullptr;
        for (INCFString* file = volume.GetFirstFile(kMoviePattern, handle); file;
             file = volume.GetNextFile(handle)) {
            newest = std::max(newest, static_cast<ncfUInt32>(volume.GetModificationDate(file)));
            file->Release();
        }
        *date = newest;
        return NCF_OK;
    });
}

NCFRESULT QuickTimeVolumeInfo::VolumeQueryA(void*) {
    return NMA_E_NODATA;
}
NCFRESULT QuickTimeVolumeInfo::VolumeQueryB() {
    return 1;
}
NCFRESULT QuickTimeVolumeInfo::VolumeQueryC() {
    return 1;
}
NCFRESULT QuickTimeVolumeInfo::VolumeQueryD() {
    return static_cast<NCFRESULT>(0xFFFFFFFFu);
}

NCFRESULT QuickTimeVolumeInfo::GetVolumeName(INCFString** name) {
    return ResultOf([&] {
        if (volumePath_.IsEmpty()) {
            return NMA_E_NOTINITIALIZED;
        }
        if (!name) {
            return NCF_E_INVALIDARG;
        }
        *name = nullptr;
        std::u16string path = volumePath_.GetUTF16String();
        if (path.empty()) {
            return NMA_E_NOTINITIALIZED;
        }
        if (path.back() == u'\\') {
            path.pop_back();
        }
        const std::size_t slash = path.rfind(u'\\');
        const std::u16string last =
            slash == std::u16string::npos ? std::u16string() : path.substr(slash + 1);
        NCFSmartPtr<INCFString> result;
        ThrowIfFailed(NMAString::CreateString(result.outArg()));
        ThrowIfFailed(
            result->AssignUTF16(kNCFUTF16, last.c_str(), static_cast<ncfUInt32>(last.size())));
        *name = result.detach();
        return NCF_OK;
    });
}

}  // namespace NMA::Impl
