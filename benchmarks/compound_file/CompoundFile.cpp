// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// What it costs to lay a compound file out in memory, beside libgsf: the many small storages and
// streams of AAF files, and long streams. In processor time. Each file is read back before the
// clock starts.

#include <benchmark/benchmark.h>

#include <ctime>
#include <string>

#include "benchmarks/support/Brief.h"
#include "benchmarks/support/Ratios.h"
#include "tests/support/compound/CompoundTree.h"
#include "tests/support/compound/GsfFile.h"

namespace {

using compound::Node;

constexpr compound::SectorSize kSectors = compound::SectorSize::Bytes512;

std::u16string Number(std::int64_t number) {
    const std::string digits = std::to_string(number);
    return {digits.begin(), digits.end()};
}

// Objects as an AAF file holds them: a set of mobs, each with slots in a vector, which have a
// segment each.
Node Objects(std::int64_t count) {
    const auto object = [](const std::u16string& name, std::size_t properties) {
        Node storage = compound::Storage(name);
        storage.classId[0] = 1;
        storage.nodes.push_back(compound::Stream(u"properties", compound::Content(properties)));
        return storage;
    };
    Node root = object(u"", 60);
    for (std::int64_t made = 0; made < count;) {
        Node mob = object(u"Mobs-1901{" + Number(made) + u"}", 250);
        mob.nodes.push_back(compound::Stream(u"Slots-4403 index", compound::Content(28)));
        ++made;
        for (int i = 0; i < 4 && made < count; ++i, made += 2) {
            mob.nodes.push_back(object(u"Slots-4403{" + Number(i) + u"}", 120));
            mob.nodes.back().nodes.push_back(object(u"Segment-4803", 180));
        }
        root.nodes.push_back(std::move(mob));
    }
    return root;
}

// So many megabytes in four streams.
Node LongStreams(std::int64_t megabytes) {
    Node root = compound::Storage(u"");
    for (int i = 0; i < 4; ++i) {
        root.nodes.push_back(compound::Stream(
            Number(i), compound::Content(static_cast<std::size_t>(megabytes) << 18)));
    }
    return root;
}

double ProcessorSeconds() {
    return static_cast<double>(std::clock()) / CLOCKS_PER_SEC;
}

// `write` gives the size of the file.
template <class Write>
void Time(benchmark::State& state, const Node& root, const compound::Bytes& file, Write write) {
    if (!compound::Difference(gsf::Read(file), root).empty()) {
        state.SkipWithError("the file does not hold what was written");
        return;
    }
    for (auto _ : state) {
        const double before = ProcessorSeconds();
        const std::size_t size = write();
        state.SetIterationTime(ProcessorSeconds() - before);
        benchmark::DoNotOptimize(size);
    }
}

void Ours(benchmark::State& state, const Node& root) {
    Time(state, root, compound::Written(root, kSectors), [&] {
        std::size_t size = 0;
        for (const aaf::stored::Piece& piece : compound::WrittenInPieces(root, kSectors)) {
            size += piece.size;
        }
        return size;
    });
}

void Theirs(benchmark::State& state, const Node& root) {
    const gsf::Named named(root);
    Time(state, root, gsf::Written(root, kSectors),
         [&] { return gsf::SizeWritten(named, kSectors); });
}

void WriteObjects(benchmark::State& state) {
    Ours(state, Objects(state.range(0)));
}
void LibgsfObjects(benchmark::State& state) {
    Theirs(state, Objects(state.range(0)));
}
void WriteMegabytes(benchmark::State& state) {
    Ours(state, LongStreams(state.range(0)));
}
void LibgsfMegabytes(benchmark::State& state) {
    Theirs(state, LongStreams(state.range(0)));
}

void Counts(benchmark::internal::Benchmark* work) {
    for (const int count : {100, 1000, Sized(10000, 2000)}) {
        work->Arg(count);
    }
    work->UseManualTime()->Repetitions(5)->Unit(benchmark::kMicrosecond);
}
void Sizes(benchmark::internal::Benchmark* work) {
    work->Arg(Sized(64, 2))->UseManualTime()->Repetitions(5)->Unit(benchmark::kMillisecond);
}

BENCHMARK(WriteObjects)->Apply(Counts);
BENCHMARK(LibgsfObjects)->Apply(Counts);
BENCHMARK(WriteMegabytes)->Apply(Sizes);
BENCHMARK(LibgsfMegabytes)->Apply(Sizes);

}  // namespace

int main(int argc, char** argv) {
    // Long streams are copied, by either; runs differ by some percent.
    return RunWithRatios(argc, argv,
                         {{"WriteObjects", "LibgsfObjects", TimesAtMost(1)},
                          {"WriteMegabytes", "LibgsfMegabytes", TimesAtMost(1.1)}});
}
