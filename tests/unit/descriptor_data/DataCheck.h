// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <vector>

#include "host_interfaces/framework/ComponentFactory.h"

// Looks through the two data files for what would make a clip fail or be
// described wrongly although the files can be read: values that an AAF library
// refuses, entries that lack something or that no movie can reach. Empty when
// all is well; otherwise one line for each finding.
std::vector<std::string> CheckData(INCFComponentFactory* factory, const std::string& mapperFile,
                                   const std::string& infoFile);

namespace data_check {

using Findings = std::vector<std::string>;

// Ids in this range are named by no file: only a movie that carries one asks
// for it.
inline constexpr unsigned kFirstMovieId = 10900;
inline constexpr unsigned kLastMovieId = 10999;

// Each entry by itself, as the file writes it.
void CheckMapperText(const std::string& file, Findings& findings);
void CheckInfoText(const std::string& file, Findings& findings);
// What the module's own readers make of the two files together.
void CheckLookups(INCFComponentFactory* factory, const std::string& mapperFile,
                  const std::string& infoFile, Findings& findings);

}  // namespace data_check
