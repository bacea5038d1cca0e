// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <filesystem>
#include <optional>
#include <string>
#include <unordered_map>
#include <vector>

#include "reference_host/cliphost/Digest.h"
#include "reference_host/system/FileState.h"
#include "reference_host/system/OutputStream.h"

namespace cliphost {

class Session;

// What an output depends on but its movie: versions, and the options that the child processes of a
// verb are given. Two calls with the same text make the same of a movie.
std::string SettingsText(const Session& session, const std::vector<std::string>& arguments);

// Which movies have their outputs in a folder. In its folder .cliphost-done every run writes a file
// of its own, a line for each output, and reads those of all runs before: so runs on several
// machines need no lock, and one that is ended in the midst of a line spoils that line alone.
// A line counts while movie and output are those that it tells of.
class DoneMovies {
public:
    static constexpr char kFolder[] = ".cliphost-done";

    DoneMovies(std::filesystem::path outFolder, std::string settings)
        : outFolder_(std::move(outFolder)), settings_(std::move(settings)) {}

    // Reads what was written before. The files that can't be read.
    std::vector<std::filesystem::path> Load();

    bool Has(const std::filesystem::path& movie, const host::system::FileState& state,
             const std::filesystem::path& output) const;

    // The names of a movie's outputs, whatever their settings. What several movies had in turn
    // is the last one's.
    std::vector<std::filesystem::path> OutputsOf(const std::filesystem::path& movie) const;
    // Whether an output of that name was written down and is there.
    bool Keeps(const std::filesystem::path& output) const;

    // How an output is known again: where its date is not that of the line, as in a copy of the
    // folder, by its content.
    enum class Known { ByDate, ByContent };
    // Adds a movie whose output lies in the folder. Throws a Failure.
    void Add(const std::filesystem::path& movie, const host::system::FileState& state,
             const std::filesystem::path& output, Known known);

private:
    struct Output {
        host::system::FileState movie;
        host::system::FileState state;
        std::string digest;  // may be empty
    };

    std::string KeyOf(const std::string& movie, const std::string& output) const;
    void LoadLine(const std::string& line);
    void NoteOwner(const std::string& movie, const std::string& output, std::int64_t date);
    void Begin();

    std::filesystem::path outFolder_;
    std::string settings_;
    std::unordered_multimap<std::string, Output> outputs_;  // by a digest of both paths
    // Names are in the form of the lines, and of a movie's path there is a digest.
    struct Owner {
        std::int64_t date = 0;  // of the output
        std::string movie;
        std::string output;
    };
    std::unordered_map<std::string, Owner> owners_;  // by the name key of the output
    std::unordered_multimap<std::string, std::string> outputsByOwner_;
    std::filesystem::path written_;
    host::system::OutputStream stream_;
};

}  // namespace cliphost
