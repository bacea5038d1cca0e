// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/ResultCodes.h"
#include "tests/support/fakes/Journal.h"

// What the utility library's functions answer in this program. They stand in
// for those that a description asks: each writes its arguments to the journal,
// if there is one.
struct UtilDouble {
    Journal* journal = nullptr;

    NCFRESULT split = NCF_OK;
    NCFRESULT url = NCF_OK;
    NCFRESULT begin = NCF_OK;
    NCFRESULT add = NCF_OK;
    NCFRESULT finish = NCF_OK;
    NCFRESULT convert = NCF_OK;
    ncfUInt32 frames = 90000;
    ncfUInt32 maxDuration = 5000;
};
extern UtilDouble utilDouble;

// What the retriever answers in this program: there is none, whatever Init says.
extern NCFRESULT retrieverInit;
