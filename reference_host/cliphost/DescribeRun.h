// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/cliphost/MoviesRun.h"

namespace cliphost {

struct DescribeOptions {
    MoviesOptions movies;
    DescriptionForm form;
};

// Describes all movies of the command line.
class DescribeRun final : public MoviesRun {
public:
    DescribeRun(Session& session, const DescribeOptions& options)
        : MoviesRun(session, options.movies, "describing", ".aaf"),
          options_(options),
          maps_(options.form.maps) {}

private:
    MovieAnswer Answer(const MovieStep& step, const PlaceOfFile& place) override;
    bool ReadAnswer(const std::string& bytes, MovieAnswer& answer) override;
    void Show(const std::filesystem::path& movie, const MovieAnswer& answer,
              const std::filesystem::path& saved) override;
    void ShowFailure(const std::filesystem::path& movie, const Problem& problem) override;
    void Finish(int described, int failed) override;

    const DescribeOptions& options_;
    PathMaps maps_;                     // to know which were used
    std::vector<std::string> entries_;  // of the JSON list
};

}  // namespace cliphost
