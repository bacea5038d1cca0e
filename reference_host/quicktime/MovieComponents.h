// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/quicktime/QuickTimeProperty.h"
#include "host_interfaces/quicktime/QuickTimeWrapper.h"
#include "reference_host/util/Ref.h"

namespace host {

// New components over the multimedia library, for the host's factory; null where it can't be
// loaded.
Ref<QTWrapper::IQuickTimeWrapper> MakeQuickTimeWrapper();
Ref<QuickTime::IQuickTimeProperty> MakeQuickTimeProperty();

}  // namespace host
