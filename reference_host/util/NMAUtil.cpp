// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/util/NMAUtil.h"

#include "reference_host/util/Factory.h"

NCFRESULT NMAInitialize(INCFComponentFactory* factory) {
    if (factory == nullptr) {
        return NCF_E_POINTER;
    }
    host::util::KeepFactory(factory);
    return NCF_OK;
}

NCFRESULT NMATerminate() {
    host::util::KeepFactory(nullptr);
    return NCF_OK;
}

void LogVersionInfo(NMALogger* logger, const char* name, const NMAString& modulePath) {
    if (logger == nullptr) {
        return;
    }
    logger->Write(8, "%s, loaded from %s", name == nullptr ? "" : name, modulePath.GetUTF8String());
}
