// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/clips/ClipPicture.h"

#include "tests/unit/clips/ClipFixture.h"

TEST_F(ClipTest, AnswersForItsPicture) {
    LoadVideo().SetEditRate(EditorSettings());
    const ClipPicture picture(*clip);
    ncfUInt32 told = 0;
    ncfUInt32 answered = 1;
    EXPECT_EQ(picture.GetDataFormat(&answered), clip->GetDataFormat(&told));
    EXPECT_EQ(answered, told);
    EXPECT_EQ(picture.GetVendor(&answered), clip->GetVendor(&told));
    EXPECT_EQ(answered, told);
    EXPECT_EQ(picture.GetNMAFrameLayout(&answered), clip->GetNMAFrameLayout(&told));
    EXPECT_EQ(answered, told);
    told = answered = 5;
    EXPECT_EQ(picture.GetNivoResolution(&answered), clip->GetNivoResolution(&told));
    EXPECT_EQ(answered, told);
    ncfUInt32 size[4] = {};
    EXPECT_EQ(picture.GetEncodedWidthAndHeight(&size[0], &size[1]),
              clip->GetEncodedWidthAndHeight(&size[2], &size[3]));
    EXPECT_EQ(size[0], size[2]);
    EXPECT_EQ(size[1], size[3]);
    Rational rates[2];
    EXPECT_EQ(picture.GetEditRate(&rates[0]), clip->GetEditRate(&rates[1]));
    EXPECT_EQ(rates[0], rates[1]);
    EXPECT_EQ(rates[0], (Rational{25, 1}));
}
