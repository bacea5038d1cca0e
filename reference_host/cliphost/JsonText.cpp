// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/JsonText.h"

#include <algorithm>
#include <array>
#include <cstdint>
#include <cstring>
#include <nlohmann/json.hpp>

#include "text/Encodings.h"

namespace cliphost {
namespace {

constexpr std::size_t kMostOpen = 1024;  // objects and lists in one another

// The characters of ASCII that stand in JSON for themselves.
constexpr auto kPlain = [] {
    std::array<bool, 256> plain{};
    for (unsigned char c = ' '; c <= '~'; ++c) {
        plain[c] = c != '"' && c != '\\';
    }
    return plain;
}();
bool IsPlain(char c) {
    return kPlain[static_cast<unsigned char>(c)];
}

// Whether eight characters are plain. A character that is not leaves the highest bit of its byte,
// or of one above it.
bool ArePlain(const char* eight) {
    constexpr std::uint64_t kEach = 0x0101010101010101;
    std::uint64_t all = 0;
    std::memcpy(&all, eight, sizeof all);
    const std::uint64_t marks = all | (all - kEach * ' ') | (all + kEach) |
                                ((all ^ kEach * '"') - kEach) | ((all ^ kEach * '\\') - kEach);
    return (marks & kEach * 0x80) == 0;
}

// The first character that is not plain, or the end.
const char* EndOfPlain(const char* at, const char* end) {
    while (end - at >= 8 && ArePlain(at)) {
        at += 8;
    }
    return std::find_if_not(at, end, IsPlain);
}

// Goes through a text from its start to its end.
class Checker {
public:
    explicit Checker(std::string_view json) : at_(json.data()), end_(at_ + json.size()) {}

    bool Run() {
        // For each object and list that is open, what closes it.
        std::string open;
        do {
            if (!TakeValue(open)) {
                return false;
            }
            while (!open.empty() && Next() == open.back()) {
                ++at_;
                open.pop_back();
            }
            if (!open.empty() && !Take(',')) {
                return false;
            }
        } while (!open.empty());
        Next();
        return at_ == end_;
    }

private:
    // The next character that is no space; 0 at the end.
    char Next() {
        while (at_ != end_ && (*at_ == ' ' || *at_ == '\n' || *at_ == '\t' || *at_ == '\r')) {
            ++at_;
        }
        return at_ == end_ ? '\0' : *at_;
    }

    bool Take(char wanted) {
        const bool isThere = Next() == wanted && at_ != end_;
        at_ += isThere;
        return isThere;
    }

    // One value of what is open, with its name in an object; an object or a list is opened,
    // together with all that begin as its first value.
    bool TakeValue(std::string& open) {
        for (;;) {
            if (!open.empty() && open.back() == '}' && !(TakeText() && Take(':'))) {
                return false;
            }
            const char first = Next();
            if (first == '"') {
                return TakeText();
            }
            if ((first != '{' && first != '[') || open.size() == kMostOpen) {
                return false;
            }
            ++at_;
            open += first == '{' ? '}' : ']';
            if (Next() == open.back()) {
                return true;
            }
        }
    }

    bool TakeText() {
        if (!Take('"')) {
            return false;
        }
        const char* const start = at_;
        bool isAscii = true;
        for (at_ = EndOfPlain(at_, end_); at_ != end_ && *at_ != '"';
             at_ = EndOfPlain(at_ + 1, end_)) {
            if (*at_ == '\\' && !TakeEscaped()) {
                return false;
            }
            const auto byte = static_cast<unsigned char>(*at_);
            if (byte < ' ') {
                return false;
            }
            isAscii = isAscii && byte < 0x80;
        }
        const std::string_view text(start, static_cast<std::size_t>(at_ - start));
        return (isAscii || !encodings::HoldsSurrogate(encodings::FromUtf8(text))) && Take('"');
    }

    // Goes to the last character of what a backslash begins.
    bool TakeEscaped() {
        constexpr std::string_view kShort = "\"\\/bfnrt";
        constexpr std::string_view kDigits = "0123456789abcdefABCDEF";
        const std::string_view rest(at_, static_cast<std::size_t>(end_ - at_));
        if (rest.size() > 1 && kShort.find(rest[1]) != std::string_view::npos) {
            at_ += 1;
            return true;
        }
        // Of numbers only those below U+0100, as control characters have.
        if (rest.size() <= 5 || rest.substr(1, 3) != "u00" ||
            rest.substr(4, 2).find_first_not_of(kDigits) != std::string_view::npos) {
            return false;
        }
        at_ += 5;
        return true;
    }

    const char* at_;
    const char* end_;
};

}  // namespace

void AppendJsonText(std::string_view text, std::string& json) {
    const std::size_t before = json.size();
    json += '"';
    const char* const end = text.data() + text.size();
    for (const char* at = text.data(); at != end;) {
        const char* const special = EndOfPlain(at, end);
        json.append(at, static_cast<std::size_t>(special - at));
        at = special;
        if (at != end) {
            if (*at != '"' && *at != '\\') {  // controls, and what may be no text at all
                json.resize(before);
                json += nlohmann::json(text).dump(-1, ' ', false,
                                                  nlohmann::json::error_handler_t::replace);
                return;
            }
            json += '\\';
            json += *at++;
        }
    }
    json += '"';
}

bool IsJsonOfTexts(std::string_view json) {
    return Checker(json).Run();
}

}  // namespace cliphost
