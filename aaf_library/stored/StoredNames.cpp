// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/StoredNames.h"

namespace aaf::stored {

namespace {

constexpr std::size_t kSingleSize = 32;
constexpr std::size_t kCollectionSize = 22;  // leaves room for " index" and "{ffffffff}"

std::u16string hexadecimal(std::uint32_t value) {
    std::u16string digits;
    do {
        digits.insert(digits.begin(), u"0123456789abcdef"[value & 15]);
        value >>= 4;
    } while (value != 0);
    return digits;
}

std::u16string squeeze(const std::u16string& name, std::uint16_t pid, std::size_t size) {
    const std::u16string digits = hexadecimal(pid);
    const std::size_t room = size - digits.size() - 2;
    if (name.size() <= room) {
        return name + u'-' + digits;
    }
    const std::size_t head = room / 2;
    const std::size_t tail = room - head - 1;
    return name.substr(0, head) + u'-' + name.substr(name.size() - tail) + u'-' + digits;
}

void AppendUtf8(std::string& out, std::uint32_t point) {
    if (point < 0x80) {
        out += static_cast<char>(point);
    } else if (point < 0x800) {
        out += static_cast<char>(0xC0 | point >> 6);
        out += static_cast<char>(0x80 | (point & 0x3F));
    } else if (point < 0x10000) {
        out += static_cast<char>(0xE0 | point >> 12);
        out += static_cast<char>(0x80 | (point >> 6 & 0x3F));
        out += static_cast<char>(0x80 | (point & 0x3F));
    } else {
        out += static_cast<char>(0xF0 | point >> 18);
        out += static_cast<char>(0x80 | (point >> 12 & 0x3F));
        out += static_cast<char>(0x80 | (point >> 6 & 0x3F));
        out += static_cast<char>(0x80 | (point & 0x3F));
    }
}

bool IsHighHalf(char16_t unit) {
    return unit >= 0xD800 && unit < 0xDC00;
}

bool IsLowHalf(char16_t unit) {
    return unit >= 0xDC00 && unit < 0xE000;
}

}  // namespace

std::u16string SingleName(const std::u16string& property, std::uint16_t pid) {
    return squeeze(property, pid, kSingleSize);
}

std::u16string CollectionName(const std::u16string& property, std::uint16_t pid) {
    return squeeze(property, pid, kCollectionSize);
}

std::u16string IndexName(const std::u16string& collection) {
    return collection + u" index";
}

std::u16string ElementName(const std::u16string& collection, std::uint32_t localKey) {
    return collection + u'{' + hexadecimal(localKey) + u'}';
}

std::u16string PropertyPart(const std::u16string& storedName, std::uint16_t pid) {
    const std::u16string ending = u'-' + hexadecimal(pid);
    if (storedName.size() <= ending.size() ||
        storedName.compare(storedName.size() - ending.size(), ending.size(), ending) != 0) {
        return storedName;
    }
    return storedName.substr(0, storedName.size() - ending.size());
}

std::string PropertyText(std::uint16_t pid) {
    const std::u16string digits = hexadecimal(pid);
    return "property " + std::string(4 - digits.size(), '0') + ToUtf8(digits);
}

std::string ToUtf8(const std::u16string& text) {
    std::string out;
    for (std::size_t i = 0; i < text.size(); ++i) {
        if (IsHighHalf(text[i]) && i + 1 < text.size() && IsLowHalf(text[i + 1])) {
            AppendUtf8(out, 0x10000 + ((text[i] - 0xD800u) << 10) + (text[i + 1] - 0xDC00u));
            ++i;
        } else if (IsHighHalf(text[i]) || IsLowHalf(text[i])) {
            out += '?';
        } else {
            AppendUtf8(out, text[i]);
        }
    }
    return out;
}

}  // namespace aaf::stored
