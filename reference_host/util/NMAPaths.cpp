// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <filesystem>
#include <system_error>

#include "host_interfaces/util/NMAUtil.h"
#include "reference_host/system/Paths.h"
#include "reference_host/util/Factory.h"
#include "reference_host/util/NMAStringState.h"
#include "reference_host/util/text/FileUrl.h"
#include "reference_host/util/text/HostText.h"
#include "text/Encodings.h"

namespace text = host::text;
using host::util::Quietly;

namespace {

// Hands `value` out as a new host string.
NCFRESULT GiveOut(const std::u32string& value, INCFString** out) {
    host::Ref<INCFString> made;
    NCFRESULT result = host::util::CreateHostString(made);
    if (result >= 0) {
        result = text::Assign(made.get(), value, kNCFUTF16);
    }
    if (result >= 0) {
        *out = made.Detach();
    }
    return result < 0 ? result : NCF_OK;
}

bool StartsWithDrive(const std::u32string& path) {
    const bool letter = path.size() >= 3 && ((path[0] >= U'A' && path[0] <= U'Z') ||
                                             (path[0] >= U'a' && path[0] <= U'z'));
    return letter && path[1] == U':' && path[2] == U'/';
}

void UseForwardSlashes(std::u32string& path) {
    for (char32_t& c : path) {
        c = host::system::IsSeparator(c) ? U'/' : c;
    }
}

// Takes a relative path from the working folder.
void MakeAbsolute(std::u32string& path) {
    if (path[0] == U'/' || StartsWithDrive(path)) {
        return;
    }
    std::error_code failure;
    std::u32string folder = host::system::FromSystemPath(std::filesystem::current_path(failure));
    UseForwardSlashes(folder);
    if (folder.empty() || folder.back() != U'/') {
        folder.push_back(U'/');
    }
    path.insert(0, folder);
}

// Three forms, all of RFC 8089: a drive stands behind an empty authority, a
// server is the authority, and a rooted path follows an empty one.
NCFRESULT UrlOf(std::u32string path, std::u32string& url) {
    if (path.empty() || path.find(U'\0') != std::u32string::npos) {
        return NCF_E_INVALIDARG;
    }
    UseForwardSlashes(path);
    MakeAbsolute(path);
    url = U"file://";
    if (StartsWithDrive(path)) {
        url += {U'/', path[0], U':'};
        path.erase(0, 2);
    } else if (path.compare(0, 2, U"//") == 0) {
        path.erase(0, 2);
    }
    std::string bytes;
    if (!encodings::ToUtf8(path, bytes)) {
        return NCF_E_FAIL;
    }
    url += encodings::FromUtf8(text::PercentEncoded(bytes));
    return NCF_OK;
}

std::u32string BareName(std::u32string path) {
    std::size_t start = path.size();
    while (start > 0 && !host::system::IsSeparator(path[start - 1])) {
        --start;
    }
    path.erase(0, start);
    const std::size_t dot = path.rfind(U'.');
    // A name that only starts with a dot has no extension.
    if (dot != std::u32string::npos && dot > 0) {
        path.erase(dot);
    }
    return path;
}

}  // namespace

NCFRESULT NMASplitPath(INCFString* path, INCFString** name) {
    if (name == nullptr) {
        return NCF_E_POINTER;
    }
    *name = nullptr;
    if (path == nullptr) {
        return NCF_E_POINTER;
    }
    return Quietly(NCF_E_OUTOFMEMORY, [&] { return GiveOut(BareName(text::Read(path)), name); });
}

NCFRESULT MakeURLPathFromFilePath(INCFString* path, INCFString** url) {
    if (url == nullptr) {
        return NCF_E_POINTER;
    }
    *url = nullptr;
    if (path == nullptr) {
        return NCF_E_POINTER;
    }
    return Quietly(NCF_E_OUTOFMEMORY, [&] {
        std::u32string made;
        const NCFRESULT result = UrlOf(text::Read(path), made);
        return result < 0 ? result : GiveOut(made, url);
    });
}
