// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/RowsOfMovies.h"

#include <fmt/format.h>

#include "reference_host/cliphost/Notice.h"
#include "reference_host/cliphost/Words.h"
#include "reference_host/framework/HostPath.h"

namespace cliphost {

using host::DisplayPath;

void RowsOfMovies::Find(const MoviePlan& plan, const Clash& clash) {
    std::map<const MovieColumns::Row*, std::size_t> places;
    for (std::size_t i = 0; i < plan.size() && columns_.table; ++i) {
        const MovieStep step = plan[i];
        const MovieColumns::Row* const row =
            step.IsMovie() ? columns_.table->Find(step.movie) : nullptr;
        if (row == nullptr) {
            continue;
        }
        const auto [place, isFirstNow] = places.emplace(row, i);
        std::filesystem::path::string_type& movie = movies_.emplace(row, step.movie).first->second;
        std::error_code ignored;
        if (movie == step.movie) {
            continue;
        }
        if (isFirstNow && !std::filesystem::exists(movie, ignored)) {
            movie = step.movie;  // which was moved since
            continue;
        }
        clash(place->second, i,
              Failure(kExitCaller, columns_.file,
                      fmt::format("row {}: {} may be {} or {}", row->number, row->movie,
                                  DisplayPath(std::filesystem::path(movie)),
                                  DisplayPath(std::filesystem::path(step.movie))),
                      "give its path"));
    }
}

void RowsOfMovies::TellUnused() const {
    constexpr std::size_t kMostTold = 20;
    if (!columns_.table) {
        return;
    }
    std::size_t unused = 0;
    for (const MovieColumns::Row& row : columns_.table->rows()) {
        if (movies_.count(&row) == 0 && ++unused <= kMostTold) {
            Notice("cliphost: {}: row {}: no movie is {}\n", DisplayPath(columns_.file), row.number,
                   row.movie);
        }
    }
    if (unused > kMostTold) {
        Notice("cliphost: {}: {} more are for none\n", DisplayPath(columns_.file),
               Counted(unused - kMostTold, "row"));
    }
}

}  // namespace cliphost
