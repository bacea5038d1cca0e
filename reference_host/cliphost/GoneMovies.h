// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <vector>

#include "reference_host/catalog/Catalog.h"
#include "reference_host/cliphost/MoviePlan.h"

namespace cliphost {

// The movies of a catalog, by their paths there, that are not there any more, of those which the
// command line means: it names them, or a folder where it would have found them. Where nothing at
// all is in such a folder, it may be that it is not mounted, and none of its movies is taken for
// gone.
std::vector<std::string> GoneMovies(const MoviesOptions& options, const MoviePlan& plan,
                                    catalog::Catalog& catalog);

}  // namespace cliphost
