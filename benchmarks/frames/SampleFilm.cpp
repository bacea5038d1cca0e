// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "benchmarks/frames/SampleFilm.h"

#include <cstdlib>
#include <filesystem>
#include <random>

#include "reference_host/framework/HostPath.h"
#include "reference_host/quicktime/QuickTimeWrapper.h"
#include "tests/support/Quoted.h"

SampleFilm::SampleFilm(const std::string& codec, int frames, const std::string& size)
    : path_((std::filesystem::temp_directory_path() /
             ("bench_frames_" + std::to_string(std::random_device()()) + ".mov"))
                .string()),
      frames_(frames),
      works_(std::system(("ffmpeg -y -v error -f lavfi -i testsrc2=s=" + size + ":r=25 -frames:v " +
                          std::to_string(frames) + " " + codec + " " + Quoted(path_))
                             .c_str()) == 0) {}

SampleFilm::~SampleFilm() {
    std::error_code ignored;
    std::filesystem::remove(path_, ignored);
}

host::Ref<QTWrapper::IQTVideoReader> SampleFilm::Open(ncfUInt32 fourCC) const {
    const auto wrapper = host::MakeRef<host::QuickTimeWrapper>();
    host::Ref<QTWrapper::IQTVideoReader> reader;
    if (wrapper->NewMovieFromFilePath(host::ModulePath(path_).get()) != NCF_OK ||
        wrapper->GetQTVideoReader(reader.Out()) != NCF_OK ||
        reader->SetOutputPixelFormat(fourCC, 0, 0) != NCF_OK ||
        reader->InitQT(QTWrapper::kUseDecompressionSession) != NCF_OK) {
        reader.Reset();
    }
    return reader;
}
