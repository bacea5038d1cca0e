// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <map>
#include <nlohmann/json_fwd.hpp>
#include <optional>
#include <string>

#include "reference_host/cliphost/AafComparison.h"
#include "reference_host/cliphost/Bin.h"
#include "reference_host/cliphost/MoviesRun.h"
#include "reference_host/cliphost/RowsOfMovies.h"

namespace cliphost {

struct DescribeOptions {
    MoviesOptions movies;
    DescriptionForm form;
    bool stringout = false;
    double editorRate = 25.0;            // frames per second
    std::filesystem::path settingsFile;  // that was read; empty: none
    std::filesystem::path against;       // a file that all are compared with; empty: none
};

// Describes all movies of the command line.
class DescribeRun final : public MoviesRun {
public:
    DescribeRun(Session& session, const DescribeOptions& options);

private:
    MovieAnswer Answer(const MovieStep& step, const PlaceOfFile& place) override;
    bool ReadAnswer(const std::string& bytes, MovieAnswer& answer) override;
    void Show(const std::filesystem::path& movie, const MovieAnswer& answer,
              const std::filesystem::path& saved) override;
    void ShowFailure(const std::filesystem::path& movie, const Problem& problem) override;
    void ShowDone(const std::filesystem::path& movie, const std::filesystem::path& saved) override;
    bool Collects() const override { return bin_.has_value(); }
    void Collect(const std::filesystem::path& movie, const std::filesystem::path& file) override;
    void Finish(int described, int failed) override;
    void Planned(const MoviePlan& plan) override;
    void RefuseOutputsOntoOthers() const;
    void WriteColumns() const;
    void AddToBin(IAAFFile* description, const std::filesystem::path& movie);
    void SaveBin();
    Problem WhyNotCompared() const;
    const std::string* WhyFailed(const std::filesystem::path& movie) const;
    UnknownMobs MobsOfFailures() const;
    void TellDifferences();
    template <class Printer>
    void PrintDifferences(Printer& printer);
    void PrintEntries();
    void PrintSummary(int described, int failed) const;
    void AddEntry(const nlohmann::ordered_json& head, const std::string& description);

    const DescribeOptions& options_;
    PathMaps maps_;  // to know which were used
    RowsOfMovies rows_;
    std::optional<Bin> bin_;                                 // of what is made of all
    host::Ref<IAAFFile> against_;                            // empty: nothing is compared
    std::map<std::filesystem::path, std::string> failures_;  // movies and folders; for against_
    std::filesystem::path copyOf_;  // what the last movie that went into the bin is a copy of
    std::vector<std::pair<std::filesystem::path::string_type, ColumnValues>> columns_;
    std::vector<std::string> entries_;  // of the JSON list that comes at the end
};

}  // namespace cliphost
