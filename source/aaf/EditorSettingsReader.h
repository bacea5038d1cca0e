// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/ComponentFactory.h"
#include "source/clips/ClipRecords.h"

namespace NMA::Impl {

// Asks the host for the settings of the editor's project. Nothing here fails:
// what the host does not tell keeps its default.
EditorSettings ReadEditorSettings(INCFComponentFactory* pComponentFactory);

}  // namespace NMA::Impl
