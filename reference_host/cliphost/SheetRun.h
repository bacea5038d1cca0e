// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/cliphost/MoviesRun.h"
#include "reference_host/cliphost/ParameterOptions.h"
#include "reference_host/cliphost/TurnOption.h"

namespace cliphost {

// How a contact sheet is made.
struct SheetForm {
    int frames = 12;
    int columns = 4;
    int width = 320;
    bool isExact = false;
    TurnOption turn;
    ParameterOptions parameters;
    bool showsProgress = false;  // of the frames of one movie
};

// Writes the sheet of one movie. Frames that can't be read stay empty and are told on standard
// error. Throws a Failure when there is nothing to show.
MovieAnswer MakeSheet(Session& session, const std::filesystem::path& movie, const SheetForm& form,
                      const PlaceOfFile& place);

struct SheetsOptions {
    MoviesOptions movies;
    SheetForm form;
    bool lines = false;  // JSON of one line for each movie
};

// Writes the sheets of all movies of the command line.
class SheetRun final : public MoviesRun {
public:
    SheetRun(Session& session, const SheetsOptions& options)
        : MoviesRun(session, options.movies, "making sheets", ".png"), options_(options) {}

private:
    MovieAnswer Answer(const MovieStep& step, const PlaceOfFile& place) override {
        return MakeSheet(session(), step.movie, options_.form, place);
    }
    bool ReadAnswer(const std::string& bytes, MovieAnswer& answer) override {
        return FromBytes(bytes, {}, answer);
    }
    void Show(const std::filesystem::path& movie, const MovieAnswer& answer,
              const std::filesystem::path& saved) override;
    void ShowFailure(const std::filesystem::path& movie, const Problem& problem) override;
    void ShowDone(const std::filesystem::path& movie, const std::filesystem::path& saved) override;
    void Finish(int made, int failed) override;

    const SheetsOptions& options_;
};

}  // namespace cliphost
