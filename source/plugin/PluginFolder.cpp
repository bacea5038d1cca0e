// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/plugin/PluginFolder.h"

#include "source/plugin/NCFSmartPtr.h"

namespace {

NCFSmartPtr<INCFString>& Folder() {
    static auto* const folder = new NCFSmartPtr<INCFString>;
    return *folder;
}

}  // namespace

void SetPluginFolder(INCFString* folder) {
    Folder() = folder;
}

INCFString* GetPluginFolder() {
    return Folder().inArg();
}
