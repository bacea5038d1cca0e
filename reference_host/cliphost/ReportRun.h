// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <map>
#include <nlohmann/json.hpp>
#include <optional>
#include <string>
#include <vector>

#include "reference_host/catalog/Catalog.h"
#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/MovieCodecs.h"
#include "reference_host/cliphost/MoviesRun.h"
#include "reference_host/cliphost/OutputFile.h"
#include "reference_host/cliphost/PathMaps.h"
#include "reference_host/cliphost/ReportFolder.h"
#include "reference_host/report/Page.h"

namespace cliphost {

struct ReportOptions {
    MoviesOptions movies;  // `together` is the page; none where JSON is printed
    PathMaps maps;
    std::string title;     // empty: what the command line names
    bool json = false;     // print what the page is made of in its place
    bool isSplit = false;  // pictures into a folder beside the page
    struct NamedCatalog {
        std::filesystem::path file;
        catalog::Catalog catalog;
        std::size_t movies = 0;
    };
    // Those of the command line; what they know of movies that can't be read is told.
    std::vector<NamedCatalog> catalogs;
};

// Takes the catalogs out of the paths and puts their movies there. Throws a Failure.
void TakeCatalogs(ReportOptions& options);

// What is told of a page with its pictures in it that is larger than those of 1,000 clips are, and
// what helps; empty for any other.
std::string AdviceOnSize(std::uint64_t bytes, bool isSplit);

// Writes a page of all movies of the command line, those that can't be described too. It is put
// into its place at the end; where a signal stops the run, with the movies so far, unless there is
// one already.
class ReportRun final : public MoviesRun {
public:
    ReportRun(Session& session, ReportOptions& options);

private:
    using Json = nlohmann::ordered_json;

    void Planned(const MoviePlan& plan) override;
    MovieAnswer Answer(const MovieStep& step, const PlaceOfFile& place) override;
    bool ReadAnswer(const std::string& bytes, MovieAnswer& answer) override;
    void Show(const std::filesystem::path& movie, const MovieAnswer& answer,
              const std::filesystem::path& saved) override;
    void ShowFailure(const std::filesystem::path& movie, const Problem& problem) override;
    bool Collects() const override { return false; }
    bool LooksFirst() const override { return true; }
    bool TellsFailures() const override { return !notWritten_; }
    void Finish(int read, int failed) override;

    void RefuseCatalogsOfList(const MoviePlan& plan);
    std::optional<catalog::Entry> EntryInCatalogs(const std::filesystem::path& movie);
    void AddFile(const std::filesystem::path& movie, Json& facts);
    void Add(const std::filesystem::path& movie, Json clip, bool hasFailed);
    void Write(Json& facts, Json& details);
    // Into the folder beside the page, where there is one.
    void TakePictures(Json& facts, Json& details);
    void WritePage();
    void TellUnusedMaps(int read);

    ReportOptions& options_;
    PathMaps maps_;  // to know which were used
    CodecReader codecs_;
    bool takesPlace_ = false;
    std::optional<ReportFolder> pictures_;  // none: they are in the page
    std::optional<OutputFile> output_;
    std::optional<report::Page> page_;
    std::optional<Failure> notWritten_;  // page or pictures; no movie's fault, and ends the run
    std::uint64_t written_ = 0;
    Json clips_ = Json::array();  // without details where they are in the page already
};

}  // namespace cliphost
