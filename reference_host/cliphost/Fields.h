// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

namespace cliphost {

// What two processes of the program tell each other: texts and numbers, one behind the
// other, and around a message of them its length. A text may hold any bytes.

class FieldWriter {
public:
    FieldWriter& Add(std::string_view text);
    FieldWriter& Add(std::uint64_t number);
    const std::string& bytes() const { return bytes_; }
    // With the length before it.
    std::string Message() const;

private:
    std::string bytes_;
};

// The other way. What comes out of a process that has met a movie may be anything.
class FieldReader {
public:
    explicit FieldReader(std::string_view bytes) : rest_(bytes) {}
    std::string Text();
    std::uint64_t Number();
    // Whether all was there, and nothing else.
    bool IsWhole() const { return !isBroken_ && rest_.empty(); }

private:
    std::string_view Take(std::uint64_t size);

    std::string_view rest_;
    bool isBroken_ = false;
};

inline constexpr std::size_t kLengthSize = 8;
// No answer is longer.
inline constexpr std::uint64_t kLongestMessage = std::uint64_t{256} << 20;

std::uint64_t LengthIn(std::string_view bytes);  // of kLengthSize of them

// Takes messages out of bytes that arrive in pieces.
class MessageStream {
public:
    std::string& arrived() { return arrived_; }
    // The next one that is whole.
    std::optional<std::string> Next();
    // Whether the one that begins says that it is longer than any is.
    bool IsBroken() const;

private:
    std::string arrived_;
};

}  // namespace cliphost
