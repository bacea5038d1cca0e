// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/FolderTree.h"

#include <algorithm>
#include <set>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/FileAccess.h"
#include "reference_host/cliphost/Words.h"
#include "reference_host/system/FileNumber.h"
#include "reference_host/system/Paths.h"

namespace cliphost {
namespace {

// Folders that lie in one another are met before links to them, so that a folder goes by the same
// path whatever links there are. A link to a folder that was met, such as one above it, ends there.
class FolderWalk {
public:
    explicit FolderWalk(const std::filesystem::path& folder) {
        std::vector<std::filesystem::path> links{folder};
        while (!links.empty()) {
            std::sort(links.begin(), links.end());
            for (const std::filesystem::path& link : std::exchange(links, {})) {
                WalkFrom(link, links);
            }
        }
        std::sort(found_.begin(), found_.end());
    }
    std::vector<std::filesystem::path> TakeFound() { return std::move(found_); }

private:
    void WalkFrom(const std::filesystem::path& folder, std::vector<std::filesystem::path>& links) {
        std::vector<std::filesystem::path> open{folder};
        while (!open.empty()) {
            const std::filesystem::path next = std::move(open.back());
            open.pop_back();
            const auto number = host::system::NumberOf(next);
            if (!number || !met_.insert(*number).second) {
                continue;
            }
            List(next, open, links);
            found_.push_back(next);
        }
    }

    static void List(const std::filesystem::path& folder,
                     std::vector<std::filesystem::path>& folders,
                     std::vector<std::filesystem::path>& links) {
        std::error_code error;
        std::filesystem::directory_iterator entry(folder, error);
        for (; !error && entry != std::filesystem::directory_iterator(); entry.increment(error)) {
            std::error_code ignored;
            if (entry->is_directory(ignored)) {
                (entry->is_symlink(ignored) ? links : folders).push_back(entry->path());
            }
        }
    }

    std::set<host::system::FileNumber> met_;
    std::vector<std::filesystem::path> found_;
};

}  // namespace

bool HasEnding(const std::filesystem::path& file, const std::vector<std::string>& endings) {
    const std::string small = InSmallLetters(host::system::PathText(file.filename()));
    return std::any_of(endings.begin(), endings.end(), [&](const std::string& ending) {
        const std::size_t size = ending.size() + 1;
        return small.size() > size && small[small.size() - size] == '.' &&
               small.compare(small.size() - ending.size(), ending.size(), ending) == 0;
    });
}

std::vector<std::filesystem::path> FoldersIn(const std::filesystem::path& folder) {
    return FolderWalk(folder).TakeFound();
}

std::vector<std::string> EndingsIn(const std::string& list) {
    std::vector<std::string> endings;
    for (std::size_t at = 0; at <= list.size();) {
        const std::size_t end = std::min(list.find(',', at), list.size());
        std::string ending = InSmallLetters(list.substr(at, end - at));
        if (!ending.empty() && ending[0] == '.') {
            ending.erase(0, 1);
        }
        if (ending.empty() || ending.find_first_of("/* ") != std::string::npos) {
            throw Failure(kExitCaller, host::system::PathOfText("--extensions " + list),
                          "is not a list of endings with commas between them",
                          "write it such as mov,mp4,mxf");
        }
        endings.push_back(std::move(ending));
        at = end + 1;
    }
    return endings;
}

std::vector<Problem> ForEachByEnding(
    const std::filesystem::path& folder, const std::vector<std::string>& endings,
    const std::function<void(const std::filesystem::path&)>& take) {
    if (Problem problem = WhyUnlistable(folder)) {
        throw Failure(kExitCaller, std::move(problem));
    }
    std::vector<Problem> noFiles;
    std::error_code error;
    std::filesystem::directory_iterator entry(folder, error);
    for (; !error && entry != std::filesystem::directory_iterator(); entry.increment(error)) {
        std::error_code ignored;
        if (!HasEnding(entry->path(), endings) || entry->is_directory(ignored)) {
            continue;
        }
        if (entry->is_regular_file(ignored)) {
            take(entry->path());
        } else if (Problem problem = WhyUnreadable(entry->path())) {
            noFiles.push_back(std::move(problem));
        }
    }
    if (error) {
        throw Failure(kExitCaller, folder,
                      "the folder can't be listed: " + error.default_error_condition().message());
    }
    std::sort(noFiles.begin(), noFiles.end(),
              [](const Problem& a, const Problem& b) { return a.subject < b.subject; });
    return noFiles;
}

EndingMatches FilesByEnding(const std::filesystem::path& folder,
                            const std::vector<std::string>& endings) {
    EndingMatches matches;
    matches.noFiles = ForEachByEnding(
        folder, endings, [&](const std::filesystem::path& file) { matches.files.push_back(file); });
    std::sort(matches.files.begin(), matches.files.end());
    return matches;
}

}  // namespace cliphost
