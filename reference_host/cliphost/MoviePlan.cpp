// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/MoviePlan.h"

#include <fmt/format.h>

#include <algorithm>
#include <charconv>
#include <set>
#include <utility>

#include "reference_host/cliphost/DoneMovies.h"
#include "reference_host/cliphost/FolderTree.h"
#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/cliphost/Words.h"
#include "reference_host/system/FileSystem.h"
#include "reference_host/system/Paths.h"

namespace cliphost {
namespace {

// "*.mov", or "*.mp4 or *.mxf".
std::string NamesInWords(const std::vector<std::string>& endings) {
    if (endings.empty()) {
        return "*.mov";
    }
    std::string words;
    for (std::size_t i = 0; i < endings.size(); ++i) {
        words += (i == 0 ? "*." : i + 1 < endings.size() ? ", *." : " or *.") + endings[i];
    }
    return words;
}

}  // namespace

class MoviePlanner {
public:
    MoviePlanner(Session& session, const MoviesOptions& options, const char* ending,
                 const DoneMovies* done, MoviePlan& plan)
        : session_(session),
          options_(options),
          ending_(ending),
          done_(done),
          plan_(plan),
          hasNumbers_(!options.outFolder.empty() &&
                      (options.skipDone || !options.shard.IsWhole() || options.names)),
          names_(options.names ? *options.names : ownNames_) {}

    void Add(const std::filesystem::path& path) {
        std::error_code ignored;
        if (!std::filesystem::is_directory(path, ignored)) {
            AppendMovie(path, path, MoviePlan::kNamed,
                        [&] { return Keep(path.native(), plan_.named_); });
            return;
        }
        firstMovie_.clear();
        const std::size_t begin = plan_.size();
        if (options_.isRecursive) {
            AddTree(path);
        } else {
            AddFolder(path, false);
        }
        plan_.givenFolders_.push_back({path, std::exchange(firstMovie_, {}), begin, plan_.size()});
    }

private:
    static std::uint32_t Keep(const PathList::Text& path, PathList& paths) {
        paths.Add(path);
        return static_cast<std::uint32_t>(paths.size() - 1);
    }

    // `asGiven` does not depend on where the caller's working folder is mounted.
    bool IsOfShare(const std::filesystem::path& asGiven) const {
        return options_.shard.IsWhole() ||
               options_.shard.Holds(host::system::GenericPathText(asGiven.lexically_normal()));
    }

    template <class Place>
    void AppendMovie(const std::filesystem::path& movie, const std::filesystem::path& asGiven,
                     std::uint32_t list, const Place& place) {
        isEmpty_ = false;
        if (firstMovie_.empty()) {
            firstMovie_ = movie;
        }
        const unsigned number = hasNumbers_ ? NextNumber(movie) : 0;
        if (IsOfShare(asGiven)) {
            plan_.steps_.push_back({list, place()});
            AppendNumber(number);
        }
    }

    void AppendOther(MovieStep step) {
        isEmpty_ = isEmpty_ && step.notice;
        if (IsOfShare(step.movie)) {
            plan_.steps_.push_back(
                {MoviePlan::kOther, static_cast<std::uint32_t>(plan_.others_.size())});
            plan_.others_.push_back(std::move(step));
            AppendNumber(0);
        }
    }

    void AppendNumber(unsigned number) {
        if (hasNumbers_) {
            plan_.numbers_.push_back(number);
        }
    }

    unsigned NextNumber(const std::filesystem::path& movie) {
        unsigned* const known = options_.names ? &names_.byMovie[movie.native()] : nullptr;
        if (known && *known != 0) {
            return *known;
        }
        unsigned number = RecordedNumber(movie);
        number = number == 0 ? NewNumber(movie) : number;
        if (known) {
            *known = number;
        }
        return number;
    }

    bool Takes(const std::filesystem::path& name) {
        return names_.taken.insert(host::system::NameKey(name).native()).second;
    }

    // 0 for a movie that is in no record. One that is given twice has two outputs.
    unsigned RecordedNumber(const std::filesystem::path& movie) {
        std::set<unsigned> numbers;
        if (done_) {
            for (const std::filesystem::path& output : done_->OutputsOf(movie)) {
                numbers.insert(NumberInName(output, movie, ending_));
            }
        }
        const auto free = std::find_if(numbers.begin(), numbers.end(), [&](unsigned number) {
            return number != 0 && Takes(OutputName(movie, number, ending_));
        });
        return free == numbers.end() ? 0 : *free;
    }

    // The record of a run that goes on meanwhile, on another share, changes no number: what it
    // holds was given in this way.
    unsigned NewNumber(const std::filesystem::path& movie) {
        unsigned& number =
            names_.lastNumbers[host::system::NameKey(OutputName(movie, 1, ending_)).native()];
        for (;;) {
            const std::filesystem::path name = OutputName(movie, ++number, ending_);
            if (!(done_ && done_->Keeps(name)) && Takes(name)) {
                return number;
            }
        }
    }

    void Refuse(const std::filesystem::path& path, int status, const Problem& problem) {
        MovieStep step{path.native()};
        step.refusal = std::make_shared<const Failure>(status, problem);
        AppendOther(std::move(step));
    }

    void Refuse(const std::vector<Problem>& problems) {
        for (const Problem& problem : problems) {
            Refuse(problem.subject, kExitCaller, problem);
        }
    }

    void AddTree(const std::filesystem::path& root) {
        isEmpty_ = true;
        for (const std::filesystem::path& folder : FoldersIn(root)) {
            AddFolder(folder, true);
        }
        if (isEmpty_) {
            Refuse(root, kExitFile,
                   {root, fmt::format("no file in it or in a folder within it is named {}",
                                      NamesInWords(options_.endings))});
        }
    }

    void AddFolder(const std::filesystem::path& folder, bool isOneOfMany) {
        try {
            if (!options_.endings.empty()) {
                AddByEnding(folder, isOneOfMany);
            } else if (IsClaimed(session_, PathForModule(folder).get())) {
                AddClaimed(folder);
            } else if (isOneOfMany) {
                AddUnclaimed(folder);
            } else {
                throw Failure(kExitFile, NotClaimed(folder));
            }
        } catch (const Failure& failure) {
            Refuse(folder, failure.status(), failure.problem());
        }
    }

    void AddClaimed(const std::filesystem::path& folder) {
        const auto clips = std::make_shared<FolderClips>(session_, folder);
        for (const std::filesystem::path& name : clips->others().withBackslash) {
            Refuse(name, kExitCaller, BackslashProblem(name));
        }
        Refuse(clips->others().noFiles);
        TellLeftOut(folder, clips->others());
        const auto list = static_cast<std::uint32_t>(plan_.folders_.size());
        plan_.folders_.push_back(clips);
        for (std::uint32_t place = 0; place < clips->clips().size(); ++place) {
            const std::filesystem::path movie = clips->clips()[place].path;
            AppendMovie(movie, folder / movie.filename(), list, [&] { return place; });
        }
    }

    void AddUnclaimed(const std::filesystem::path& folder) {
        const OtherMovies others = FindOtherMovies(folder);
        Refuse(others.noFiles);
        TellLeftOut(folder, others);
    }

    void TellLeftOut(const std::filesystem::path& folder, const OtherMovies& others) {
        if (const Problem leftOut = LeftOut(folder, others)) {
            MovieStep step{folder.native()};
            step.notice = std::make_shared<const Problem>(leftOut);
            AppendOther(std::move(step));
        }
    }

    void AddByEnding(const std::filesystem::path& folder, bool isOneOfMany) {
        const EndingMatches matches = FilesByEnding(folder, options_.endings);
        Refuse(matches.noFiles);
        for (const std::filesystem::path& file : matches.files) {
            // The form of the paths that the module lists.
            const std::filesystem::path movie = AbsolutePath(file);
            AppendMovie(movie, file, MoviePlan::kFound,
                        [&] { return Keep(movie.native(), plan_.found_); });
        }
        if (!isOneOfMany && matches.noFiles.empty() && matches.files.empty()) {
            throw Failure(kExitFile, folder,
                          "no file in it is named " + NamesInWords(options_.endings));
        }
    }

    Session& session_;
    const MoviesOptions& options_;
    const char* const ending_;
    const DoneMovies* const done_;  // or null
    MoviePlan& plan_;
    const bool hasNumbers_;
    OutputNames ownNames_;
    OutputNames& names_;
    bool isEmpty_ = true;               // the folder has neither a movie nor what is told as one
    std::filesystem::path firstMovie_;  // of the folder at hand
};

MoviePlan::MoviePlan(Session& session, const MoviesOptions& options, const char* ending,
                     const DoneMovies* done) {
    MoviePlanner planner(session, options, ending, done, *this);
    for (const std::filesystem::path& path : options.paths) {
        planner.Add(path);
    }
    if (!options.list.empty()) {
        for (const auto& path : ReadInputList(options.list, options.listForm)) {
            planner.Add(path);
        }
    }
    named_.Close();
    found_.Close();
}

MovieStep MoviePlan::operator[](std::size_t place) const {
    const Planned& planned = steps_[place];
    switch (planned.list) {
        case kOther:
            return others_[planned.place];
        case kNamed:
            return {named_[planned.place]};
        case kFound:
            return {found_[planned.place]};
        default: {
            const std::shared_ptr<FolderClips>& folder = folders_[planned.list];
            FolderClip clip = folder->clips()[planned.place];
            return {std::move(clip.path), folder, clip.index};
        }
    }
}

void MoviePlan::EndLists() {
    for (const std::shared_ptr<FolderClips>& folder : folders_) {
        folder->EndList();
    }
}

bool MoviePlan::MayBeOutput(std::size_t place, const char* ending) const {
    const std::uint32_t list = steps_[place].list;
    // Letters' case counts on some disks, and on others it doesn't.
    const auto endsSo = [&] {
        const std::filesystem::path movie((*this)[place].movie);
        return InSmallLetters(host::system::PathText(movie.extension())) == ending;
    };
    return list == kNamed || (list == kFound && endsSo());
}

std::filesystem::path OutputName(const std::filesystem::path& movie, unsigned number,
                                 const char* ending) {
    std::filesystem::path name = movie.stem();
    name += number == 1 ? ending : fmt::format("-{}{}", number, ending);
    return name;
}

unsigned NumberInName(const std::filesystem::path& name, const std::filesystem::path& movie,
                      const char* ending) {
    const std::string stem = host::system::PathText(movie.stem());
    const std::string text = host::system::PathText(name);
    const std::size_t from = stem.size() + 1;  // behind the hyphen
    unsigned number = 1;
    if (text.size() > from) {
        std::from_chars(text.data() + from, text.data() + text.size(), number);
    }
    return OutputName(movie, number, ending) == name ? number : 0;
}

}  // namespace cliphost
