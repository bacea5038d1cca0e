// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/MovieFacts.h"

#include "reference_host/cliphost/MoviesRun.h"

namespace cliphost {
namespace {

class FactsRun final : public MoviesRun {
public:
    FactsRun(Session& session, const MoviesOptions& options, const char* doing,
             FactsOfMovies& facts)
        : MoviesRun(session, options, doing, ".aaf"), facts_(facts) {
        form_.quiet = true;
    }

private:
    MovieAnswer Answer(const MovieStep& step, const PlaceOfFile& place) override {
        const Description description = DescribeMovie(session(), step.movie);
        MovieAnswer answer = AnswerOf(session(), description, form_, place);
        if (description.file) {
            Keep(step.movie, description.file.get());
        }
        return answer;
    }
    bool ReadAnswer(const std::string& bytes, MovieAnswer& answer) override {
        return FromBytes(bytes, form_, answer);
    }
    bool Collects() const override { return true; }
    void Collect(const std::filesystem::path& movie, const std::filesystem::path& file) override {
        Keep(movie, session().aaf().Open(file).get());
    }
    bool TellsFailures() const override { return false; }
    void Show(const std::filesystem::path&, const MovieAnswer&,
              const std::filesystem::path&) override {}
    void ShowFailure(const std::filesystem::path& movie, const Problem& problem) override {
        facts_[movie.native()].problem = problem;
    }

    void Keep(const std::filesystem::path& movie, IAAFFile* description) {
        const std::vector<AafClip> clips = ClipsOf(description);
        if (clips.size() != 1) {
            throw Failure(kExitFile, movie, "its description is not that of one clip");
        }
        MovieFacts& facts = facts_[movie.native()];
        facts.id = clips[0].id;
        facts.slots = clips[0].slots;
    }

    FactsOfMovies& facts_;
    DescriptionForm form_;
};

}  // namespace

void ReadMovieFacts(Session& session, const WorkerCall& workers,
                    std::vector<std::filesystem::path> movies, const char* doing,
                    FactsOfMovies& facts) {
    if (movies.empty()) {
        return;
    }
    MoviesOptions options;
    options.paths = std::move(movies);
    options.workers = workers;
    FactsRun(session, options, doing, facts).Run();
}

}  // namespace cliphost
