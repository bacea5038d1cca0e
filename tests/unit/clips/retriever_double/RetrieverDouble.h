// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "source/descriptor_data/QuickTimeToAAFInfoRetriever.h"

// What the retriever stands for in this program: it answers as the test says.
struct RetrieverDouble {
    bool exists = true;
    NCFRESULT result = NCF_OK;
    bool asked = false;
    ncfUInt32 width = 0;  // of the picture that was asked about
    AAFInfo* record = nullptr;
};
extern RetrieverDouble retriever;
