// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/util/text/FileUrl.h"

#include <algorithm>

namespace host::text {

namespace {

constexpr std::string_view kScheme = "file://";
constexpr std::string_view kThisMachine = "localhost";
// A slash in its name, encoded, would make it a folder where it is written as a path.
constexpr std::string_view kNotOfMachine("/\0", 2);
constexpr char kDigits[] = "0123456789ABCDEF";

bool IsUnreserved(unsigned char byte) {
    return (byte >= 'A' && byte <= 'Z') || (byte >= 'a' && byte <= 'z') ||
           (byte >= '0' && byte <= '9') || byte == '-' || byte == '.' || byte == '_' || byte == '~';
}

int DigitValue(char c) {
    if (c >= '0' && c <= '9') {
        return c - '0';
    }
    const char upper = static_cast<char>(c & ~0x20);
    return upper >= 'A' && upper <= 'F' ? upper - 'A' + 10 : -1;
}

// Names of machines are the same in capitals.
bool IsThisMachine(std::string_view name) {
    return std::equal(name.begin(), name.end(), kThisMachine.begin(), kThisMachine.end(),
                      [](char c, char small) {
                          return c == small || (c >= 'A' && c <= 'Z' && (c | 0x20) == small);
                      });
}

}  // namespace

std::string PercentEncoded(std::string_view bytes) {
    std::string out;
    for (const char byte : bytes) {
        const auto value = static_cast<unsigned char>(byte);
        if (IsUnreserved(value) || byte == '/') {
            out.push_back(byte);
        } else {
            out += {'%', kDigits[value >> 4], kDigits[value & 15]};
        }
    }
    return out;
}

bool PercentDecoded(std::string_view text, std::string& bytes) {
    std::string out;
    for (std::size_t i = 0; i < text.size(); ++i) {
        if (text[i] != '%') {
            out.push_back(text[i]);
            continue;
        }
        const int high = i + 2 < text.size() ? DigitValue(text[i + 1]) : -1;
        const int low = high < 0 ? -1 : DigitValue(text[i + 2]);
        if (low < 0) {
            return false;
        }
        out.push_back(static_cast<char>(high << 4 | low));
        i += 2;
    }
    bytes = std::move(out);
    return true;
}

std::string FileUrl(std::string_view path) {
    return std::string(kScheme) + PercentEncoded(path);
}

bool IsFileUrl(std::string_view text) {
    return text.substr(0, kScheme.size()) == kScheme;
}

bool SplitFileUrl(std::string_view url, std::string& machine, std::string& path) {
    if (!IsFileUrl(url)) {
        return false;
    }
    url.remove_prefix(kScheme.size());
    const std::size_t slash = url.find('/');
    std::string ofMachine;
    std::string ofPath;
    if (slash == std::string_view::npos || !PercentDecoded(url.substr(0, slash), ofMachine) ||
        !PercentDecoded(url.substr(slash), ofPath) ||
        ofMachine.find_first_of(kNotOfMachine) != std::string::npos ||
        ofPath.find('\0') != std::string::npos) {
        return false;
    }
    machine = IsThisMachine(ofMachine) ? std::string() : std::move(ofMachine);
    path = std::move(ofPath);
    return true;
}

bool PathOfFileUrl(std::string_view url, std::string& path) {
    std::string machine;
    std::string decoded;
    if (!SplitFileUrl(url, machine, decoded) || !machine.empty()) {
        return false;
    }
    path = std::move(decoded);
    return true;
}

}  // namespace host::text
