// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/GoneMovies.h"

#include <set>

#include "reference_host/cliphost/FolderTree.h"
#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/system/Paths.h"
#include "reference_host/util/text/FileUrl.h"

namespace cliphost {
namespace {

// A link that leads nowhere is there: what it leads to may not be mounted.
bool IsGone(const std::filesystem::path& movie) {
    std::error_code ignored;
    return std::filesystem::symlink_status(movie, ignored).type() ==
           std::filesystem::file_type::not_found;
}

// Where its folder is not there, or empty, that may be one that is not mounted.
bool IsGoneFromFolder(const std::filesystem::path& movie) {
    std::error_code error;
    return IsGone(movie) && !std::filesystem::is_empty(movie.parent_path(), error) && !error;
}

class GoneSearch {
public:
    GoneSearch(const MoviesOptions& options, catalog::Catalog& catalog)
        : options_(options), catalog_(catalog) {}

    void LookIn(const MoviePlan::GivenFolder& given, const MoviePlan& plan) {
        const std::filesystem::path& asGiven = given.path;
        const std::filesystem::path folder = AbsolutePath(asGiven / "");
        std::vector<std::string> gone;
        // Movies whose names are no UTF-8 go by URLs.
        for (const std::string& start :
             {host::system::PathText(folder), host::system::UrlOfPath(folder)}) {
            for (const std::string& path : catalog_.PathsThatBegin(start)) {
                const std::filesystem::path movie = PathOfMachinePath(path);
                if (IsMeant(movie.lexically_relative(folder), asGiven) && IsGoneFromFolder(movie)) {
                    gone.push_back(path);
                }
            }
        }
        // Asked last: the folder may have gone away as a whole since it was listed.
        if (!gone.empty() && HasMovies(given, plan)) {
            gone_.insert(gone.begin(), gone.end());
        }
    }

    void LookAt(const std::filesystem::path& named) {
        const std::string path = AbsoluteMachinePath(named);
        if (IsGoneFromFolder(PathOfMachinePath(path)) && catalog_.Find(path)) {
            gone_.insert(path);
        }
    }

    std::vector<std::string> Found() const { return {gone_.begin(), gone_.end()}; }

private:
    // Whether one that was found there is there still.
    static bool HasMovies(const MoviePlan::GivenFolder& given, const MoviePlan& plan) {
        bool has = !given.firstMovie.empty() && !IsGone(given.firstMovie);
        for (std::size_t place = given.begin; !has && place < given.end; ++place) {
            const MovieStep step = plan[place];
            has = step.IsMovie() && !IsGone(step.movie);
        }
        return has;
    }

    // `rest` is the way from the folder to the movie.
    bool IsMeant(const std::filesystem::path& rest, const std::filesystem::path& folder) const {
        const bool isWithin = options_.isRecursive || !rest.has_parent_path();
        const bool hasEnding = options_.endings.empty() ? rest.extension() == ".mov"
                                                        : HasEnding(rest, options_.endings);
        return isWithin && hasEnding &&
               (options_.shard.IsWhole() || options_.shard.Holds(host::system::GenericPathText(
                                                (folder / rest).lexically_normal())));
    }

    const MoviesOptions& options_;
    catalog::Catalog& catalog_;
    std::set<std::string> gone_;
};

}  // namespace

std::vector<std::string> GoneMovies(const MoviesOptions& options, const MoviePlan& plan,
                                    catalog::Catalog& catalog) {
    GoneSearch search(options, catalog);
    for (const MoviePlan::GivenFolder& folder : plan.givenFolders()) {
        search.LookIn(folder, plan);
    }
    for (std::size_t place = 0; place < plan.size(); ++place) {
        if (plan.IsNamed(place)) {
            search.LookAt(plan[place].movie);
        }
    }
    return search.Found();
}

}  // namespace cliphost
