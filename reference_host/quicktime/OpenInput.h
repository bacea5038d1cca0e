// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <string>

#include "reference_host/quicktime/AvOwners.h"

namespace host {

// How a file is opened.
enum class InputView {
    AsPresented,  // edit lists applied
    WholeMedia,   // every stored sample in the order in which it is stored
};

// Opens a file of any kind that the multimedia library knows. Null with a
// sentence in `reason` that says what was wrong. Nothing but this one file is
// ever read: lists of other files, picture sequences and the like lead nowhere.
InputOwner OpenInput(const std::filesystem::path& path, InputView view, std::string& reason);

// The same for who wants one stream of it: null, too, where it has none of that
// number.
InputOwner OpenForStream(const std::filesystem::path& path, InputView view, int stream);

// The most channels of all sound tracks of a movie together, the header parser's
// limit too, and the sentence for a movie that has more.
inline constexpr int kMostChannelsOfMovie = 1024;
std::string TooManyChannels();

// Whether the container is of the QuickTime and ISO family.
bool IsMovieFamily(const AVFormatContext& input);

// Whether every packet carries its time. Where only some do, or none, a packet
// reached by a seek can't be told from its neighbours.
bool TellsTimesOfAll(const AVFormatContext& input);

// Reads on for what the headers left open. May be repeated.
void FindStreamDetails(AVFormatContext& input);
bool HasStreamDetails(const AVFormatContext& input);

// Lets the demuxer hand out one stream alone.
void UseOneStream(AVFormatContext& input, int stream);

// The library's words for one of its error numbers.
std::string ErrorText(int error);

}  // namespace host
