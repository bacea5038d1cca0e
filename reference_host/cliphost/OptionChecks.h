// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <CLI/CLI.hpp>
#include <filesystem>
#include <vector>

namespace cliphost {

// Checks of option values, with sentences that a user can act on.

// A whole number from `least` on that the option's number can hold.
CLI::Validator WholeNumber(std::uint64_t least = 0,
                           std::uint64_t most = std::numeric_limits<std::uint64_t>::max());
// A whole number of 32 bits.
CLI::Validator SmallWholeNumber(std::uint64_t least = 0);
// Frames per second that a movie can have.
CLI::Validator FrameRate();

// No option and no argument means anything by an empty text; it comes from a
// variable of a script that was never set.
void RefuseEmptyTexts(CLI::App& app);

// Every option that takes a text takes a file URL as the path that it names.
void TakeFileUrls(CLI::App& app);

// The parser takes an argument such as [a,b] for a list. These keep it a text: the first marks such
// an argument, or such a value behind an option's name, and the second takes the mark away when the
// option gets it; the third takes it out of what is told.
std::string MarkedText(std::string argument);
void TakeMarkedTexts(CLI::App& app);
std::string WithoutMarks(std::string text);

// Refuses an output that would be written over the movie that it is made from.
// Throws a Failure.
void RefuseOutputOntoMovie(const std::filesystem::path& output, const std::filesystem::path& movie);

// Whether an output would lie where the other file is or is going to be.
bool IsPlaceOf(const std::filesystem::path& output, const std::filesystem::path& file);

// What an output would take the place of, though the call needs both.
struct CallFile {
    const char* what;
    std::filesystem::path file;  // empty: the call names none
};
// Throws a Failure.
void RefuseOutputOnto(const std::filesystem::path& output, const std::vector<CallFile>& files);

}  // namespace cliphost
