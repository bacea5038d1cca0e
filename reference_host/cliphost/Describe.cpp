// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/cliphost/Describe.h"

#include "host_interfaces/media/MediaContainer.h"
#include "host_interfaces/media/PluginComponents.h"
#include "reference_host/cliphost/DataFiles.h"
#include "reference_host/cliphost/MovieDiagnosis.h"
#include "reference_host/cliphost/SampleDiagnosis.h"
#include "reference_host/quicktime/HeaderLook.h"

namespace cliphost {
namespace {

void Finish(Session& session, Description& description) {
    if (description.result < 0) {
        description.file.Reset();
        description.problem = ProblemWith(session, description.movie, description.result);
    } else {
        description.notices = session.TakeNotices();
        if (host::TellsLargePictures(description.movie)) {
            description.doubt = WrongRaster(description.movie);
        }
    }
}

}  // namespace

Problem ProblemWith(Session& session, const std::filesystem::path& movie, NCFRESULT result) {
    const std::vector<std::string> notices = session.TakeNotices();
    Problem problem = DiagnoseMovie(movie, notices);
    if (!problem) {
        const std::string way = problem.route;
        // The module reads its data files at the first picture of a clip that loads.
        problem = DataFileProblem(session);
        problem.isOfProgram = true;
        if (!problem) {
            problem = {movie, "the module does not describe it, and does not say why",
                       "-vv shows what it logs"};
        }
        problem.route = way;
    }
    problem.code = result;
    return problem;
}

NCFRESULT OpenContainer(Session& session, const std::filesystem::path& movie,
                        host::Ref<NMA::IMediaContainer3>& container) {
    const auto path = PathForModule(movie);
    const NCFRESULT made = session.host().Create(NMA::CompID_QuickTimeContainer, container);
    return made < 0 ? made : container->SetFilePath(path.get());
}

Description DescribeMovie(Session& session, const std::filesystem::path& movie) {
    host::Ref<NMA::IMediaContainer3> container;
    const NCFRESULT opened = OpenContainer(session, movie, container);
    if (opened >= 0) {
        return DescribeContainer(session, container.get(), movie);
    }
    Description description;
    description.movie = movie;
    description.result = opened;
    Finish(session, description);
    return description;
}

Description DescribeContainer(Session& session, NMA::IMediaContainer3* container,
                              const std::filesystem::path& movie) {
    Description description;
    description.movie = movie;
    host::Ref<NMA::IAAFClips> clips;
    NCFRESULT result = container->GetAAFMasterClips(clips.Out());
    if (result >= 0) {
        result = clips->GetMetadata(0, description.file.Out());
    }
    description.result = result;
    Finish(session, description);
    return description;
}

Description DescribeFromList(Session& session, NMA::IAAFClips* list, ncfSInt32 index,
                             const std::filesystem::path& movie) {
    Description description;
    description.movie = movie;
    description.result = list->GetMetadata(index, description.file.Out());
    Finish(session, description);
    return description;
}

}  // namespace cliphost
