// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <functional>
#include <map>
#include <string>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/MovieColumns.h"
#include "reference_host/cliphost/MoviePlan.h"

namespace cliphost {

// Which rows of a table are for which movies, of one plan or of several that follow each other.
// Without a table nothing is for any.
class RowsOfMovies {
public:
    explicit RowsOfMovies(const GivenColumns& columns) : columns_(columns) {}

    // Two movies that one row may mean: their places in the plan, and what to tell. The first place
    // may be that of the second, where the other movie was of a plan before.
    using Clash = std::function<void(std::size_t one, std::size_t other, const Failure& why)>;
    void Find(const MoviePlan& plan, const Clash& clash);
    // Tells the rows that were for no movie.
    void TellUnused() const;

private:
    const GivenColumns& columns_;
    std::map<const MovieColumns::Row*, std::filesystem::path::string_type> movies_;
};

}  // namespace cliphost
