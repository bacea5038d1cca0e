// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/RegisterQuickTimeComponents.h"

#include "reference_host/quicktime/QuickTimeProperty.h"
#include "reference_host/quicktime/QuickTimeWrapper.h"

extern "C" {
#include <libavutil/log.h>
}

namespace host {

void RegisterQuickTimeComponents(Host& host) {
    // What goes wrong is told by results; the library's own lines say it twice.
    av_log_set_level(AV_LOG_QUIET);
    host.RegisterComponent(QTWrapper::CompID_QuickTimeWrapper,
                           MakerOf([](INCFUnknown*) { return MakeRef<QuickTimeWrapper>(); }));
    host.RegisterComponent(QuickTime::CompID_QuickTimeProperty,
                           MakerOf([](INCFUnknown*) { return MakeRef<QuickTimeProperty>(); }));
}

}  // namespace host
