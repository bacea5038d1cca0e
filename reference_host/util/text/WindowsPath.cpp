// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/util/text/WindowsPath.h"

#include <algorithm>

#include "reference_host/util/text/FileUrl.h"
#include "text/Encodings.h"

namespace host::text {
namespace {

constexpr std::string_view kVerbatim = R"(\\?\)";
constexpr std::string_view kVerbatimShare = R"(\\?\UNC\)";
constexpr std::string_view kDevices = R"(\\.\)";
constexpr std::size_t kLongestName = 255;  // in UTF-16

// In every folder, with any ending, and in capitals or not.
constexpr std::string_view kDeviceNames[] = {
    "CON",  "PRN",  "AUX",  "NUL",  "CONIN$", "CONOUT$", "COM1", "COM2", "COM3", "COM4",
    "COM5", "COM6", "COM7", "COM8", "COM9",   "COM¹",    "COM²", "COM³", "LPT1", "LPT2",
    "LPT3", "LPT4", "LPT5", "LPT6", "LPT7",   "LPT8",    "LPT9", "LPT¹", "LPT²", "LPT³",
};

bool IsSlash(char c) {
    return c == '\\' || c == '/';
}

bool IsLetter(char c) {
    return (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z');
}

bool BeginsWithDrive(std::string_view path) {
    return path.size() >= 2 && IsLetter(path[0]) && path[1] == ':';
}

std::string InCapitals(std::string_view text) {
    std::string capitals(text);
    for (char& c : capitals) {
        c = c >= 'a' && c <= 'z' ? static_cast<char>(c - 'a' + 'A') : c;
    }
    return capitals;
}

bool BeginsWith(std::string_view path, std::string_view start) {
    return path.size() >= start.size() &&
           std::equal(start.begin(), start.end(), path.begin(), [](char s, char p) {
               return s == p || (s == '\\' && p == '/') || InCapitals({&p, 1})[0] == s;
           });
}

std::size_t LengthInUtf16(std::string_view name) {
    const std::u32string characters = encodings::FromUtf8(name);
    return characters.size() +
           static_cast<std::size_t>(std::count_if(characters.begin(), characters.end(),
                                                  [](char32_t c) { return c > 0xFFFF; }));
}

bool IsDevice(std::string_view name) {
    std::string_view stem = name.substr(0, name.find_first_of(".:"));
    stem = stem.substr(0, stem.find_last_not_of(' ') + 1);
    return std::find(std::begin(kDeviceNames), std::end(kDeviceNames), InCapitals(stem)) !=
           std::end(kDeviceNames);
}

std::string ProblemOf(std::string_view name) {
    const std::string quoted = '\'' + std::string(name) + '\'';
    const auto isForbidden = [](char c) {
        return (c >= 0 && c < ' ') ||
               std::string_view("<>\"|?*:").find(c) != std::string_view::npos;
    };
    if (name == "." || name == "..") {
        return {};
    }
    if (IsDevice(name)) {
        return quoted + " is the name of a device, in every folder and with any ending";
    }
    if (const auto bad = std::find_if(name.begin(), name.end(), isForbidden); bad != name.end()) {
        return quoted +
               (*bad < ' ' ? std::string(" has a control character in it")
                           : std::string(" has ") + *bad + " in it") +
               ", which no name can have";
    }
    if (name.back() == '.' || name.back() == ' ') {
        return quoted + " ends with a " + (name.back() == '.' ? "dot" : "space") +
               ", which the system leaves out";
    }
    if (LengthInUtf16(name) > kLongestName) {
        return quoted + " is longer than a name can be, which is 255 characters";
    }
    return {};
}

}  // namespace

std::string WindowsPathProblem(std::string_view path) {
    if (BeginsWith(path, kDevices)) {
        return "it names a device";
    }
    const std::string plain = WithoutVerbatimStart(path);
    if (BeginsWith(plain, kVerbatim)) {
        return R"(behind \\?\ stands neither a drive nor a share)";
    }
    std::string_view rest = plain;
    rest.remove_prefix(BeginsWithDrive(rest) ? 2 : 0);
    while (!rest.empty()) {
        const auto end = static_cast<std::size_t>(std::find_if(rest.begin(), rest.end(), IsSlash) -
                                                  rest.begin());
        if (std::string problem = end == 0 ? "" : ProblemOf(rest.substr(0, end));
            !problem.empty()) {
            return problem;
        }
        rest.remove_prefix(std::min(end + 1, rest.size()));
    }
    return {};
}

std::string WithoutVerbatimStart(std::string_view path) {
    if (BeginsWith(path, kVerbatimShare)) {
        return R"(\\)" + std::string(path.substr(kVerbatimShare.size()));
    }
    const bool isVerbatim =
        BeginsWith(path, kVerbatim) && BeginsWithDrive(path.substr(kVerbatim.size()));
    return std::string(path.substr(isVerbatim ? kVerbatim.size() : 0));
}

std::string UrlOfWindowsPath(std::string_view path) {
    std::string plain = WithoutVerbatimStart(path);
    std::replace(plain.begin(), plain.end(), '\\', '/');
    std::string_view rest = plain;
    std::string url = "file://";
    if (BeginsWithDrive(rest)) {
        url += '/' + std::string(rest.substr(0, 2));  // the colon of a drive stands as it is
        rest.remove_prefix(2);
    } else if (BeginsWith(rest, R"(\\)")) {
        rest.remove_prefix(2);
    }
    return url + PercentEncoded(rest);
}

bool WindowsPathOfUrl(std::string_view url, std::string& path) {
    std::string machine;
    std::string rooted;
    return SplitFileUrl(url, machine, rooted) &&
           WindowsPathOfPlace(machine, std::move(rooted), path);
}

bool WindowsPathOfPlace(const std::string& machine, std::string rooted, std::string& path) {
    if (!machine.empty()) {
        rooted = "//" + machine + rooted;
    } else if (BeginsWithDrive(std::string_view(rooted).substr(1))) {
        rooted.erase(0, 1);
    } else if (rooted.compare(0, 2, "//") != 0) {
        return false;
    }
    std::replace(rooted.begin(), rooted.end(), '/', '\\');
    path = std::move(rooted);
    return true;
}

}  // namespace host::text
