// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/CatalogRun.h"

#include <fmt/format.h>

#include <algorithm>

#include "reference_host/cliphost/Describe.h"
#include "reference_host/cliphost/Digest.h"
#include "reference_host/cliphost/GoneMovies.h"
#include "reference_host/cliphost/JsonAnswer.h"
#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/cliphost/MovieThumbnail.h"
#include "reference_host/cliphost/Notice.h"
#include "reference_host/cliphost/RouteTaken.h"
#include "reference_host/cliphost/Words.h"
#include "reference_host/framework/HostPath.h"
#include "reference_host/system/Paths.h"
#include "text/Encodings.h"

namespace cliphost {
namespace {

using catalog::Catalog;

// So many movies, or those of so long, are lost at most where a program is killed that updates.
constexpr std::size_t kMostWaiting = 256;
constexpr std::chrono::seconds kLongestUnwritten{2};

// It comes from the path alone, so that every run and every share gives a movie the same.
std::string NumberOfMovie(const std::string& path) {
    return std::to_string(FirstBitsOf(DigestOf(path)) >> 1);  // SQLite's have 63 bits above nought
}

// As descriptions have it: bytes that are no UTF-8 are U+FFFD.
std::string NameOfClip(const std::filesystem::path& movie) {
    std::u32string name = encodings::FromUtf8(host::system::PathText(movie.stem()));
    std::replace_if(name.begin(), name.end(), encodings::IsSurrogate, U'\uFFFD');
    return encodings::ToUtf8Lossy(name);
}

std::string Now() {
    const auto now = std::chrono::system_clock::now().time_since_epoch();
    return std::to_string(std::chrono::nanoseconds(now).count());
}

const DescriptionForm& FormOfAnswer() {
    static const DescriptionForm form = [] {
        DescriptionForm json;
        json.json = true;
        return json;
    }();
    return form;
}

// A movie is what it is without its picture, too.
void TakeThumbnail(Session& session, const std::filesystem::path& movie, catalog::Entry& entry) {
    try {
        if (const std::optional<Picture> picture = ThumbnailOf(session, movie)) {
            AddThumbnail(*picture, entry);
        }
    } catch (const Failure& failure) {
        Problem problem = failure.problem();
        problem.reason = "no thumbnail: " + problem.reason;
        TellProblem(problem, session.verbosity());
        entry["warnings"].push_back(WarningRow(problem, "thumbnail", entry["warnings"].size()));
    }
}

}  // namespace

MovieAnswer CatalogAnswer(Session& session, CodecReader& codecs, const CatalogForm& form,
                          const Description& description) {
    MovieAnswer answer = StartAnswer(session, description);
    if (!description.file) {
        return answer;
    }
    TellRoute(description.movie, session.verbosity());
    WriteColumns(session, description, form.columns);
    catalog::Entry entry = EntryOf(description, codecs);
    if (form.thumbnails) {
        TakeThumbnail(session, description.movie, entry);
    }
    answer.description = ToJson(entry);
    return answer;
}

CatalogRun::CatalogRun(Session& session, const CatalogOptions& options)
    : MoviesRun(session, options.movies, "cataloguing", ".sqlite"),
      options_(options),
      settings_(SettingsText(session, options.movies.workers.arguments)),
      codecs_(session),
      rows_(options.form.columns) {
    const std::filesystem::path& file = options.movies.together;
    std::error_code ignored;
    if (options.update && std::filesystem::exists(file, ignored)) {
        updated_.emplace(OpenCatalog(file, Catalog::For::Changing));
        return;
    }
    made_.emplace(file);
    if (options.update) {
        made_->FinishIfFree();  // other runs may begin at the same time
        made_.reset();
        updated_.emplace(OpenCatalog(file, Catalog::For::Changing));
    }
}

Catalog& CatalogRun::catalog() {
    return made_ ? made_->catalog() : *updated_;
}

MovieAnswer CatalogRun::Answer(const MovieStep& step, const PlaceOfFile&) {
    return CatalogAnswer(session(), codecs_, options_.form, DescriptionOf(step));
}

bool CatalogRun::ReadAnswer(const std::string& bytes, MovieAnswer& answer) {
    return FromBytes(bytes, FormOfAnswer(), answer);
}

void CatalogRun::Show(const std::filesystem::path& movie, const MovieAnswer& answer,
                      const std::filesystem::path&) {
    Add(movie, EntryFrom(answer.description), false);
    if (options_.lines) {
        PrintMovieLine(schema::kCatalogLine, movie,
                       {{"output", MachinePath(options_.movies.together)}});
    }
}

void CatalogRun::ShowDone(const std::filesystem::path& movie, const std::filesystem::path&) {
    if (options_.lines) {
        PrintMovieLine(schema::kCatalogLine, movie,
                       {{"output", MachinePath(options_.movies.together)}, {"doneAlready", true}});
    }
}

void CatalogRun::ShowFailure(const std::filesystem::path& movie, const Problem& problem) {
    catalog::Entry entry;
    catalog::Row& row = entry["movies"].emplace_back();
    if (!problem.route.empty()) {
        row["route"] = problem.route;
    }
    entry["warnings"].push_back(WarningRow(problem, "failure", 0));
    Add(movie, std::move(entry), true);
    if (options_.lines) {
        PrintFailureLine(schema::kCatalogLine, movie, problem);
    }
}

void CatalogRun::Add(const std::filesystem::path& movie, catalog::Entry entry, bool hasFailed) {
    const auto state = StateBefore();
    if (!state) {
        return;  // nothing is there
    }
    catalog::Row& row = entry["movies"].front();
    const std::string path = AbsoluteMachinePath(movie);
    row["id"] = NumberOfMovie(path);
    row["path"] = path;
    row.emplace("name", NameOfClip(movie));
    row["size"] = std::to_string(state->size);
    row["date"] = std::to_string(state->date);
    row["looked"] = Now();
    row["settings"] = settings_;
    row["failed"] = hasFailed ? "1" : "0";
    waiting_.push_back(std::move(entry));
    if (waiting_.size() >= kMostWaiting ||
        std::chrono::steady_clock::now() - written_ > kLongestUnwritten) {
        Write();
    }
}

// What goes wrong here ends the run: no further movie would fare better.
void CatalogRun::Write() {
    if (!waiting_.empty()) {
        catalog().Put(waiting_);
    }
    waiting_.clear();
    written_ = std::chrono::steady_clock::now();
}

bool CatalogRun::IsDoneAlready(std::size_t, const MovieStep& step,
                               const host::system::FileState& state) {
    const auto known = updated_
                           ? updated_->Find(AbsoluteMachinePath(std::filesystem::path(step.movie)))
                           : std::nullopt;
    return known && !known->hasFailed && known->size == state.size && known->date == state.date &&
           known->settings == settings_;
}

const char* CatalogRun::HowToGoOn() const {
    return made_ && made_->TakesPlace() ? "; the catalog is left as it was"
                                        : "; the same call with --update goes on";
}

std::size_t CatalogRun::RemoveGone() {
    const std::vector<std::string> gone = GoneMovies(options_.movies, plan(), catalog());
    for (const std::string& path : gone) {
        Notice("cliphost: {}: is gone, and is removed from the catalog\n",
               host::DisplayPath(PathOfMachinePath(path)));
    }
    if (!gone.empty()) {
        catalog().Remove(gone);
    }
    return gone.size();
}

// One that is there stays where this one has only a part of the movies, or none: a disk may be
// away.
void CatalogRun::PutIntoPlace() {
    if (made_->TakesPlace() && IsStopped()) {
        return;
    }
    if (made_->TakesPlace() && catalog().Count() == 0) {
        const Failure kept(kExitFile, options_.movies.together,
                           "no movie was found; the catalog is left as it was");
        TellAlso(kept);
        if (options_.lines) {
            PrintFailureLine(schema::kCatalogLine, {}, kept.problem());
        }
        return;
    }
    made_->Finish();
}

void CatalogRun::Planned(const MoviePlan& plan) {
    rows_.Find(plan, [](std::size_t, std::size_t, const Failure& why) { throw why; });
}

void CatalogRun::Finish(int read, int failed) {
    Write();
    const std::size_t gone = updated_ && !IsStopped() ? RemoveGone() : 0;
    if (made_) {
        PutIntoPlace();
    }
    if (options_.movies.shard.IsWhole()) {
        rows_.TellUnused();
    }
    if (options_.lines) {
        return;
    }
    std::string summary = fmt::format("{} catalogued, {} not", read, failed);
    if (updated_) {
        summary += fmt::format(", {} as before, {} gone", doneBefore(), gone);
    }
    fmt::print("{}\n", summary);
}

namespace {

// Throws a Failure where that catalog is at fault, and what the library says where the merged one
// is.
void TakeCatalog(const std::filesystem::path& file, Catalog& merged) {
    Catalog part = OpenCatalog(file, Catalog::For::Reading);
    try {
        merged.Take(part);
    } catch (const catalog::DatabaseError& error) {
        if (error.file() != file) {
            throw;
        }
        throw CatalogFailure(file, error);
    }
}

}  // namespace

int MergeCatalogs(const std::vector<std::filesystem::path>& catalogs,
                  const std::filesystem::path& output, int verbosity) {
    NewCatalog merged(output);
    int status = kExitFine;
    std::size_t read = 0;
    WithCatalog(output, [&] {
        for (const std::filesystem::path& file : catalogs) {
            try {
                TakeCatalog(file, merged.catalog());
                ++read;
            } catch (const Failure& failure) {
                status = std::max(status, failure.status());
                TellProblem(failure.problem(), verbosity);
            }
        }
    });
    if (status != kExitFine && (read == 0 || merged.TakesPlace())) {
        Notice("cliphost: {}: {}\n", host::DisplayPath(output),
               merged.TakesPlace() ? "the catalog is left as it was" : "not written");
        return status;
    }
    const auto movies =
        WithCatalog(output, [&] { return static_cast<std::uint64_t>(merged.catalog().Count()); });
    merged.Finish();
    fmt::print("{} of {}\n", Counted(movies, "movie"), Counted(read, "catalog"));
    return status;
}

}  // namespace cliphost
