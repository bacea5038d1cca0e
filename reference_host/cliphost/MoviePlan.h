// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <filesystem>
#include <memory>
#include <string>
#include <unordered_map>
#include <unordered_set>
#include <vector>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/FolderClips.h"
#include "reference_host/cliphost/InputList.h"
#include "reference_host/cliphost/PathList.h"
#include "reference_host/cliphost/Shard.h"
#include "reference_host/cliphost/Workers.h"

namespace cliphost {

class DoneMovies;

// The names that outputs have, where plans follow each other: a movie that comes again keeps its
// own. Of outputs these are name keys.
struct OutputNames {
    using Name = std::filesystem::path::string_type;
    std::unordered_set<Name> taken;
    std::unordered_map<Name, unsigned> lastNumbers;  // by the name without one
    std::unordered_map<Name, unsigned> byMovie;
};

struct MoviesOptions {
    std::vector<std::filesystem::path> paths;  // movies and folders
    std::filesystem::path list;                // of further ones; empty: none
    ListForm listForm = ListForm::Lines;
    bool isRecursive = false;          // folders within folders, too
    std::vector<std::string> endings;  // of the movies in folders; none: the module's list
    Shard shard;
    std::filesystem::path file;       // for what is made of the only movie
    std::filesystem::path outFolder;  // for what is made of each
    bool skipDone = false;            // leave out what lies there already
    std::filesystem::path together;   // for what is made of all
    WorkerCall workers;               // without `writeNear`
    bool apart = false;               // even a single movie is read by another process
    OutputNames* names = nullptr;     // of the plans before; none: this is the only one

    bool Saves() const { return !file.empty() || !outFolder.empty(); }
};

// One movie of a command line, or what is told in its place.
struct MovieStep {
    std::filesystem::path::string_type movie;        // as in FolderClip
    std::shared_ptr<const FolderClips> folder = {};  // where it is out of a list
    ncfSInt32 index = 0;                             // in that
    std::shared_ptr<const Failure> refusal = {};     // it can't be asked for
    std::shared_ptr<const Problem> notice = {};      // no movie is meant

    bool IsMovie() const { return !refusal && !notice; }
};

// What the command line names, in its order; folders are listed through the module. There may be
// a million movies: of each only its name is kept, and its folder once.
class MoviePlan {
public:
    // Where outputs need the same name in every run and on every machine, each movie has a number
    // in its output's name: the place among all movies of that name, those of other shares too.
    // A movie of `done` keeps its number, and no other has that of an output of `done`; it may be
    // null. `ending` is that of the outputs. Throws a Failure for a list that can't be read.
    MoviePlan(Session& session, const MoviesOptions& options, const char* ending,
              const DoneMovies* done);

    // Steps of other shares are not among them.
    std::size_t size() const { return steps_.size(); }
    MovieStep operator[](std::size_t place) const;
    // Whether an output that ends so may lie where the movie does: the caller named it, or it was
    // found by such an ending. What the module lists is called *.mov.
    bool MayBeOutput(std::size_t place, const char* ending) const;
    // 0: whichever is free.
    unsigned NumberOf(std::size_t place) const { return numbers_.empty() ? 0 : numbers_[place]; }

    // The module's lists end; what they said stays.
    void EndLists();

    // A folder of the command line or the list.
    struct GivenFolder {
        std::filesystem::path path;
        std::filesystem::path firstMovie = {};  // of any share; empty: it has none
        // The steps of this share that were found in it.
        std::size_t begin = 0;
        std::size_t end = 0;
    };
    const std::vector<GivenFolder>& givenFolders() const { return givenFolders_; }
    bool IsNamed(std::size_t place) const { return steps_[place].list == kNamed; }

private:
    struct Planned {
        std::uint32_t list;   // among the folders, or one of those below
        std::uint32_t place;  // among its movies
    };
    static constexpr std::uint32_t kOther = 0xFFFFFFFF;
    static constexpr std::uint32_t kNamed = kOther - 1;
    static constexpr std::uint32_t kFound = kOther - 2;  // in a folder, by its ending
    friend class MoviePlanner;

    std::vector<Planned> steps_;
    std::vector<unsigned> numbers_;  // of these, or none
    std::vector<std::shared_ptr<FolderClips>> folders_;
    PathList named_;
    PathList found_;
    std::vector<MovieStep> others_;
    std::vector<GivenFolder> givenFolders_;
};

// The name of what is made of a movie. Movies of one name in different folders have numbers.
std::filesystem::path OutputName(const std::filesystem::path& movie, unsigned number,
                                 const char* ending);

// The number in such a name; 0 for a name that is none of this movie and ending.
unsigned NumberInName(const std::filesystem::path& name, const std::filesystem::path& movie,
                      const char* ending);

}  // namespace cliphost
