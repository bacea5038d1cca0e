// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The built-in table: formats that share a code, told apart by raster, layout
// and, where one raster comes at several rates, by edit rate.

#include <cstring>

#include "source/descriptor_data/FourCharDataContainerReader.h"

namespace {

struct Row {
    char code[5];
    FourCharFormat format;
};

constexpr ncfUInt32 kAny = FourCharFormat::kAnyRate;

// code, {width, height, layout, rate numerator, rate denominator, id}
// clang-format off
constexpr Row kRows[] = {
    {"apco", {720, 240, 1, kAny, kAny, 3800}},
    {"apco", {720, 243, 1, kAny, kAny, 3802}},
    {"apco", {720, 288, 1, kAny, kAny, 3804}},
    {"apco", {720, 480, 0, kAny, kAny, 3801}},
    {"apco", {720, 486, 0, kAny, kAny, 3803}},
    {"apco", {720, 576, 0, kAny, kAny, 3805}},
    {"apco", {1280, 720, 0, kAny, kAny, 3807}},
    {"apco", {1920, 540, 1, kAny, kAny, 3811}},
    {"apco", {1920, 1080, 0, kAny, kAny, 3809}},

    {"apcs", {720, 240, 1, kAny, kAny, 3732}},
    {"apcs", {720, 243, 1, kAny, kAny, 3729}},
    {"apcs", {720, 288, 1, kAny, kAny, 3728}},
    {"apcs", {720, 480, 0, kAny, kAny, 3733}},
    {"apcs", {720, 486, 0, kAny, kAny, 3726}},
    {"apcs", {720, 576, 0, kAny, kAny, 3727}},
    {"apcs", {1280, 720, 0, kAny, kAny, 3721}},
    {"apcs", {1920, 540, 1, kAny, kAny, 3725}},
    {"apcs", {1920, 1080, 0, kAny, kAny, 3723}},

    {"apcn", {720, 240, 1, kAny, kAny, 3744}},
    {"apcn", {720, 243, 1, kAny, kAny, 3743}},
    {"apcn", {720, 288, 1, kAny, kAny, 3745}},
    {"apcn", {720, 480, 0, kAny, kAny, 3741}},
    {"apcn", {720, 486, 0, kAny, kAny, 3740}},
    {"apcn", {720, 576, 0, kAny, kAny, 3746}},
    {"apcn", {1280, 720, 0, kAny, kAny, 3748}},
    {"apcn", {1920, 540, 1, kAny, kAny, 3752}},
    {"apcn", {1920, 1080, 0, kAny, kAny, 3750}},

    {"apch", {720, 240, 1, kAny, kAny, 3701}},
    {"apch", {720, 243, 1, kAny, kAny, 3700}},
    {"apch", {720, 288, 1, kAny, kAny, 3702}},
    {"apch", {720, 480, 0, kAny, kAny, 3708}},
    {"apch", {720, 486, 0, kAny, kAny, 3709}},
    {"apch", {720, 576, 0, kAny, kAny, 3703}},
    {"apch", {1280, 720, 0, kAny, kAny, 3705}},
    {"apch", {1920, 540, 1, kAny, kAny, 3712}},
    {"apch", {1920, 1080, 0, kAny, kAny, 3710}},

    {"ap4h", {720, 240, 1, kAny, kAny, 3783}},
    {"ap4h", {720, 243, 1, kAny, kAny, 3782}},
    {"ap4h", {720, 288, 1, kAny, kAny, 3785}},
    {"ap4h", {720, 480, 0, kAny, kAny, 3780}},
    {"ap4h", {720, 486, 0, kAny, kAny, 3784}},
    {"ap4h", {720, 576, 0, kAny, kAny, 3786}},
    {"ap4h", {1280, 720, 0, kAny, kAny, 3788}},
    {"ap4h", {1920, 540, 1, kAny, kAny, 3792}},
    {"ap4h", {1920, 1080, 0, kAny, kAny, 3790}},

    {"NVj2", {720, 248, 1, kAny, kAny, 553}},
    {"NVj2", {720, 296, 1, kAny, kAny, 555}},
    {"NVj2", {720, 496, 0, 24000, 1001, 554}},
    {"NVj2", {720, 496, 0, 24, 1, 565}},
    {"NVj2", {720, 592, 0, 25, 1, 556}},
    {"NVj2", {720, 592, 0, 24, 1, 566}},
    {"NVj2", {1280, 720, 0, 60000, 1001, 552}},
    {"NVj2", {1280, 720, 0, 50, 1, 561}},
    {"NVj2", {1280, 720, 0, 30000, 1001, 562}},
    {"NVj2", {1280, 720, 0, 25, 1, 563}},
    {"NVj2", {1280, 720, 0, 24000, 1001, 564}},
    {"NVj2", {1920, 540, 1, 30000, 1001, 550}},
    {"NVj2", {1920, 540, 1, 25, 1, 557}},
    {"NVj2", {1920, 1080, 0, 24000, 1001, 551}},
    {"NVj2", {1920, 1080, 0, 30000, 1001, 558}},
    {"NVj2", {1920, 1080, 0, 25, 1, 559}},
    {"NVj2", {1920, 1080, 0, 24, 1, 560}},
};
// clang-format on

}  // namespace

void FourCharDataContainerReader::FillBuiltInTable() {
    for (const Row& row : kRows) {
        ncfUInt32 code = 0;
        std::memcpy(&code, row.code, sizeof code);
        builtInTable_.emplace(code, row.format);
    }
}
