// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/cliphost/ParameterFile.h"

#include <fmt/format.h>

#include <fstream>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/Words.h"
#include "reference_host/parameters/ParameterDocument.h"
#include "text/Encodings.h"

namespace cliphost {
namespace {

[[noreturn]] void Refuse(const std::filesystem::path& file, const std::string& what,
                         const std::string& hint = {}) {
    throw Failure(kExitCaller, file, what, hint);
}

std::string ReadBytes(const std::filesystem::path& file) {
    std::error_code error;
    if (!std::filesystem::is_regular_file(file, error)) {
        Refuse(file, std::filesystem::exists(file, error) ? "not a file" : "there is no such file");
    }
    if (std::filesystem::file_size(file, error) > 2 * host::ParameterLimits::kLargestDocument) {
        Refuse(file, "too large for a parameter document");
    }
    std::ifstream stream(file, std::ios::binary);
    std::string bytes((std::istreambuf_iterator<char>(stream)), std::istreambuf_iterator<char>());
    if (!stream) {
        Refuse(file, "can't be read");
    }
    return bytes;
}

bool StartsWith(const std::string& text, const char* start) {
    return text.rfind(start, 0) == 0;
}

std::string FromWideBytes(const std::filesystem::path& file, const std::string& bytes, bool big) {
    std::u16string units;
    for (std::size_t i = 2; i + 1 < bytes.size(); i += 2) {
        const auto first = static_cast<unsigned char>(bytes[i]);
        const auto second = static_cast<unsigned char>(bytes[i + 1]);
        units.push_back(static_cast<char16_t>(big ? first << 8 | second : second << 8 | first));
    }
    std::string text;
    // Surrogates that carry bytes of file names would come out as those bytes.
    const std::u32string characters = encodings::FromUtf16(units);
    const bool isWhole = bytes.size() % 2 == 0 && !encodings::HoldsSurrogate(characters);
    if (!isWhole || !encodings::ToUtf8(characters, text)) {
        Refuse(file, "begins as UTF-16 and goes on as something else");
    }
    return text;
}

// The encoding that an XML declaration claims, in small letters; empty without.
std::string ClaimedEncoding(const std::string& text) {
    const std::string head = text.substr(0, text.find("?>"));
    const std::size_t word = head.find("encoding");
    if (!StartsWith(head, "<?xml") || head.size() > 200 || word == std::string::npos) {
        return {};
    }
    const std::size_t open = head.find_first_of("\"'", word);
    const std::size_t close = open == std::string::npos ? open : head.find(head[open], open + 1);
    if (close == std::string::npos) {
        return {};
    }
    return InSmallLetters(head.substr(open + 1, close - open - 1));
}

}  // namespace

std::string ReadParameterFile(const std::filesystem::path& file) {
    std::string bytes = ReadBytes(file);
    if (StartsWith(bytes, "\xFF\xFE") || StartsWith(bytes, "\xFE\xFF")) {
        return FromWideBytes(file, bytes, bytes[0] == '\xFE');
    }
    if (StartsWith(bytes, "\xEF\xBB\xBF")) {
        bytes.erase(0, 3);
    }
    const std::string claimed = ClaimedEncoding(bytes);
    if (!claimed.empty() && claimed != "utf-8" && claimed != "us-ascii") {
        Refuse(file, fmt::format("claims the encoding {}", claimed), "save it as UTF-8");
    }
    return bytes;
}

}  // namespace cliphost
