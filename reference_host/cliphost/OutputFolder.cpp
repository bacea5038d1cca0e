// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/OutputFolder.h"

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/OutputFile.h"
#include "reference_host/cliphost/OutputProblem.h"

namespace cliphost {
namespace {

void RemoveEmpty(const std::vector<std::filesystem::path>& folders) {
    std::error_code ignored;
    for (const std::filesystem::path& folder : folders) {
        std::filesystem::remove(folder, ignored);  // takes no folder that holds something
    }
}

}  // namespace

OutputFolder::OutputFolder(const std::filesystem::path& folder) {
    RefuseName(folder);
    std::error_code error;
    std::vector<std::filesystem::path> missing;
    for (std::filesystem::path way = folder;
         way.has_relative_path() && !std::filesystem::exists(way, error) && !error;
         way = way.parent_path()) {
        missing.push_back(way);
    }
    std::filesystem::create_directories(folder, error);
    if (error) {
        RemoveEmpty(missing);
        throw Failure(kExitCaller, FolderNotMade(folder, error.default_error_condition().value()));
    }
    made_ = std::move(missing);
}

OutputFolder::~OutputFolder() {
    RemoveEmpty(made_);
}

}  // namespace cliphost
