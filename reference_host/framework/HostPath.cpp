// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/framework/HostPath.h"

#include "reference_host/framework/Guard.h"
#include "reference_host/system/Paths.h"
#include "reference_host/util/text/HostText.h"
#include "reference_host/util/text/Printable.h"
#include "text/Encodings.h"

namespace host {

NCFRESULT PathFrom(INCFString* text, std::filesystem::path& out) {
    return Guarded([&] {
        Need(text);
        const bool usable = host::system::ToSystemPath(text::Read(text), out) && !out.empty();
        return usable ? NCF_OK : NCF_E_INVALIDARG;
    });
}

Ref<String> ModulePath(const std::filesystem::path& path) {
    return MakeString(host::system::ToModulePath(path));
}

std::string DisplayPath(const std::filesystem::path& path) {
    return text::Printable(encodings::ToUtf8Lossy(host::system::FromSystemPath(path)));
}

}  // namespace host
