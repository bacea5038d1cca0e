// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#pragma once

#include "host_interfaces/framework/Unknown.h"
#include "host_interfaces/media/PluginComponents.h"
#include "source/descriptor_data/XMLDataContainer.h"

namespace NMA::Impl {

// Tells a document handler where its events go. Inside the module only.
struct IGenericDocHandler : INCFUnknown {
    // 3. The container is borrowed and must outlive the parse.
    virtual NCFRESULT SetDataContainer(XMLDataContainer* container) = 0;

protected:
    ~IGenericDocHandler() = default;
};

}  // namespace NMA::Impl

inline constexpr GUID kIID_GenericDocHandler = ncfGuid("1C75F5F3-9AB9-463C-82C7-36D22D7DDAEB");

namespace NMA::Impl {
constexpr const GUID& ncfIdOf(const IGenericDocHandler*) {
    return kIID_GenericDocHandler;
}
}  // namespace NMA::Impl
