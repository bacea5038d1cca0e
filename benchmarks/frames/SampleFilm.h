// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>

#include "host_interfaces/quicktime/QuickTimeWrapper.h"
#include "reference_host/util/Ref.h"

// A film that the ffmpeg command makes once and that is deleted when the program ends.
class SampleFilm {
public:
    SampleFilm(const std::string& codec, int frames, const std::string& size = "1920x1080");
    ~SampleFilm();
    SampleFilm(const SampleFilm&) = delete;
    SampleFilm& operator=(const SampleFilm&) = delete;

    bool Works() const { return works_; }
    int Frames() const { return frames_; }
    const std::string& Path() const { return path_; }

    // A reader of its own, started; null when that failed.
    host::Ref<QTWrapper::IQTVideoReader> Open(ncfUInt32 fourCC) const;

private:
    std::string path_;
    int frames_;
    bool works_;
};
