// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/SettingsOptions.h"

#include "reference_host/cliphost/OptionChecks.h"

namespace cliphost {

void AddSettings(CLI::App& app, host::HostOptions& host) {
    const char* const group = "Host and editor settings";
    app.add_option("--editor-rate", host.editorFrameRate, "Frames per second of the project")
        ->check(FrameRate())
        ->default_str("25")
        ->group(group);
    app.add_option("--forced-rate", host.forcedFrameRate,
                   "Frames per second to use instead of a clip's own")
        ->check(FrameRate())
        ->group(group);
    app.add_option("--single-frame-duration", host.singleFrameDuration,
                   "Length of one-frame clips, in frames")
        ->check(SmallWholeNumber())
        ->default_str("60")
        ->group(group);
    app.add_flag("--movie-header-duration", host.movieHeaderDuration,
                 "Take lengths from the movie header")
        ->group(group);
    host.ignoreAlpha = true;
    app.add_flag_callback(
           "--use-alpha", [&host] { host.ignoreAlpha = false; }, "Describe alpha channels too")
        ->group(group);
}

}  // namespace cliphost
