// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/StoredNames.h"

#include <algorithm>

#include "text/Encodings.h"

namespace aaf::stored {

namespace {

constexpr std::size_t kSingleSize = 32;
constexpr std::size_t kCollectionSize = 22;  // leaves room for " index" and "{ffffffff}"

std::u16string Hexadecimal(std::uint32_t value) {
    std::u16string digits;
    do {
        digits.insert(digits.begin(), u"0123456789abcdef"[value & 15]);
        value >>= 4;
    } while (value != 0);
    return digits;
}

std::u16string Squeeze(const std::u16string& name, std::uint16_t pid, std::size_t size) {
    const std::u16string digits = Hexadecimal(pid);
    const std::size_t room = size - digits.size() - 2;
    if (name.size() <= room) {
        return name + u'-' + digits;
    }
    const std::size_t head = room / 2;
    const std::size_t tail = room - head - 1;
    return name.substr(0, head) + u'-' + name.substr(name.size() - tail) + u'-' + digits;
}

}  // namespace

std::u16string SingleName(const std::u16string& property, std::uint16_t pid) {
    return Squeeze(property, pid, kSingleSize);
}

std::u16string CollectionName(const std::u16string& property, std::uint16_t pid) {
    return Squeeze(property, pid, kCollectionSize);
}

std::u16string IndexName(const std::u16string& collection) {
    return collection + u" index";
}

std::u16string ElementName(const std::u16string& collection, std::uint32_t localKey) {
    std::u16string name;
    name.reserve(collection.size() + 10);
    return name.append(collection).append(1, u'{').append(Hexadecimal(localKey)).append(1, u'}');
}

std::u16string PropertyPart(const std::u16string& storedName, std::uint16_t pid) {
    const std::u16string ending = u'-' + Hexadecimal(pid);
    if (storedName.size() <= ending.size() ||
        storedName.compare(storedName.size() - ending.size(), ending.size(), ending) != 0) {
        return storedName;
    }
    return storedName.substr(0, storedName.size() - ending.size());
}

std::string PropertyText(std::uint16_t pid) {
    const std::u16string digits = Hexadecimal(pid);
    return "property " + std::string(4 - digits.size(), '0') + ToUtf8(digits);
}

std::string ToUtf8(const std::u16string& text) {
    std::u32string points = encodings::FromUtf16(text);
    std::replace_if(points.begin(), points.end(), encodings::IsSurrogate, U'?');
    return encodings::ToUtf8Lossy(points);
}

}  // namespace aaf::stored
