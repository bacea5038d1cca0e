// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <vector>

#include "reference_host/catalog/Catalog.h"
#include "reference_host/cliphost/MoviePlan.h"

namespace cliphost {

// The movies of a catalog, by their paths there, that are not there any more, of those which the
// command line means: it names them, or a folder where it would have found them. A folder, of
// the command line or within one, that is gone or empty may not be mounted: none of its movies is
// taken for gone. So is one of the command line in which no movie is that was found there.
std::vector<std::string> GoneMovies(const MoviesOptions& options, const MoviePlan& plan,
                                    catalog::Catalog& catalog);

}  // namespace cliphost
