// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include "reference_host/quicktime/pixels/ChromaRows.h"
#include "reference_host/quicktime/pixels/RowKernels.h"

namespace {

host::PictureForm FormOf(bool isInterlaced, AVChromaLocation location = AVCHROMA_LOC_LEFT) {
    const host::FrameOwner frame(av_frame_alloc());
    frame->format = AV_PIX_FMT_YUV420P;
    frame->width = 16;
    frame->height = 16;
    frame->interlaced_frame = isInterlaced;
    frame->chroma_location = location;
    return host::PictureForm(*frame);
}

void Expect(const host::PictureForm& form, int line, int first, int second, float weight) {
    const host::ChromaLines lines = host::ChromaLinesFor(form, line, 8);
    EXPECT_EQ(lines.first, first) << line;
    EXPECT_EQ(lines.second, second) << line;
    EXPECT_FLOAT_EQ(lines.weightOfSecond, weight) << line;
}

TEST(ChromaRows, StandBetweenTheLinesOfProgressivePictures) {
    const host::PictureForm form = FormOf(false);
    Expect(form, 0, 0, 0, 0.75f);  // above the first there is none
    Expect(form, 1, 0, 1, 0.25f);
    Expect(form, 2, 0, 1, 0.75f);
    Expect(form, 15, 7, 7, 0.25f);
}

TEST(ChromaRows, StayWithinTheirFieldInInterlacedPictures) {
    const host::PictureForm form = FormOf(true);
    Expect(form, 2, 0, 2, 0.375f);  // upper field, its second line
    Expect(form, 4, 0, 2, 0.875f);
    Expect(form, 3, 1, 3, 0.125f);  // lower field
    Expect(form, 5, 1, 3, 0.625f);
}

TEST(ChromaRows, StandOnTheLinesWhereTheStreamSaysSo) {
    const host::PictureForm form = FormOf(false, AVCHROMA_LOC_TOPLEFT);
    Expect(form, 0, 0, 1, 0.0f);
    Expect(form, 1, 0, 1, 0.5f);
}

TEST(ChromaRows, HalveAroundEvenPixels) {
    const float from[] = {0.0f, 4.0f, 8.0f, 4.0f, 0.0f};
    float to[3] = {};
    host::HalveChroma(from, 5, to);
    EXPECT_FLOAT_EQ(to[0], 1.0f);
    EXPECT_FLOAT_EQ(to[1], 6.0f);
    EXPECT_FLOAT_EQ(to[2], 1.0f);
}

}  // namespace
