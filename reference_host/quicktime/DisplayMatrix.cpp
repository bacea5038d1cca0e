// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/DisplayMatrix.h"

#include "reference_host/quicktime/MovieFile.h"

namespace host {
namespace {

// Of the library's nine numbers, row by row.
enum MatrixPlace { kA = 0, kB = 1, kC = 3, kD = 4 };
constexpr std::size_t kMatrixBytes = 9 * sizeof(int32_t);

}  // namespace

DisplayMatrix DisplayMatrixOf(const std::filesystem::path& movie) {
    std::string ignored;
    const auto file = MovieFile::Open(movie, ignored);
    const AVStream* const stream = file ? file->FindTrack(file->FirstVideo()) : nullptr;
    std::size_t size = 0;
    const auto* const told = stream ? reinterpret_cast<const int32_t*>(av_stream_get_side_data(
                                          stream, AV_PKT_DATA_DISPLAYMATRIX, &size))
                                    : nullptr;
    if (!told || size < kMatrixBytes) {
        return {};
    }
    const auto number = [told](MatrixPlace place) { return told[place] / 65536.0; };
    return {number(kA), number(kB), number(kC), number(kD)};
}

}  // namespace host
