// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <filesystem>
#include <nlohmann/json_fwd.hpp>
#include <optional>
#include <set>
#include <string>
#include <vector>

#include "reference_host/cliphost/OutputFolder.h"
#include "reference_host/system/ScratchFolder.h"

namespace cliphost {

// The folder of pictures beside a report's page. They are put aside within it until the page is
// written. Their names hold a digest of their bytes, so they never take the place of an earlier
// page's: until the new page has its place, the earlier one has all of its own.
class ReportFolder {
public:
    explicit ReportFolder(std::filesystem::path folder);  // throws a Failure
    ~ReportFolder();  // removes the pictures of a page that did not get its place
    ReportFolder(const ReportFolder&) = delete;
    ReportFolder& operator=(const ReportFolder&) = delete;

    // Puts the bytes of a clip's picture aside; in their place it gets the file's name, as the page
    // asks for it. Throws a Failure.
    void Take(nlohmann::ordered_json& picture, std::size_t clip, const char* name);
    // For a page that is to take its place now. Throws a Failure.
    void PutIntoPlace();
    // Removes the pictures of an earlier page. Other files stay.
    void PageIsInPlace();

private:
    std::filesystem::path folder_;
    OutputFolder made_;
    std::optional<host::system::ScratchFolder> aside_;
    std::set<std::string> names_;
    std::vector<std::filesystem::path> withoutPage_;  // that this run has put into place
};

}  // namespace cliphost
