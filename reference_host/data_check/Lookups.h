// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/data_check/MapperRows.h"
#include "reference_host/data_check/Records.h"

namespace data_check {

// Of the records of one id, in the order of the file, the one that a picture finds: its place among
// them, as the module's own search has it.
std::optional<std::size_t> FindRecord(const std::vector<const Record*>& records,
                                      std::uint32_t width, std::uint32_t height);

// For each row of one code, in the order of the file, whether its id is given to any movie.
std::vector<bool> GivenIds(const std::vector<const MapperRow*>& rows);

// Tells what is wrong with the two files together: ids that lead nowhere or that nothing leads to,
// rows and records that no movie reaches, rasters without a record.
void CheckLookups(const MapperRows& mapper, const Records& infos, Findings& findings);

}  // namespace data_check
