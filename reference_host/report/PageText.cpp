// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/report/PageText.h"

#include <algorithm>
#include <array>
#include <charconv>

namespace report {
namespace {

constexpr char kDigits[] = "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789+/";

struct Replacement {
    std::string_view from;
    std::string_view to;
};

template <std::size_t count>
std::string Replaced(std::string_view text, const Replacement (&replacements)[count]) {
    std::string firsts;
    for (const Replacement& one : replacements) {
        firsts += one.from.front();
    }
    std::string out;
    out.reserve(text.size());
    for (std::size_t at = 0; at < text.size();) {
        const std::size_t next = std::min(text.find_first_of(firsts, at), text.size());
        out += text.substr(at, next - at);
        at = next;
        const auto* const found = std::find_if(
            std::begin(replacements), std::end(replacements),
            [&](const Replacement& one) { return text.substr(at, one.from.size()) == one.from; });
        if (found != std::end(replacements)) {
            out += found->to;
            at += found->from.size();
        } else if (at < text.size()) {
            out += text[at++];  // begins as one of them
        }
    }
    return out;
}

}  // namespace

std::string Base64(const unsigned char* bytes, std::size_t size) {
    std::string text;
    text.reserve((size + 2) / 3 * 4);
    for (std::size_t at = 0; at < size; at += 3) {
        const std::size_t count = std::min<std::size_t>(3, size - at);
        unsigned three = 0;
        for (std::size_t i = 0; i < 3; ++i) {
            three = three << 8 | (i < count ? bytes[at + i] : 0u);
        }
        for (std::size_t i = 0; i < 4; ++i) {
            text += i <= count ? kDigits[three >> (18 - 6 * i) & 63] : '=';
        }
    }
    return text;
}

std::string FromBase64(std::string_view text) {
    std::string bytes;
    if (!IsBase64(text)) {
        return bytes;
    }
    const std::string_view digits(kDigits);
    for (std::size_t at = 0; at < text.size(); at += 4) {
        std::size_t three = 0;
        std::size_t count = 0;
        for (const char digit : text.substr(at, 4)) {
            three = three << 6 | (digit == '=' ? 0 : digits.find(digit));
            count += digit == '=' ? 0 : 1;
        }
        for (std::size_t i = 0; i + 1 < count; ++i) {
            bytes += static_cast<char>(three >> (16 - 8 * i) & 255);
        }
    }
    return bytes;
}

bool IsBase64(std::string_view text) {
    const std::size_t end = std::min(text.find_first_not_of(kDigits), text.size());
    const std::string_view rest = text.substr(end);
    return text.size() % 4 == 0 && (rest.empty() || rest == "=" || rest == "==");
}

std::string InHtml(std::string_view text) {
    static constexpr Replacement kMarks[] = {
        {"&", "&amp;"}, {"<", "&lt;"}, {">", "&gt;"}, {"\"", "&quot;"}, {"'", "&#39;"}};
    return Replaced(text, kMarks);
}

std::string InScript(std::string_view json) {
    static constexpr Replacement kMarks[] = {{"<", "\\u003c"},
                                             {">", "\\u003e"},
                                             {"&", "\\u0026"},
                                             {"\xE2\x80\xA8", "\\u2028"},
                                             {"\xE2\x80\xA9", "\\u2029"}};
    return Replaced(json, kMarks);
}

std::string HashSource(std::string_view digest) {
    std::array<unsigned char, 32> bytes{};
    for (std::size_t i = 0; i < bytes.size(); ++i) {
        const char* const digits = digest.substr(2 * i, 2).data();
        std::from_chars(digits, digits + 2, bytes[i], 16);
    }
    return "'sha256-" + Base64(bytes.data(), bytes.size()) + "'";
}

}  // namespace report
