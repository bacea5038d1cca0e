// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/ResultText.h"

#include <gtest/gtest.h>

using cliphost::ResultName;
using cliphost::ResultText;

TEST(ResultText, TellsNameNumberAndSense) {
    EXPECT_EQ(ResultText(NMA_E_NODATA), "NMA_E_NODATA (0xA000006F): there is no data");
    EXPECT_EQ(ResultText(NCF_OK), "NCF_OK (0x00000000): success");
    EXPECT_EQ(ResultName(NCF_E_HANDLE), "NCF_E_HANDLE");
}

TEST(ResultText, TellsTheNumberOfACodeWithoutAName) {
    EXPECT_EQ(ResultText(0x0AEA0066), "0x0AEA0066");
    EXPECT_EQ(ResultName(static_cast<NCFRESULT>(0x80120001u)), "0x80120001");
    EXPECT_EQ(ResultText(static_cast<NCFRESULT>(0x80120001u)),
              "0x80120001: the AAF library refused");
}
