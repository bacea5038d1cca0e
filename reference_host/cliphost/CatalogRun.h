// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <chrono>
#include <optional>
#include <string>
#include <vector>

#include "reference_host/catalog/Catalog.h"
#include "reference_host/cliphost/CatalogFile.h"
#include "reference_host/cliphost/MovieCodecs.h"
#include "reference_host/cliphost/MovieEntry.h"
#include "reference_host/cliphost/MoviesRun.h"
#include "reference_host/cliphost/RowsOfMovies.h"

namespace cliphost {

// How the movies of a catalog are read.
struct CatalogForm {
    bool thumbnails = false;
    GivenColumns columns;  // to be written into the descriptions before they are read
};

struct CatalogOptions {
    MoviesOptions movies;  // `together` is the catalog
    CatalogForm form;
    bool update = false;
    bool lines = false;  // JSON of one line for each movie
};

// Describes a movie; what a catalog keeps of it is the answer's description, as JSON.
MovieAnswer CatalogAnswer(Session& session, CodecReader& codecs, const CatalogForm& form,
                          const Description& description);

// Writes a catalog of all movies of the command line. Anew: it is put into its place at the end, or
// where it is stopped, unless there is one already. As an update: what is read is added some movies
// at a time, so that whatever ends the program, the catalog is whole.
class CatalogRun final : public MoviesRun {
public:
    CatalogRun(Session& session, const CatalogOptions& options);

private:
    MovieAnswer Answer(const MovieStep& step, const PlaceOfFile& place) override;
    bool ReadAnswer(const std::string& bytes, MovieAnswer& answer) override;
    void Show(const std::filesystem::path& movie, const MovieAnswer& answer,
              const std::filesystem::path& saved) override;
    void ShowFailure(const std::filesystem::path& movie, const Problem& problem) override;
    void ShowDone(const std::filesystem::path& movie, const std::filesystem::path& saved) override;
    bool Collects() const override { return false; }
    bool LooksFirst() const override { return true; }
    bool IsDoneAlready(std::size_t place, const MovieStep& step,
                       const host::system::FileState& state) override;
    const char* HowToGoOn() const override;
    void Planned(const MoviePlan& plan) override;
    void Finish(int read, int failed) override;

    catalog::Catalog& catalog();
    void Add(const std::filesystem::path& movie, catalog::Entry entry, bool hasFailed);
    void Write();
    std::size_t RemoveGone();
    void PutIntoPlace();

    const CatalogOptions& options_;
    const std::string settings_;
    CodecReader codecs_;
    RowsOfMovies rows_;
    std::optional<NewCatalog> made_;
    std::optional<catalog::Catalog> updated_;
    std::vector<catalog::Entry> waiting_;
    std::chrono::steady_clock::time_point written_ = std::chrono::steady_clock::now();
};

// Writes a catalog of what several have. One that can't be read is told, and the rest is written,
// unless a catalog is there that would lose by that. Gives the status; throws a Failure where
// nothing can be written.
int MergeCatalogs(const std::vector<std::filesystem::path>& catalogs,
                  const std::filesystem::path& output, int verbosity);

}  // namespace cliphost
