// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <stdexcept>

#include "host_interfaces/quicktime/QuickTimeProperty.h"
#include "host_interfaces/quicktime/QuickTimeWrapper.h"
#include "reference_host/util/Ref.h"

namespace host {

// Thrown by all that needs the multimedia library where it can't be loaded: what is installed is
// at fault then, not a movie. The text names the file and tells why.
class MovieLibraryMissing : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

// New components over the multimedia library, for the host's factory.
Ref<QTWrapper::IQuickTimeWrapper> MakeQuickTimeWrapper();
Ref<QuickTime::IQuickTimeProperty> MakeQuickTimeProperty();

}  // namespace host
