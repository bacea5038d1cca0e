// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/DescribeRun.h"

#include <fmt/format.h>

#include <nlohmann/json.hpp>

#include "reference_host/cliphost/AafClips.h"
#include "reference_host/cliphost/AafValue.h"
#include "reference_host/cliphost/ComparisonReport.h"
#include "reference_host/cliphost/CsvTable.h"
#include "reference_host/cliphost/JsonAnswer.h"
#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/cliphost/MapOption.h"
#include "reference_host/cliphost/Notice.h"
#include "reference_host/cliphost/OptionChecks.h"
#include "reference_host/cliphost/OutputFile.h"
#include "reference_host/cliphost/Stringout.h"
#include "reference_host/cliphost/Words.h"
#include "reference_host/cliphost/WrittenTable.h"
#include "reference_host/framework/HostPath.h"
#include "reference_host/system/Paths.h"

namespace cliphost {
namespace {

using host::DisplayPath;
using nlohmann::ordered_json;

constexpr std::size_t kRoomForEnds = 64;
constexpr char kEndingOfOutputs[] = ".aaf";

// An entry of a list in JSON. `description` is JSON already.
std::string EntryText(const ordered_json& head, const std::string& description) {
    std::string text = InLines(head, 2);
    if (!description.empty()) {
        constexpr std::string_view kEnd = "\n  }";
        text.reserve(text.size() + description.size() + kRoomForEnds);
        text.resize(text.size() - kEnd.size());
        text += ",\n    \"description\": ";
        text += description;
        text += kEnd;
    }
    return text;
}

}  // namespace

DescribeRun::DescribeRun(Session& session, const DescribeOptions& options)
    : MoviesRun(session, options.movies, "describing", kEndingOfOutputs),
      options_(options),
      maps_(options.form.maps),
      rows_(options.form.columns) {
    if (!options.movies.together.empty()) {
        session.aaf().TryToSave(options.movies.together);
    }
    if (!options.against.empty()) {
        against_ = session.aaf().Open(options.against);
    }
    if (!options.movies.together.empty() || against_) {
        bin_.emplace(session.aaf());
    }
}

void DescribeRun::RefuseOutputsOntoOthers() const {
    const MoviesOptions& movies = options_.movies;
    const std::filesystem::path& table = options_.form.columnsOut;
    const std::vector<CallFile> read = {{"the list of movies", movies.list},
                                        {"the table of --columns", options_.form.columns.file},
                                        {"the settings file", options_.settingsFile},
                                        {"the file of --against", options_.against}};
    RefuseOutputOnto(movies.file, read);
    RefuseOutputOnto(movies.together, read);
    RefuseOutputOnto(table, read);
    RefuseOutputOnto(table, {{"the file of --aaf", movies.file}, {"the bin", movies.together}});
    // The names of the outputs are found one after the other.
    if (!table.empty() && !movies.outFolder.empty() &&
        InSmallLetters(host::system::PathText(table.extension())) == kEndingOfOutputs &&
        IsPlaceOf(host::system::WholePath(table).parent_path(), movies.outFolder)) {
        throw Failure(kExitCaller, table, "a movie's output may have this name",
                      "give the table another ending or folder");
    }
}

// Which rows are for which movies is known before anything is read.
void DescribeRun::Planned(const MoviePlan& plan) {
    RefuseOutputsOntoOthers();
    const std::filesystem::path& written = options_.form.columnsOut;
    RefuseOntoMovie(written);
    rows_.Find(plan, [&](std::size_t one, std::size_t other, const Failure& why) {
        if (options_.movies.names == nullptr) {
            throw why;
        }
        // A row of movies that come one after the other may be clear for all others.
        RefuseMovie(one, why);
        RefuseMovie(other, why);
    });
    // Who reads from a pipe would take the end of a trial for that of the table.
    if (!written.empty() && !OutputFile::IsDevice(written)) {
        OutputFile(written).TryPlace();
    }
}

void DescribeRun::WriteColumns() const {
    const std::filesystem::path& file = options_.form.columnsOut;
    if (IsStopped()) {
        throw Failure(kExitFile, file, "not written: not all movies were read");
    }
    WrittenTable table;
    for (const auto& [movie, values] : columns_) {
        table.AddNames(values);
    }
    OutputFile out(file);
    const auto write = [&](const std::vector<std::string>& cells) {
        const std::string line = CsvLine(cells);
        out.Write(line.data(), line.size());
    };
    write(table.header());
    for (const auto& [movie, values] : columns_) {
        write(table.Cells(AbsoluteMachinePath(movie), values));
    }
    out.Finish();
    const auto tellLeftOut = [&](std::size_t count, const char* thing, const std::string& why) {
        if (count > 0) {
            Notice("cliphost: {}: {} left out: {}\n", DisplayPath(file), Counted(count, thing),
                   why);
        }
    };
    tellLeftOut(table.columnsLeftOut(), "column",
                fmt::format("a table has {} at most", kMostCells));
    tellLeftOut(table.valuesLeftOut(), "value",
                fmt::format("a cell has {} bytes at most", kLongestCell));
}

MovieAnswer DescribeRun::Answer(const MovieStep& step, const PlaceOfFile& place) {
    const Description description = DescriptionOf(step);
    const MovieAnswer answer = AnswerOf(session(), description, options_.form, place);
    if (bin_ && description.file) {
        AddToBin(description.file.get(), step.movie);
    }
    return answer;
}

void DescribeRun::Collect(const std::filesystem::path& movie, const std::filesystem::path& file) {
    AddToBin(session().aaf().Open(file).get(), movie);
}

void DescribeRun::AddToBin(IAAFFile* description, const std::filesystem::path& movie) {
    copyOf_ = bin_->Add(description, movie);
    if (!copyOf_.empty()) {
        Notice("cliphost: {}: has the content of {}; one clip of the bin names both\n",
               DisplayPath(movie), DisplayPath(copyOf_));
    }
}

// Without a clip nothing is saved, nor is a part of the clips.
void DescribeRun::SaveBin() {
    const std::filesystem::path& file = options_.movies.together;
    if (IsStopped()) {
        throw Failure(kExitFile, file, "not written: not all movies were read");
    }
    if (bin_->clips().empty()) {
        throw Failure(kExitFile, file, "not written: no movie was described");
    }
    if (options_.stringout) {
        AddStringout(session().aaf(), *bin_, host::system::PathText(file.stem()),
                     options_.editorRate);
    }
    bin_->Save(file);
}

void DescribeRun::AddEntry(const ordered_json& head, const std::string& description) {
    std::string entry = EntryText(WithSchema(schema::kDescribe, head), description);
    if (options_.form.lines) {
        PrintJsonLine(entry);
    } else {
        entries_.push_back(std::move(entry));
    }
}

bool DescribeRun::ReadAnswer(const std::string& bytes, MovieAnswer& answer) {
    return FromBytes(bytes, options_.form, answer);
}

void DescribeRun::ShowFailure(const std::filesystem::path& movie, const Problem& problem) {
    if (against_) {
        failures_.emplace(AbsolutePath(movie), problem.reason);
    }
    if (options_.form.json) {
        ordered_json head = {{"movie", MachinePath(movie)}};
        AddProblem(problem, head);
        AddEntry(head, "");
    }
}

void DescribeRun::ShowDone(const std::filesystem::path& movie, const std::filesystem::path& saved) {
    if (options_.form.json) {
        AddEntry(
            {{"movie", MachinePath(movie)}, {"aaf", MachinePath(saved)}, {"doneAlready", true}},
            "");
    }
}

void DescribeRun::Show(const std::filesystem::path& movie, const MovieAnswer& answer,
                       const std::filesystem::path& saved) {
    maps_.AddUsed(answer.mapsUsed);
    if (!options_.form.columnsOut.empty()) {
        columns_.emplace_back(movie.native(), answer.columns);
    }
    if (host::system::IsStandardOutput(saved)) {
        return;
    }
    if (!options_.form.json) {
        fmt::print("{}{}\n{}", DisplayPath(movie), saved.empty() ? "" : " -> " + DisplayPath(saved),
                   answer.description);
        return;
    }
    ordered_json head = {{"movie", MachinePath(movie)}};
    if (!saved.empty()) {
        head["aaf"] = MachinePath(saved);
    }
    if (!copyOf_.empty()) {
        head["copyOf"] = MachinePath(copyOf_);
    }
    if (answer.problem) {
        AddProblem(answer.problem, head);
    }
    head["route"] = answer.route;
    if (!answer.routeReason.empty()) {
        head["routeReason"] = answer.routeReason;
    }
    AddEntry(head, answer.description);
}

Problem DescribeRun::WhyNotCompared() const {
    if (IsStopped()) {
        return {options_.against, "not compared: not all movies were read"};
    }
    return bin_->clips().empty() ? Problem{options_.against, "not compared: no movie was described"}
                                 : Problem{};
}

// Null where neither the movie failed nor a folder that it lies in.
const std::string* DescribeRun::WhyFailed(const std::filesystem::path& movie) const {
    for (std::filesystem::path path = movie; path.has_relative_path(); path = path.parent_path()) {
        if (const auto failure = failures_.find(path); failure != failures_.end()) {
            return &failure->second;
        }
    }
    return nullptr;
}

// Those of clips whose locators name a movie that failed.
UnknownMobs DescribeRun::MobsOfFailures() const {
    UnknownMobs mobs;
    if (failures_.empty()) {
        return mobs;
    }
    PathMaps maps = options_.form.maps;
    for (const AafClip& clip : ClipsOf(against_.get())) {
        for (std::string url : clip.urls) {
            maps.MapToThis(url);
            UrlPlace place;
            const bool isHere = ReadFileUrl(url, place) && place.machine.empty();
            const std::string* const why = isHere ? WhyFailed(AbsolutePath(place.path)) : nullptr;
            if (why == nullptr) {
                continue;
            }
            mobs.emplace(ToText(clip.id), *why);
            for (const aafMobID_t& source : clip.sources) {
                mobs.emplace(ToText(source), *why);
            }
        }
    }
    return mobs;
}

// As if the bin had been saved and was compared then.
void DescribeRun::TellDifferences() {
    if (!options_.form.json) {
        ComparisonLines lines;
        PrintDifferences(lines);
        return;
    }
    ComparisonJson json(
        WithSchema(schema::kDescribe, {{"against", MachinePath(options_.against)}}),
        options_.form.lines ? ComparisonJson::Form::OneLine : ComparisonJson::Form::Lines,
        options_.form.lines ? 0 : 2);
    PrintDifferences(json);
}

template <class Printer>
void DescribeRun::PrintDifferences(Printer& printer) {
    const ComparisonCounts counts = CompareFiles(
        against_.get(), bin_->file(),
        [&](const ComparedObject& object, const TreeDifference& difference) {
            printer.Take(object, difference);
        },
        MobsOfFailures());
    CountStatus(StatusOf(counts));
    printer.Finish(counts);
}

void DescribeRun::Finish(int described, int failed) {
    if (!options_.movies.together.empty()) {
        try {
            SaveBin();
        } catch (const Failure& failure) {
            TellAlso(failure);
            ordered_json head = {{"aaf", MachinePath(options_.movies.together)}};
            AddProblem(failure.problem(), head);
            AddEntry(head, "");
        }
    }
    const Problem whyNot = against_ ? WhyNotCompared() : Problem{};
    if (whyNot) {
        TellAlso(Failure(kExitFile, whyNot));
        ordered_json head = {{"against", MachinePath(options_.against)}};
        AddProblem(whyNot, head);
        AddEntry(head, "");
        against_.Reset();
    }
    const bool isList = options_.form.json && !options_.form.lines;
    if (against_ && !isList) {
        TellDifferences();
    }
    if (!options_.form.columnsOut.empty()) {
        try {
            WriteColumns();
        } catch (const Failure& failure) {
            TellAlso(failure);
        }
    }
    if (options_.movies.shard.IsWhole()) {
        rows_.TellUnused();
    }
    // Movies of which nothing is known here may be those that a rule is for.
    if (doneBefore() == 0 && !IsStopped() && options_.movies.shard.IsWhole() && described > 0) {
        for (const Failure& unused :
             UnusedMaps(maps_, "give FROM as the locators of `cliphost describe` begin")) {
            TellAlso(unused);
        }
    }
    if (!options_.form.json) {
        PrintSummary(described, failed);
    } else if (isList) {
        PrintEntries();
    }
}

// Differences are found while they are printed, so that there may be more than memory.
void DescribeRun::PrintEntries() {
    const char* separator = "[\n";
    for (const std::string& entry : entries_) {
        fmt::print("{}{}", separator, entry);
        separator = ",\n";
    }
    if (against_) {
        fmt::print("{}", separator);
        TellDifferences();
        separator = "";
    }
    fmt::print("{}]\n", entries_.empty() && !against_ ? "[" : "\n");
}

void DescribeRun::PrintSummary(int described, int failed) const {
    const bool isTaken = host::system::IsStandardOutput(options_.movies.file) ||
                         host::system::IsStandardOutput(options_.movies.together);
    if (doneBefore() > 0) {
        fmt::print("{} described, {} not, {} done already\n", described, failed, doneBefore());
    } else if (described + failed != 1 && !isTaken) {
        fmt::print("{} described, {} not\n", described, failed);
    }
}

}  // namespace cliphost
