// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/util/NMAVolume.h"

#include <algorithm>
#include <memory>
#include <new>
#include <vector>

#include "reference_host/system/FileSystem.h"
#include "reference_host/system/Paths.h"
#include "reference_host/util/Factory.h"
#include "reference_host/util/NMAStringState.h"
#include "reference_host/util/RefusingString.h"
#include "reference_host/util/files/FolderSearch.h"
#include "text/Encodings.h"

namespace text = host::text;
using host::files::FolderSearch;
using host::util::Quietly;

struct NMAVolume::State {
    std::filesystem::path folder;
    // The searches under way; a handle is the address of one of them.
    std::vector<std::unique_ptr<FolderSearch>> searches;

    // The next name of a search as a host string; at the end the search goes
    // and its handle becomes null.
    INCFString* Advance(void*& handle) {
        const auto search = std::find_if(searches.begin(), searches.end(),
                                         [&](const auto& one) { return one.get() == handle; });
        if (search == searches.end()) {
            handle = nullptr;
            return nullptr;
        }
        host::Ref<INCFString> made;
        std::u32string name;
        if ((*search)->Next(name) && host::util::CreateHostString(made) >= 0 &&
            text::Assign(made.get(), name, kNCFUTF16) >= 0) {
            return made.Detach();
        }
        searches.erase(search);
        handle = nullptr;
        return nullptr;
    }
};

NMAVolume::NMAVolume(INCFString* folder) : state_(new (std::nothrow) State) {
    if (state_ == nullptr) {
        return;
    }
    Quietly(false, [&] { return host::system::ToSystemPath(text::Read(folder), state_->folder); });
}

NMAVolume::~NMAVolume() {
    delete state_;
}

INCFString* NMAVolume::GetFirstFile(const char* pattern, void*& handle) {
    handle = nullptr;
    if (state_ == nullptr || pattern == nullptr) {
        return nullptr;
    }
    return Quietly(static_cast<INCFString*>(nullptr), [&] {
        auto search = std::make_unique<FolderSearch>(state_->folder, encodings::FromUtf8(pattern));
        void* started = search.get();
        state_->searches.push_back(std::move(search));
        handle = started;
        return state_->Advance(handle);
    });
}

INCFString* NMAVolume::GetNextFile(void*& handle) {
    if (state_ == nullptr || handle == nullptr) {
        return nullptr;
    }
    return Quietly(static_cast<INCFString*>(nullptr), [&] { return state_->Advance(handle); });
}

ncfUInt32 NMAVolume::GetVolumeSerialNumber() {
    if (state_ == nullptr) {
        return 0;
    }
    return Quietly(ncfUInt32{0},
                   [&] { return host::system::ReadVolumeFacts(state_->folder).serialNumber; });
}

INCFString* NMAVolume::GetVolumeLabel() {
    host::Ref<INCFString> label;
    if (host::util::CreateHostString(label) < 0) {
        return host::util::RefusingString();
    }
    if (state_ != nullptr) {
        Quietly(NCF_E_OUTOFMEMORY, [&] {
            const std::u32string name = host::system::ReadVolumeFacts(state_->folder).label;
            return text::Assign(label.get(), name, kNCFUTF16);
        });
    }
    return label.Detach();
}

ncfUInt32 NMAVolume::GetVolumeType() {
    if (state_ == nullptr) {
        return 0;
    }
    return Quietly(ncfUInt32{0},
                   [&] { return host::system::ReadVolumeFacts(state_->folder).type; });
}

ncfUInt64 NMAVolume::GetModificationDate(INCFString* name) {
    if (state_ == nullptr || name == nullptr) {
        return 0;
    }
    return Quietly(ncfUInt64{0}, [&] {
        std::filesystem::path bare;
        if (!host::system::ToSystemPath(text::Read(name), bare) || bare.empty()) {
            return ncfUInt64{0};
        }
        return ncfUInt64{host::system::LastWrite(state_->folder / bare)};
    });
}
