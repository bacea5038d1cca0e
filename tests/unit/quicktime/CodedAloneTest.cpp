// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Which movies have pictures that stand alone by the way they are coded.

#include "reference_host/quicktime/CodedAlone.h"

#include <gtest/gtest.h>

#include "tests/unit/quicktime/MadeMovie.h"

using namespace quicktime_tests;

namespace {

bool IsAlone(const std::string& codec) {
    const MadeMovie movie("-f lavfi -i testsrc2=size=480x272:rate=25 -frames:v 3 " + codec);
    return host::AreCodedAlone(movie.Path());
}

TEST(CodedAlone, IsWhatCodecsWithoutOtherPicturesMake) {
    EXPECT_TRUE(IsAlone("-c:v prores_ks"));
    EXPECT_TRUE(IsAlone("-c:v mjpeg"));
    EXPECT_TRUE(IsAlone("-c:v png"));
    EXPECT_TRUE(IsAlone("-c:v v210"));
    EXPECT_TRUE(IsAlone("-c:v cfhd"));
    EXPECT_TRUE(IsAlone("-c:v dnxhd -profile:v dnxhr_lb -pix_fmt yuv422p"));
    EXPECT_TRUE(IsAlone("-vf scale=720:576 -c:v dvvideo -pix_fmt yuv420p"));
    EXPECT_TRUE(IsAlone("-c:v hap"));
}

TEST(CodedAlone, IsToldByTheCodeOrProfileOfOthers) {
    EXPECT_TRUE(IsAlone("-vf scale=720:512 -c:v mpeg2video -pix_fmt yuv422p -g 1 -tag:v mx5p"));
    EXPECT_TRUE(IsAlone("-c:v libx264 -pix_fmt yuv422p10le -g 1 -tag:v ai5p"));
    EXPECT_TRUE(IsAlone("-c:v libx264 -pix_fmt yuv422p10le -g 1"));
}

TEST(CodedAlone, IsNothingThatMayLeanOnOthers) {
    for (const char* const codec : {"libx264 -pix_fmt yuv422p10le", "libx264 -pix_fmt yuv420p -g 1",
                                    "mpeg2video -g 1", "mpeg4", "rpza", "qtrle", "cinepak"}) {
        EXPECT_FALSE(IsAlone(std::string("-c:v ") + codec)) << codec;
    }
    EXPECT_FALSE(host::AreCodedAlone("/no/such/movie.mov"));
}

}  // namespace
