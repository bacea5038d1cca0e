// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/MovieSearch.h"

#include <algorithm>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/FileAccess.h"
#include "reference_host/cliphost/FolderTree.h"
#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/cliphost/Notice.h"
#include "reference_host/cliphost/Words.h"
#include "reference_host/framework/HostPath.h"
#include "reference_host/system/FileNumber.h"
#include "reference_host/system/Paths.h"

namespace cliphost {
namespace {

class FolderSearch {
public:
    explicit FolderSearch(const std::set<std::string>& endings) : endings_(endings) {}

    void Search(const std::filesystem::path& top) {
        for (const std::filesystem::path& folder : FoldersIn(top)) {
            List(folder);
        }
    }

    std::vector<std::filesystem::path> Take() { return std::move(files_); }

private:
    void List(const std::filesystem::path& folder) {
        std::vector<std::filesystem::path> files;
        std::error_code error;
        std::filesystem::directory_iterator entry(folder, error);
        for (; !error && entry != std::filesystem::directory_iterator(); entry.increment(error)) {
            std::error_code ignored;
            if (endings_.count(SoughtEnding(entry->path())) != 0 &&
                entry->is_regular_file(ignored)) {
                files.push_back(entry->path());
            }
        }
        if (error) {
            Notice("cliphost: {}: not searched: {}\n", host::DisplayPath(folder),
                   error.default_error_condition().message());
        }
        std::sort(files.begin(), files.end());
        for (std::filesystem::path& file : files) {
            const auto number = host::system::NumberOf(file);
            if (number && known_.insert(*number).second) {
                files_.push_back(std::move(file));
            }
        }
    }

    const std::set<std::string>& endings_;
    std::set<host::system::FileNumber> known_;
    std::vector<std::filesystem::path> files_;
};

}  // namespace

std::string SoughtEnding(const std::filesystem::path& path) {
    return InSmallLetters(host::system::PathText(path.extension()));
}

std::vector<std::filesystem::path> FilesIn(const std::vector<std::filesystem::path>& folders,
                                           const std::set<std::string>& endings) {
    FolderSearch search(endings);
    for (const std::filesystem::path& folder : folders) {
        if (const Problem problem = WhyUnlistable(folder)) {
            throw Failure(kExitCaller, problem);
        }
        search.Search(AbsolutePath(folder));
    }
    return search.Take();
}

}  // namespace cliphost
