// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <filesystem>
#include <string>
#include <vector>

#include "host_interfaces/quicktime/QuickTimeWrapper.h"
#include "reference_host/header_parser/ByteReader.h"
#include "reference_host/util/Ref.h"
#include "tests/support/TestFolder.h"

namespace quicktime_tests {

using Bytes = std::vector<std::uint8_t>;

// A file of its own that lives as long as this object. It is made by the
// ffmpeg command with `arguments`, and ends in `ending`.
class MadeMovie {
public:
    explicit MadeMovie(const std::string& arguments, const std::string& ending = ".mov");
    MadeMovie(const Bytes& content, const std::string& ending);

    const std::filesystem::path& Path() const { return path_; }
    // The path as one word of a command.
    std::string Quoted() const;
    Bytes Content() const;
    // What the ffmpeg command gives for the file with `arguments` between the
    // file and the output, which is raw, and `before` in front of the file.
    Bytes Decoded(const std::string& arguments, const std::string& before = "") const;
    // Lines that ffprobe prints, such as those of packets.
    std::vector<std::string> Probed(const std::string& arguments) const;

private:
    TestFolder folder_;
    std::filesystem::path path_;
};

// The wrapper with a file open; null when it refused.
host::Ref<QTWrapper::IQuickTimeWrapper> OpenWrapper(const std::filesystem::path& path);

// The video reader of a file, started, in a pixel format.
host::Ref<QTWrapper::IQTVideoReader> OpenVideo(const std::filesystem::path& path, ncfUInt32 fourCC);
// One picture, empty when it failed.
Bytes Picture(QTWrapper::IQTVideoReader& reader, ncfUInt64 number, NCFRESULT* result = nullptr);
// All of them, one behind the other.
Bytes AllPictures(QTWrapper::IQTVideoReader& reader, ncfUInt64* count = nullptr);

// Signal to noise in decibels, of numbers of 8 bits; infinite when equal.
double Psnr(const Bytes& a, const Bytes& b);

using header_parser::Code;

}  // namespace quicktime_tests
