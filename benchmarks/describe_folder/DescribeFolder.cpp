// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// How long it takes to describe a folder of 1,000 short movies through the
// module's list, beside opening each with libavformat and finding out about its
// streams, in one process; and how long with saving what was described. Tells the
// resident memory after each pass: it must not grow.

#include <benchmark/benchmark.h>
#include <unistd.h>

#include <cstdio>
#include <filesystem>

#include "benchmarks/support/Brief.h"
#include "benchmarks/support/ColdFiles.h"
#include "benchmarks/support/Ratios.h"
#include "benchmarks/support/ShortMovies.h"
#include "host_interfaces/media/PluginComponents.h"
#include "reference_host/cliphost/Describe.h"
#include "reference_host/cliphost/FolderClips.h"
#include "reference_host/cliphost/MovieAnswer.h"
#include "tests/support/TestFolder.h"

extern "C" {
#include <libavformat/avformat.h>
#include <libavutil/log.h>
}

namespace {

const int kMovies = Sized(1000, 20);

const TestFolder& Saved() {
    static const TestFolder folder;
    return folder;
}

const std::filesystem::path& Movies() {
    struct Written {
        Written() { WriteShortMovies(folder.path(), kMovies); }
        TestFolder folder;
    };
    static const Written movies;
    return movies.folder.path();
}

double ResidentMegabytes() {
    long total = 0;
    long resident = 0;
    if (std::FILE* const file = std::fopen("/proc/self/statm", "r")) {
        if (std::fscanf(file, "%ld %ld", &total, &resident) != 2) {
            resident = 0;
        }
        std::fclose(file);
    }
    return static_cast<double>(resident) * static_cast<double>(sysconf(_SC_PAGESIZE)) / 1e6;
}

// Where the description of each movie goes; an empty place is nowhere.
using Place = std::filesystem::path (*)(const cliphost::FolderClip& clip);

void DescribeAll(benchmark::State& state, Place place) {
    cliphost::SessionOptions options;
    options.programFolder =
        std::filesystem::read_symlink("/proc/self/exe").parent_path().parent_path();
    cliphost::Session session(options);
    cliphost::DescriptionForm form;
    form.quiet = true;
    for (auto _ : state) {
        MakeFolderCold(state, Movies());
        const cliphost::FolderClips clips(session, Movies());
        for (const cliphost::FolderClip& clip : clips.clips()) {
            const auto description =
                cliphost::DescribeFromList(session, clips.list(), clip.index, clip.path);
            const auto answer = AnswerOf(session, description, form, [&] { return place(clip); });
            if (answer.status != cliphost::kExitFine) {
                state.SkipWithError(LineOf(answer.problem).c_str());
                return;
            }
        }
    }
    state.SetItemsProcessed(static_cast<std::int64_t>(state.iterations()) * kMovies);
    state.counters["resident_MB"] = ResidentMegabytes();
}

void DescribeFolder(benchmark::State& state) {
    DescribeAll(state, [](const cliphost::FolderClip&) { return std::filesystem::path(); });
}

// As with --out-dir; every pass but the first replaces the files of the one before.
void DescribeAndSaveFolder(benchmark::State& state) {
    DescribeAll(state, [](const cliphost::FolderClip& clip) {
        return Saved() / std::filesystem::path(clip.path).filename().replace_extension(".aaf");
    });
}

void OpenAndFindStreams(benchmark::State& state) {
    av_log_set_level(AV_LOG_QUIET);
    for (auto _ : state) {
        MakeFolderCold(state, Movies());
        for (const auto& entry : std::filesystem::directory_iterator(Movies())) {
            AVFormatContext* context = nullptr;
            if (avformat_open_input(&context, entry.path().c_str(), nullptr, nullptr) < 0 ||
                avformat_find_stream_info(context, nullptr) < 0) {
                state.SkipWithError("libavformat does not open a movie");
                return;
            }
            avformat_close_input(&context);
        }
    }
    state.SetItemsProcessed(static_cast<std::int64_t>(state.iterations()) * kMovies);
    state.counters["resident_MB"] = ResidentMegabytes();
}

BENCHMARK(DescribeFolder)->Unit(benchmark::kMillisecond)->UseRealTime()->Repetitions(5);
BENCHMARK(DescribeAndSaveFolder)->Unit(benchmark::kMillisecond)->UseRealTime()->Repetitions(5);
BENCHMARK(OpenAndFindStreams)->Unit(benchmark::kMillisecond)->UseRealTime()->Repetitions(5);

}  // namespace

int main(int argc, char** argv) {
    return RunWithRatios(argc, argv,
                         {{"DescribeFolder", "OpenAndFindStreams", TimesAtMost(0.5)},
                          {"DescribeAndSaveFolder", "DescribeFolder", TimesAtMost(2)}});
}
