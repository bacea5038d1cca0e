// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#pragma once

#include "source/descriptor_data/AAFInfo.h"
#include "source/descriptor_data/AAFInfoDataContainerReader2.h"

// Read the values of an entry into a record, in a fixed order. The first
// failure ends the reading: it is given back, and `failedCall` names the
// getter; what was read before it stays in the record.

// The getter that is asked first: an entry that is not there fails with it.
inline constexpr char kContainerLabelGetter[] = "GetEssenceContainerLabelFromVCID";

// What every kind of descriptor has. An entry without a value that its kind
// must have is a failure.
NCFRESULT ReadPictureFields(AAFInfoDataContainerReader2& reader, bool isRGBA, AAFInfo& aafInfo,
                            const char** failedCall);
// What an MPEG-2 descriptor has beyond that.
NCFRESULT ReadMPEG2Fields(AAFInfoDataContainerReader2& reader, AAFInfo& aafInfo,
                          const char** failedCall);
