// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/MovieComponents.h"

#include "reference_host/quicktime/QuickTimeProperty.h"
#include "reference_host/quicktime/QuickTimeWrapper.h"

extern "C" {
#include <libavutil/log.h>
}

namespace host {
namespace {

// What goes wrong is told by results; the library's own lines say it twice.
template <class Made>
Ref<Made> MakeQuietly() {
    av_log_set_level(AV_LOG_QUIET);
    return MakeRef<Made>();
}

}  // namespace

Ref<QTWrapper::IQuickTimeWrapper> MakeQuickTimeWrapper() {
    return MakeQuietly<QuickTimeWrapper>();
}

Ref<QuickTime::IQuickTimeProperty> MakeQuickTimeProperty() {
    return MakeQuietly<QuickTimeProperty>();
}

}  // namespace host
