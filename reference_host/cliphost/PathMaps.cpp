// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/PathMaps.h"

#include <fmt/format.h>

#include <algorithm>
#include <filesystem>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/system/Paths.h"
#include "reference_host/util/text/FileUrl.h"

namespace cliphost {

using host::system::GenericPathText;
using host::system::PathOfText;

namespace {

char Lower(char c) {
    return c >= 'A' && c <= 'Z' ? static_cast<char>(c + ('a' - 'A')) : c;
}

bool IsLetter(char c) {
    return Lower(c) >= 'a' && Lower(c) <= 'z';
}

bool IsSame(std::string_view a, std::string_view b, bool ignoresCase) {
    return a.size() == b.size() && std::equal(a.begin(), a.end(), b.begin(), [&](char x, char y) {
               return ignoresCase ? Lower(x) == Lower(y) : x == y;
           });
}

// Whether a path of a URL begins with a drive: /M: and no more, or a slash behind it.
bool BeginsWithDrive(std::string_view path) {
    return path.size() >= 3 && path[0] == '/' && IsLetter(path[1]) && path[2] == ':' &&
           (path.size() == 3 || path[3] == '/');
}

bool HoldsPath(const UrlPlace& folder, const UrlPlace& file) {
    const bool ignoresCase = folder.IgnoresCase();
    const std::string_view path = file.path;
    return IsSame(folder.machine, file.machine, true) && path.size() > folder.path.size() &&
           path[folder.path.size()] == '/' &&
           IsSame(folder.path, path.substr(0, folder.path.size()), ignoresCase);
}

std::string UrlOf(const UrlPlace& place, std::string_view rest) {
    std::string url = "file://" + host::text::PercentEncoded(place.machine);
    std::string_view path = place.path;
    if (BeginsWithDrive(path)) {
        url += path.substr(0, 3);  // the colon of a drive stands as it is
        path.remove_prefix(3);
    }
    return url + host::text::PercentEncoded(path) + host::text::PercentEncoded(rest);
}

// //server/share, as it stands in a path, and in URLs of some programs behind an empty machine.
void TakeMachineFromPath(UrlPlace& place) {
    const std::string path = std::move(place.path);
    const bool isShare = place.machine.empty() && path.size() > 2 && path[0] == '/' &&
                         path[1] == '/' && path[2] != '/';
    const std::size_t end = isShare ? std::min(path.find('/', 2), path.size()) : 0;
    if (isShare) {
        place.machine = path.substr(2, end - 2);
    }
    place.path = path.substr(end);
    place.path = GenericPathText(PathOfText(place.path).lexically_normal());
}

bool ReadPath(std::string text, UrlPlace& place) {
    const bool isDrive = text.size() > 1 && IsLetter(text[0]) && text[1] == ':';
    if (isDrive || text[0] == '\\') {
        std::replace(text.begin(), text.end(), '\\', '/');
    }
    place.path = isDrive ? "/" + text : text;
    if (place.path[0] != '/' || (isDrive && !BeginsWithDrive(place.path))) {
        return false;
    }
    TakeMachineFromPath(place);
    return true;
}

bool ReadPlace(const std::string& text, UrlPlace& place) {
    return host::text::IsFileUrl(text) ? ReadFileUrl(text, place) : ReadPath(text, place);
}

void DropSlashAtEnd(std::string& path) {
    while (!path.empty() && path.back() == '/') {
        path.pop_back();
    }
}

}  // namespace

bool ReadFileUrl(std::string_view url, UrlPlace& place) {
    if (!host::text::SplitFileUrl(url, place.machine, place.path)) {
        return false;
    }
    TakeMachineFromPath(place);
    return true;
}

bool UrlPlace::IgnoresCase() const {
    return !machine.empty() || BeginsWithDrive(path);
}

void PathMaps::Add(std::string_view rule) {
    const auto refuse = [&](const std::string& reason, const char* hint) {
        throw Failure(kExitCaller, PathOfText(fmt::format("--map {}", rule)), reason, hint);
    };
    const std::size_t equals = rule.find('=');
    if (equals == std::string_view::npos || equals == 0 || equals + 1 == rule.size()) {
        refuse("is not FROM=TO", "write it such as /mnt/media=//server/media");
    }
    if (rules_.size() == kMost) {
        refuse(fmt::format("there are {} already", kMost), "map a folder above them");
    }
    Rule added{std::string(rule), {}, {}};
    std::string from(rule.substr(0, equals));
    const std::filesystem::path folder = PathOfText(from);
    const bool isOfThisDrive = folder.has_root_directory() && !folder.is_absolute();
    if (isOfThisDrive || !ReadPlace(from, added.here)) {
        // The module is given paths in this form.
        ReadPath(GenericPathText(AbsolutePath(folder)), added.here);
    }
    if (!ReadPlace(std::string(rule.substr(equals + 1)), added.there)) {
        refuse("TO is no absolute path",
               "write /FOLDER, a drive such as M:, or a share such as //server/share");
    }
    DropSlashAtEnd(added.here.path);
    DropSlashAtEnd(added.there.path);
    rules_.push_back(std::move(added));
}

std::vector<std::string> PathMaps::Unused() const {
    std::vector<std::string> unused;
    for (std::size_t i = 0; i < rules_.size(); ++i) {
        if ((used_ >> i & 1) == 0) {
            unused.push_back(rules_[i].text);
        }
    }
    return unused;
}

bool PathMaps::MapToOther(std::string& url) {
    return Map(url, &Rule::here, &Rule::there);
}

bool PathMaps::MapToThis(std::string& url) {
    return Map(url, &Rule::there, &Rule::here);
}

bool PathMaps::Map(std::string& url, UrlPlace Rule::*from, UrlPlace Rule::*to) {
    UrlPlace file;
    if (!ReadFileUrl(url, file)) {
        return false;
    }
    const Rule* best = nullptr;
    for (const Rule& rule : rules_) {
        const bool isLonger = !best || (rule.*from).path.size() > (best->*from).path.size();
        if (isLonger && HoldsPath(rule.*from, file)) {
            best = &rule;
        }
    }
    if (!best) {
        return false;
    }
    used_ |= std::uint64_t{1} << (best - rules_.data());
    url = UrlOf(best->*to, std::string_view(file.path).substr((best->*from).path.size()));
    return true;
}

}  // namespace cliphost
