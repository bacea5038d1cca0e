// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// What a catalog of a folder costs, in processor time of whole calls, beside saving an AAF file for
// each of its movies; what an update costs where nothing has changed, and what it costs to merge
// two halves. And how long whole calls of `cliphost find` take in a catalog of 100,000 movies.

#include <benchmark/benchmark.h>

#include <chrono>
#include <filesystem>
#include <string>
#include <vector>

#include "benchmarks/growth/TimedCommand.h"
#include "benchmarks/support/Brief.h"
#include "benchmarks/support/Ratios.h"
#include "benchmarks/support/ShortMovies.h"
#include "reference_host/catalog/Catalog.h"
#include "tests/support/TestFolder.h"

namespace {

namespace fs = std::filesystem;
using Arguments = std::vector<std::string>;

const int kMovies = Sized(1000, 20);
const int kRows = Sized(100'000, 200);

const TestFolder& Folder() {
    static const TestFolder folder;
    return folder;
}

std::string In(const std::string& name) {
    return (Folder() / name).string();
}

std::string Movies() {
    static const std::string path = [] {
        fs::create_directory(Folder() / "movies");
        WriteShortMovies(Folder() / "movies", kMovies);
        return In("movies");
    }();
    return path;
}

// Codecs, rates, reels and the like that follow one another; one movie in a hundred has alpha.
catalog::Entry MadeUp(int number) {
    const std::string text = std::to_string(number);
    const bool isProRes = number % 3 != 0;
    catalog::Entry entry;
    entry["movies"] = {
        {{"id", text},
         {"path", "/media/day" + std::to_string(number / 1000) + "/A" + text + "_C001.mov"},
         {"name", "A" + text + "_C001"},
         {"size", std::to_string(1'000'000 + number)},
         {"date", text},
         {"looked", text},
         {"settings", "none"},
         {"failed", "0"},
         {"route", "header"},
         {"master_mob", std::to_string(number - number % 50 / 49)},
         {"rate_numerator", number % 2 == 0 ? "25" : "30000"},
         {"rate_denominator", number % 2 == 0 ? "1" : "1001"},
         {"length", "250"},
         {"start", "10:00:00:00"},
         {"codec", isProRes ? "apcn" : "avc1"},
         {"codec_name", isProRes ? "Apple ProRes 422" : "H.264"},
         {"width", "1920"},
         {"height", "1080"},
         {"alpha", number % 100 == 0 ? "1" : "0"},
         {"channels", "2"}}};
    entry["tracks"] = {{{"number", "0"},
                        {"kind", "picture"},
                        {"codec", isProRes ? "apcn" : "avc1"},
                        {"codec_name", isProRes ? "Apple ProRes 422" : "H.264"}}};
    entry["columns"] = {
        {{"place", "0"}, {"name", "Reel"}, {"value", "R" + std::to_string(number % 500)}},
        {{"place", "1"}, {"name", "Comment"}, {"value", "take " + std::to_string(number % 17)}}};
    return entry;
}

std::string LargeCatalog() {
    static const std::string path = [] {
        catalog::Catalog catalog(Folder() / "large.sqlite", catalog::Catalog::For::Making);
        std::vector<catalog::Entry> entries;
        for (int i = 0; i < kRows; ++i) {
            entries.push_back(MadeUp(i));
            if (entries.size() == 1000 || i + 1 == kRows) {
                catalog.Put(entries);
                entries.clear();
            }
        }
        return In("large.sqlite");
    }();
    return path;
}

Arguments Call(const Arguments& arguments) {
    const fs::path build = fs::read_symlink("/proc/self/exe").parent_path().parent_path();
    Arguments command = {(build / "cliphost").string()};
    command.insert(command.end(), arguments.begin(), arguments.end());
    return command;
}

// Of processor time, its child processes' included.
void Time(benchmark::State& state, const Arguments& arguments) {
    for (auto _ : state) {
        const double seconds = SecondsOf(Call(arguments));
        if (seconds < 0) {
            state.SkipWithError("the command failed");
            return;
        }
        state.SetIterationTime(seconds);
    }
}

void DescribeEach(benchmark::State& state) {
    Time(state, {"describe", "-q", Movies(), "--out-dir", In("saved")});
}

void CatalogFolder(benchmark::State& state) {
    Time(state, {"catalog", Movies(), "-o", In("all.sqlite")});
}

void UpdateNothing(benchmark::State& state) {
    const Arguments update = {"catalog", Movies(), "-o", In("updated.sqlite"), "--update"};
    SecondsOf(Call(update));
    Time(state, update);
}

void MergeHalves(benchmark::State& state) {
    for (const char* const half : {"1", "2"}) {
        SecondsOf(Call({"catalog", Movies(), "-o", In(half), "--shard", half + std::string("/2")}));
    }
    Time(state, {"catalog", "--merge", In("1"), In("2"), "-o", In("merged.sqlite")});
}

struct Question {
    const char* name;
    const char* query;
    int status = 0;
};
constexpr Question kQuestions[] = {
    {"FindByAll", "codec:prores rate:25 alpha:yes"},
    {"FindWord", "A47*"},
    {"FindReel", "reel:R17"},
    {"FindTimecode", "tc:<09:00", 1},
    {"FindNone", "nowhere", 1},
};

// Of the clock, since somebody waits.
void Find(benchmark::State& state, const Question& question) {
    const Arguments find = Call({"find", LargeCatalog(), question.query});
    for (auto _ : state) {
        const auto start = std::chrono::steady_clock::now();
        const bool isDone = SecondsOf(find, question.status) >= 0;
        const std::chrono::duration<double> took = std::chrono::steady_clock::now() - start;
        if (!isDone) {
            state.SkipWithError("the command failed");
            return;
        }
        state.SetIterationTime(took.count());
    }
}

void Manual(benchmark::internal::Benchmark* made) {
    made->Repetitions(Sized(5, 1))->UseManualTime()->Unit(benchmark::kMillisecond);
}

}  // namespace

int main(int argc, char** argv) {
    for (const auto& [name, work] :
         std::vector<std::pair<const char*, void (*)(benchmark::State&)>>{
             {"DescribeEach", DescribeEach},
             {"CatalogFolder", CatalogFolder},
             {"UpdateNothing", UpdateNothing},
             {"MergeHalves", MergeHalves}}) {
        Manual(benchmark::RegisterBenchmark(name, work));
    }
    std::vector<Pair> pairs = {{"CatalogFolder", "DescribeEach", TimesAtMost(1.0)},
                               {"UpdateNothing", "CatalogFolder", TimesAtMost(0.1)},
                               {"MergeHalves", "CatalogFolder", TimesAtMost(0.5)}};
    for (const Question& question : kQuestions) {
        Manual(benchmark::RegisterBenchmark(
            question.name, [&question](benchmark::State& state) { Find(state, question); }));
        pairs.push_back({question.name, "", SecondsAtMost(0.05)});
    }
    return RunWithRatios(argc, argv, pairs);
}
