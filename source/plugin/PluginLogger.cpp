// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/plugin/PluginLogger.h"

NMALogger& PluginLogger() {
    static NMALogger* const logger = new NMALogger;
    return *logger;
}
