// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "tests/unit/quicktime/MadeMovie.h"

#include <gtest/gtest.h>

#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <iterator>
#include <limits>
#include <sstream>

#include "reference_host/framework/HostPath.h"
#include "reference_host/quicktime/QuickTimeWrapper.h"
#include "tests/support/Quoted.h"

namespace quicktime_tests {
namespace {

Bytes OutputOf(const std::string& command) {
    Bytes bytes;
    std::FILE* const pipe = popen(command.c_str(), "r");
    if (!pipe) {
        return bytes;
    }
    std::uint8_t piece[65536];
    for (std::size_t got; (got = std::fread(piece, 1, sizeof piece, pipe)) > 0;) {
        bytes.insert(bytes.end(), piece, piece + got);
    }
    EXPECT_EQ(pclose(pipe), 0) << command;
    return bytes;
}

}  // namespace

MadeMovie::MadeMovie(const std::string& arguments, const std::string& ending)
    : path_(folder_ / ("made" + ending)) {
    const std::string command = "ffmpeg -y -v error " + arguments + " " + Quoted();
    EXPECT_EQ(std::system(command.c_str()), 0) << command;
}

MadeMovie::MadeMovie(const Bytes& content, const std::string& ending)
    : path_(folder_ / ("made" + ending)) {
    std::ofstream(path_, std::ios::binary)
        .write(reinterpret_cast<const char*>(content.data()),
               static_cast<std::streamsize>(content.size()));
}

std::string MadeMovie::Quoted() const {
    return ::Quoted(path_);
}

Bytes MadeMovie::Content() const {
    std::ifstream stream(path_, std::ios::binary);
    return Bytes{std::istreambuf_iterator<char>(stream), std::istreambuf_iterator<char>()};
}

Bytes MadeMovie::Decoded(const std::string& arguments, const std::string& before) const {
    return OutputOf("ffmpeg -v quiet " + before + " -i " + Quoted() + " " + arguments + " -");
}

std::vector<std::string> MadeMovie::Probed(const std::string& arguments) const {
    const Bytes bytes = OutputOf("ffprobe -v error -of csv=p=0 " + arguments + " " + Quoted());
    std::istringstream text(std::string(bytes.begin(), bytes.end()));
    std::vector<std::string> lines;
    for (std::string line; std::getline(text, line);) {
        if (!line.empty()) {
            lines.push_back(line);
        }
    }
    return lines;
}

host::Ref<QTWrapper::IQuickTimeWrapper> OpenWrapper(const std::filesystem::path& path) {
    const auto wrapper = host::MakeRef<host::QuickTimeWrapper>();
    const auto text = host::ModulePath(path);
    return wrapper->NewMovieFromFilePath(text.get()) == NCF_OK
               ? host::Ref<QTWrapper::IQuickTimeWrapper>(wrapper)
               : nullptr;
}

host::Ref<QTWrapper::IQTVideoReader> OpenVideo(const std::filesystem::path& path,
                                               ncfUInt32 fourCC) {
    host::Ref<QTWrapper::IQTVideoReader> reader;
    const auto wrapper = OpenWrapper(path);
    if (!wrapper || wrapper->GetQTVideoReader(reader.Out()) != NCF_OK ||
        reader->SetOutputPixelFormat(fourCC, 0, 0) != NCF_OK ||
        reader->InitQT(QTWrapper::kUseDecompressionSession) != NCF_OK) {
        ADD_FAILURE() << "no video reader for " << path;
        reader.Reset();
    }
    return reader;
}

Bytes Picture(QTWrapper::IQTVideoReader& reader, ncfUInt64 number, NCFRESULT* result) {
    // What lies behind the picture must stay as it is.
    const ncfUInt32 size = reader.GetFrameBufferSize(0xFFFFFFFF, number, 0);
    constexpr std::uint8_t kMark = 0xA5;
    Bytes bytes(std::size_t{size} + 64, kMark);
    const NCFRESULT read = reader.ReadFrame(number, bytes.data(), 0, 0, 0);
    for (std::size_t i = size; i < bytes.size(); ++i) {
        EXPECT_EQ(bytes[i], kMark) << "written behind the picture";
    }
    if (result) {
        *result = read;
    }
    bytes.resize(read == NCF_OK ? size : 0);
    return bytes;
}

Bytes AllPictures(QTWrapper::IQTVideoReader& reader, ncfUInt64* count) {
    Bytes all;
    ncfUInt64 number = 0;
    for (;; ++number) {
        NCFRESULT result = NCF_OK;
        const Bytes one = Picture(reader, number, &result);
        if (result != NCF_OK) {
            EXPECT_EQ(result, NMA_E_NODATA) << number;
            break;
        }
        all.insert(all.end(), one.begin(), one.end());
    }
    if (count) {
        *count = number;
    }
    return all;
}

double Psnr(const Bytes& a, const Bytes& b) {
    if (a.size() != b.size() || a.empty()) {
        return 0.0;
    }
    double sum = 0.0;
    for (std::size_t i = 0; i < a.size(); ++i) {
        const double difference = static_cast<double>(a[i]) - b[i];
        sum += difference * difference;
    }
    return sum == 0.0 ? std::numeric_limits<double>::infinity()
                      : 10.0 * std::log10(255.0 * 255.0 * static_cast<double>(a.size()) / sum);
}

}  // namespace quicktime_tests
