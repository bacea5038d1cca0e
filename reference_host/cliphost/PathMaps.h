// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace cliphost {

// A folder as a file URL names it.
struct UrlPlace {
    std::string machine;  // empty: the one that reads the URL
    std::string path;     // without the slash at its end, so that of the root is empty

    // Drives and other machines' shares: there, letters' case does not count.
    bool IgnoresCase() const;
};

// The file that a URL names, with the machine taken from its path where it stands there; false for
// what is no URL of a file.
bool ReadFileUrl(std::string_view url, UrlPlace& place);

// The same folders as this machine and another one see them.
class PathMaps {
public:
    static constexpr std::size_t kMost = 64;

    // Adds FROM=TO; the first "=" parts them. Each is an absolute path, a drive (M:), a share
    // (//server/share, with either slash) or a file URL; FROM may be relative to the working
    // folder. Throws a Failure that says what is wrong.
    void Add(std::string_view rule);

    bool IsEmpty() const { return rules_.empty(); }
    // Which rules were used, a bit each, by their order.
    std::uint64_t used() const { return used_; }
    void AddUsed(std::uint64_t used) { used_ |= used; }
    // The rules, as they were given, that nothing was mapped by.
    std::vector<std::string> Unused() const;

    // The URL by which the other machine finds a file. Of several rules the one with the longest
    // FROM is taken. False, with `url` unchanged, where none fits.
    bool MapToOther(std::string& url);
    // Turned round: the URL by which this machine finds it, by the longest TO.
    bool MapToThis(std::string& url);

private:
    struct Rule {
        std::string text;
        UrlPlace here;
        UrlPlace there;
    };
    bool Map(std::string& url, UrlPlace Rule::*from, UrlPlace Rule::*to);

    std::vector<Rule> rules_;
    std::uint64_t used_ = 0;
};

}  // namespace cliphost
