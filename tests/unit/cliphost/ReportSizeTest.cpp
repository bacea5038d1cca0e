// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// How large a report's page gets.

#include <gtest/gtest.h>

#include "reference_host/cliphost/ReportPictures.h"
#include "reference_host/cliphost/ReportRun.h"
#include "reference_host/cliphost/WebpFile.h"
#include "tests/unit/cliphost/NoisyPicture.h"

using cliphost::AdviceOnSize;

namespace {

constexpr std::uint64_t kMegabyte = 1'000'000;

TEST(SizesOfReports, StayBelowTheBoundWithAThousandClips) {
    constexpr std::size_t kRest = 16'000;  // facts, tracks, mobs, and one or two sounds
    constexpr std::size_t kPictures =
        (cliphost::kMostBytesOfPoster + cliphost::kMostBytesOfStrip) * 4 / 3;
    static_assert(1000 * (kPictures + kRest) <= 60 * kMegabyte);
}

TEST(SizesOfReports, KeepToThemWhateverThePicturesAre) {
    EXPECT_LE(cliphost::ToWebp(NoisyPicture(200, 112), cliphost::kMostBytesOfPoster).size(),
              cliphost::kMostBytesOfPoster);
    EXPECT_LE(cliphost::ToWebp(NoisyPicture(12 * 200, 112), cliphost::kMostBytesOfStrip).size(),
              cliphost::kMostBytesOfStrip);
}

TEST(SizesOfReports, AreToldWhereThePageIsLargerThanThat) {
    EXPECT_EQ(AdviceOnSize(60 * kMegabyte, false), "");
    EXPECT_EQ(AdviceOnSize(73 * kMegabyte, false),
              "it has 73 MB; --split makes a smaller one, with the pictures in a folder beside it");
    EXPECT_EQ(AdviceOnSize(73 * kMegabyte, true), "");
}

}  // namespace
