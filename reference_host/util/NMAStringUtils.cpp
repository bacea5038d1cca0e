// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/util/NMAStringUtils.h"

#include <cstring>
#include <cwchar>

#include "reference_host/system/Paths.h"
#include "reference_host/util/NMAStringState.h"
#include "text/Encodings.h"

using host::util::Quietly;

NMAString NMAStringUtils::CreateWCharNMAString(const wchar_t* characters, ncfSInt32 length) {
    NMAString made;
    if (characters == nullptr || length < -1 || made.state_ == nullptr) {
        return made;
    }
    made.state_->encoding = kNCFWCHAR;
    Quietly([&] {
        const std::size_t units =
            length == -1 ? std::wcslen(characters) : static_cast<std::size_t>(length);
        made.state_->Take(encodings::FromWide({characters, units}));
    });
    return made;
}

NMAString NMAStringUtils::GetParentFolder(const NMAString& path) {
    NMAString folder(path);
    if (folder.state_ == nullptr) {
        return folder;
    }
    Quietly([&] {
        std::u32string characters = folder.state_->Characters();
        while (!characters.empty() && !host::system::IsSeparator(characters.back())) {
            characters.pop_back();
        }
        folder.state_->Take(std::move(characters));
    });
    return folder;
}

NMAString NMAStringUtils::CombinePath(const NMAString& folder, const NMAString& name) {
    NMAString path(folder);
    if (path.state_ == nullptr) {
        return path;
    }
    Quietly([&] {
        std::u32string characters = path.state_->Characters();
        if (!characters.empty() && !host::system::IsSeparator(characters.back())) {
            characters.push_back(U'\\');
            path.state_->Take(std::move(characters));
        }
    });
    path += name;
    return path;
}

bool NMAStringUtils::IsStartWith(const NMAString& whole, const char* start) {
    return start != nullptr && std::strncmp(whole.GetUTF8String(), start, std::strlen(start)) == 0;
}
