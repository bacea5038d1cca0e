// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/Fields.h"

namespace cliphost {

FieldWriter& FieldWriter::Add(std::string_view text) {
    Add(std::uint64_t{text.size()});
    bytes_ += text;
    return *this;
}

FieldWriter& FieldWriter::Add(std::uint64_t number) {
    for (std::size_t i = 0; i < kLengthSize; ++i) {
        bytes_ += static_cast<char>(number >> (8 * i));
    }
    return *this;
}

std::string FieldWriter::Message() const {
    FieldWriter length;
    length.Add(std::uint64_t{bytes_.size()});
    return length.bytes_ + bytes_;
}

std::string_view FieldReader::Take(std::uint64_t size) {
    if (isBroken_ || size > rest_.size()) {
        isBroken_ = true;
        return {};
    }
    const std::string_view taken = rest_.substr(0, size);
    rest_.remove_prefix(size);
    return taken;
}

std::string FieldReader::Text() {
    return std::string(Take(Number()));
}

std::uint64_t FieldReader::Number() {
    const std::string_view bytes = Take(kLengthSize);
    return bytes.empty() ? 0 : LengthIn(bytes);
}

std::uint64_t LengthIn(std::string_view bytes) {
    std::uint64_t length = 0;
    for (std::size_t i = kLengthSize; i-- > 0;) {
        length = length << 8 | static_cast<unsigned char>(bytes[i]);
    }
    return length;
}

std::optional<std::string> MessageStream::Next() {
    if (arrived_.size() < kLengthSize || IsBroken()) {
        return std::nullopt;
    }
    const std::uint64_t length = LengthIn(arrived_);
    if (arrived_.size() - kLengthSize < length) {
        return std::nullopt;
    }
    std::string message = arrived_.substr(kLengthSize, length);
    arrived_.erase(0, kLengthSize + length);
    return message;
}

bool MessageStream::IsBroken() const {
    return arrived_.size() >= kLengthSize && LengthIn(arrived_) > kLongestMessage;
}

}  // namespace cliphost
