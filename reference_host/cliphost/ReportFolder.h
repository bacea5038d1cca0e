// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <filesystem>
#include <nlohmann/json_fwd.hpp>
#include <optional>
#include <set>
#include <string>

#include "reference_host/cliphost/OutputFolder.h"
#include "reference_host/system/ScratchFolder.h"

namespace cliphost {

// The folder of pictures beside a report's page. They are put aside within it until the page is
// written, so that a run that ends before leaves an earlier page its own pictures.
class ReportFolder {
public:
    explicit ReportFolder(std::filesystem::path folder);  // throws a Failure

    // Puts the bytes of a clip's picture aside; in their place it gets the file's name, as the page
    // asks for it. Throws a Failure.
    void Take(nlohmann::ordered_json& picture, std::size_t clip, const char* name);
    // For a page that is to take its place now. Throws a Failure.
    void PutIntoPlace();
    // Those of an earlier page, when this one has its place. Other files stay.
    void RemoveOthers() const;

private:
    std::filesystem::path folder_;
    OutputFolder made_;
    std::optional<host::system::ScratchFolder> aside_;
    std::set<std::string> names_;
};

}  // namespace cliphost
