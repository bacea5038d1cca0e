// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/ReportRun.h"

#include <fmt/chrono.h>
#include <fmt/format.h>

#include <ctime>
#include <fstream>
#include <utility>

#include "host_interfaces/Version.h"
#include "reference_host/cliphost/CatalogFile.h"
#include "reference_host/cliphost/JsonAnswer.h"
#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/cliphost/MapOption.h"
#include "reference_host/cliphost/Notice.h"
#include "reference_host/cliphost/OptionChecks.h"
#include "reference_host/cliphost/ReportClip.h"
#include "reference_host/cliphost/ReportOdd.h"
#include "reference_host/cliphost/ReportShape.h"
#include "reference_host/cliphost/Words.h"
#include "reference_host/framework/HostPath.h"
#include "reference_host/system/Paths.h"
#include "reference_host/util/text/FileUrl.h"
#include "reference_host/util/text/Printable.h"

namespace cliphost {
namespace {

using Json = nlohmann::ordered_json;

constexpr char kEndingOfFolder[] = "_files";
constexpr std::int64_t kNanoseconds = 1'000'000'000;

const DescriptionForm& FormOfClip() {
    static const DescriptionForm form = [] {
        DescriptionForm json;
        json.json = true;
        json.hasNumbers = true;
        return json;
    }();
    return form;
}

// "2026-01-31T12:00:00Z"
std::string TimeText(std::time_t seconds) {
    return fmt::format("{:%Y-%m-%dT%H:%M:%SZ}", fmt::gmtime(seconds));
}

bool IsDatabase(const std::filesystem::path& file) {
    constexpr std::string_view kMark = "SQLite format 3";
    char start[kMark.size()] = {};
    std::ifstream(file, std::ios::binary).read(start, sizeof start);
    return std::string_view(start, sizeof start) == kMark;
}

// What becomes of bytes that are no UTF-8 is the JSON writer's to say.
std::string Dumped(const Json& json) {
    return json.dump(-1, ' ', false, Json::error_handler_t::replace);
}

std::string TitleOf(const ReportOptions& options) {
    if (!options.title.empty()) {
        return host::text::Printable(options.title);
    }
    const std::vector<std::filesystem::path>& paths = options.movies.paths;
    if (paths.size() != 1) {
        return "Report of movies";
    }
    const std::filesystem::path whole = AbsolutePath(paths[0]);
    return host::DisplayPath(whole.has_filename() ? whole.filename()
                                                  : whole.parent_path().filename());
}

}  // namespace

std::string AdviceOnSize(std::uint64_t bytes, bool isSplit) {
    constexpr std::uint64_t kMostBytes = 60'000'000;
    return isSplit || bytes <= kMostBytes
               ? std::string()
               : fmt::format(
                     "it has {:.0f} MB; --split makes a smaller one, with the pictures in a folder "
                     "beside it",
                     static_cast<double>(bytes) / 1e6);
}

void TakeCatalogs(ReportOptions& options) {
    std::vector<std::filesystem::path> paths;
    for (const std::filesystem::path& path : options.movies.paths) {
        std::error_code ignored;
        if (!std::filesystem::is_regular_file(path, ignored) || !IsDatabase(path)) {
            paths.push_back(path);
            continue;
        }
        options.title = options.title.empty() && options.movies.paths.size() == 1
                            ? host::DisplayPath(path.filename())
                            : options.title;
        options.catalogs.push_back({path, OpenCatalog(path, catalog::Catalog::For::Reading)});
        WithCatalog(path, [&] {
            ReportOptions::NamedCatalog& named = options.catalogs.back();
            catalog::Statement select =
                named.catalog.database().Prepare("SELECT path FROM movies ORDER BY path");
            for (; select.Step(); ++named.movies) {
                paths.push_back(PathOfMachinePath(select.Text(0)));
            }
        });
    }
    options.movies.paths = std::move(paths);
}

ReportRun::ReportRun(Session& session, ReportOptions& options)
    : MoviesRun(session, options.movies, "reading", ".html"),
      options_(options),
      maps_(options.maps),
      codecs_(session) {
    const std::filesystem::path& file = options.movies.together;
    if (options.json) {
        return;
    }
    std::error_code ignored;
    takesPlace_ = std::filesystem::exists(file, ignored);
    output_.emplace(file);
    if (options.isSplit) {
        std::filesystem::path folder = file;
        folder.replace_filename(file.stem());
        pictures_.emplace(folder += kEndingOfFolder);
    }
    page_.emplace(
        [this](std::string_view text) {
            output_->Write(text.data(), text.size());
            written_ += text.size();
        },
        report::Page::Form{TitleOf(options), options.isSplit});
}

// The page takes its place when all was read, so nothing that is read may lie there.
void ReportRun::Planned(const MoviePlan& plan) {
    const std::filesystem::path& page = options_.movies.together;
    std::vector<CallFile> read = {{"the list of movies", options_.movies.list}};
    for (const ReportOptions::NamedCatalog& one : options_.catalogs) {
        read.push_back({"a catalog that the page is made from", one.file});
    }
    RefuseOutputOnto(page, read);
    RefuseOntoMovie(page);
    for (const ReportOptions::NamedCatalog& one : options_.catalogs) {
        if (one.movies == 0) {
            TellAlso(Failure(kExitFile, one.file, "the catalog holds no movie",
                             "`cliphost catalog FOLDER -o FILE` puts movies into one"));
        }
    }
    RefuseCatalogsOfList(plan);
}

// No movie begins as they do; without a list those of the call were taken already.
void ReportRun::RefuseCatalogsOfList(const MoviePlan& plan) {
    for (std::size_t i = 0; !options_.movies.list.empty() && i < plan.size(); ++i) {
        const MovieStep step = plan[i];
        if (step.IsMovie() && IsDatabase(step.movie)) {
            RefuseMovie(i, Failure(kExitCaller, step.movie,
                                   "this is a database, such as a catalog, and no movie",
                                   "name a catalog on the command line, not in a list"));
        }
    }
}

MovieAnswer ReportRun::Answer(const MovieStep& step, const PlaceOfFile&) {
    return ReportAnswer(session(), codecs_, options_.maps, step.movie);
}

bool ReportRun::ReadAnswer(const std::string& bytes, MovieAnswer& answer) {
    return FromBytes(bytes, FormOfClip(), answer);
}

void ReportRun::Show(const std::filesystem::path& movie, const MovieAnswer& answer,
                     const std::filesystem::path&) {
    maps_.AddUsed(answer.mapsUsed);
    Add(movie, ClipFrom(answer.description), false);
}

std::optional<catalog::Entry> ReportRun::EntryInCatalogs(const std::filesystem::path& movie) {
    for (ReportOptions::NamedCatalog& one : options_.catalogs) {
        if (auto entry = one.catalog.Read(AbsoluteMachinePath(movie))) {
            return entry;
        }
    }
    return std::nullopt;
}

void ReportRun::ShowFailure(const std::filesystem::path& movie, const Problem& problem) {
    if (notWritten_) {
        throw Failure(*notWritten_);
    }
    std::error_code ignored;
    if (std::filesystem::is_directory(movie, ignored)) {
        return;  // of movies, there are none in it
    }
    const auto known = EntryInCatalogs(movie);
    Json clip =
        known ? ClipOf(*known) : Json{{"facts", Json::object()}, {"details", Json::object()}};
    Json& facts = clip["facts"];
    facts["route"] = problem.route.empty() ? route::kNone : problem.route;
    Json warnings = Json::array({WarningOf(problem, "failure")});
    for (Json& before : facts["warnings"]) {
        warnings.push_back(std::move(before));
    }
    facts["warnings"] = std::move(warnings);
    Add(movie, std::move(clip), true);
}

// Sets what a movie is as a file.
void ReportRun::AddFile(const std::filesystem::path& movie, Json& facts) {
    const std::filesystem::path whole = AbsolutePath(movie);
    facts["path"] = MachinePath(whole);
    facts["file"] = host::DisplayPath(whole.filename());
    facts["folder"] = host::DisplayPath(whole.parent_path());
    std::string url = host::system::UrlOfPath(whole);
    if (maps_.MapToOther(url)) {
        facts["place"] = url;
    }
    if (const auto state = StateBefore()) {
        facts["size"] = state->size;
        facts["date"] = TimeText(static_cast<std::time_t>(state->date / kNanoseconds));
    }
}

void ReportRun::Add(const std::filesystem::path& movie, Json clip, bool hasFailed) {
    Json& facts = clip["facts"];
    Json& details = clip["details"];
    AddFile(movie, facts);
    facts["failed"] = hasFailed;
    facts.emplace("name", host::DisplayPath(movie.stem()));
    for (const char* const list : {"traits", "warnings"}) {
        facts.emplace(list, Json::array());
    }
    if (options_.json) {
        facts["details"] = std::move(details);
    } else {
        Write(facts, details);
    }
    clips_.push_back(std::move(facts));
}

void ReportRun::Write(Json& facts, Json& details) {
    try {
        TakePictures(facts, details);
        page_->AddClip(clips_.size(), Dumped(details));
    } catch (const Failure& failure) {
        notWritten_ = failure;
        throw;
    }
}

void ReportRun::TakePictures(Json& facts, Json& details) {
    if (!pictures_) {
        return;
    }
    for (const auto& [owner, name] : {std::pair(&facts, "poster"), std::pair(&details, "strip")}) {
        if (const auto picture = owner->find(name); picture != owner->end()) {
            pictures_->Take(*picture, clips_.size(), name);
        }
    }
}

void ReportRun::WritePage() {
    Json document = {{"title", TitleOf(options_)},
                     {"made", TimeText(std::time(nullptr))},
                     {"program", "cliphost " PRODUCT_VERSION_TEXT},
                     {"isWhole", !IsStopped()}};
    Json odd = OddThings(clips_);
    document["clips"] = std::move(clips_);
    document["odd"] = std::move(odd);
    if (options_.json) {
        PrintJson(schema::kReport, std::move(document));
        return;
    }
    const std::size_t count = document["clips"].size();
    page_->End(Dumped(WithSchema(schema::kReport, std::move(document))));
    if (pictures_) {
        pictures_->PutIntoPlace();
    }
    output_->Finish();
    if (pictures_) {
        pictures_->PageIsInPlace();
    }
    if (!host::system::IsStandardOutput(options_.movies.together)) {
        fmt::print("{}: {}, {:.1f} MB\n", host::DisplayPath(options_.movies.together),
                   Counted(count, "clip"), static_cast<double>(written_) / 1e6);
    }
    if (const std::string advice = AdviceOnSize(written_, options_.isSplit); !advice.empty()) {
        Notice("cliphost: {}: {}\n", host::DisplayPath(options_.movies.together), advice);
    }
}

void ReportRun::TellUnusedMaps(int read) {
    if (read > 0 && !IsStopped() && options_.movies.shard.IsWhole()) {
        for (const Failure& unused :
             UnusedMaps(maps_, "give FROM as the locators of `cliphost describe` begin")) {
            TellAlso(unused);
        }
    }
}

void ReportRun::Finish(int read, int) {
    const std::filesystem::path& file = options_.movies.together;
    if (!options_.json && clips_.empty()) {
        TellAlso(Failure(kExitFile, file, "not written: there is no movie to show"));
    } else if (IsStopped() && takesPlace_) {
        TellAlso(Failure(kExitFile, file, "left as it was: not all movies were read"));
    } else {
        WritePage();
    }
    pictures_.reset();  // a signal that was held back ends the program soon
    TellUnusedMaps(read);
}

}  // namespace cliphost
