// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/MoviePlan.h"

#include <fmt/format.h>

#include <unordered_map>
#include <unordered_set>

#include "reference_host/cliphost/FolderTree.h"

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

class Planner {
public:
    Planner(Session& session, const MoviesOptions& options)
        : session_(session), options_(options) {}

    void Add(const std::filesystem::path& path) {
        std::error_code ignored;
        if (!std::filesystem::is_directory(path, ignored)) {
            MovieStep step{path.native()};
            step.isNamed = true;
            Append(std::move(step), path);
        } else if (options_.isRecursive) {
            AddTree(path);
        } else {
            AddFolder(path, false);
        }
    }

    void NumberOutputs(const char* ending) {
        std::unordered_set<std::string> taken;
        std::unordered_map<std::string, unsigned> last;  // by the name without a number
        for (MovieStep& step : steps_) {
            if (step.IsMovie()) {
                unsigned& number = last[OutputName(step.movie, 1, ending)];
                while (!taken.insert(OutputName(step.movie, ++number, ending)).second) {
                }
                step.number = number;
            }
        }
    }

    // Those of other shares are left out.
    std::vector<MovieStep> TakeShare() {
        std::size_t count = 0;
        for (std::size_t i = 0; i < steps_.size(); ++i) {
            if (isOfShare_[i] && count++ != i) {
                steps_[count - 1] = std::move(steps_[i]);
            }
        }
        steps_.resize(count);
        return std::move(steps_);
    }

private:
    // `asGiven` does not depend on where the caller's working folder is mounted.
    void Append(MovieStep step, const std::filesystem::path& asGiven) {
        steps_.push_back(std::move(step));
        isOfShare_.push_back(options_.shard.IsWhole() ||
                             options_.shard.Holds(asGiven.lexically_normal()));
    }

    void Refuse(const std::filesystem::path& path, int status, const Problem& problem) {
        MovieStep step{path.native()};
        step.refusal = std::make_shared<const Failure>(status, problem);
        Append(std::move(step), path);
    }

    void Refuse(const std::vector<Problem>& problems) {
        for (const Problem& problem : problems) {
            Refuse(problem.subject, kExitCaller, problem);
        }
    }

    void AddTree(const std::filesystem::path& root) {
        const std::size_t before = steps_.size();
        for (const std::filesystem::path& folder : FoldersIn(root)) {
            AddFolder(folder, true);
        }
        for (std::size_t i = before; i < steps_.size(); ++i) {
            if (!steps_[i].notice) {
                return;
            }
        }
        Refuse(root, kExitFile,
               {root, fmt::format("no file in it or in a folder within it is named {}",
                                  NamesInWords(options_.endings))});
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
        const auto clips = std::make_shared<const FolderClips>(session_, folder);
        for (const std::filesystem::path& name : clips->others().withBackslash) {
            Refuse(name, kExitCaller, BackslashProblem(name));
        }
        Refuse(clips->others().noFiles);
        TellLeftOut(folder, clips->others());
        for (const FolderClip& clip : clips->clips()) {
            MovieStep step{clip.path};
            step.folder = clips;
            step.index = clip.index;
            Append(std::move(step), folder / std::filesystem::path(clip.path).filename());
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
            Append(std::move(step), folder);
        }
    }

    void AddByEnding(const std::filesystem::path& folder, bool isOneOfMany) {
        const EndingMatches matches = FilesByEnding(folder, options_.endings);
        Refuse(matches.noFiles);
        for (const std::filesystem::path& file : matches.files) {
            // The form of the paths that the module lists.
            MovieStep step{std::filesystem::absolute(file).lexically_normal().native()};
            Append(std::move(step), file);
        }
        if (!isOneOfMany && matches.noFiles.empty() && matches.files.empty()) {
            throw Failure(kExitFile, folder,
                          "no file in it is named " + NamesInWords(options_.endings));
        }
    }

    Session& session_;
    const MoviesOptions& options_;
    std::vector<MovieStep> steps_;
    std::vector<bool> isOfShare_;
};

}  // namespace

std::vector<MovieStep> PlanMovies(Session& session, const MoviesOptions& options,
                                  const char* ending) {
    Planner planner(session, options);
    for (const std::filesystem::path& path : options.paths) {
        planner.Add(path);
    }
    if (!options.list.empty()) {
        for (const auto& path : ReadInputList(options.list, options.listForm)) {
            planner.Add(path);
        }
    }
    // Names that are the same in every run and on every machine.
    if (!options.outFolder.empty() && (options.skipDone || !options.shard.IsWhole())) {
        planner.NumberOutputs(ending);
    }
    return planner.TakeShare();
}

std::filesystem::path OutputName(const std::filesystem::path& movie, unsigned number,
                                 const char* ending) {
    std::filesystem::path name = movie.stem();
    name += number == 1 ? ending : fmt::format("-{}{}", number, ending);
    return name;
}

}  // namespace cliphost
