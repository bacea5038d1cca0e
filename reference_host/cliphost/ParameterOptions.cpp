// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/cliphost/ParameterOptions.h"

#include "reference_host/cliphost/ParameterFile.h"
#include "reference_host/cliphost/PathOption.h"

namespace cliphost {

void ParameterOptions::AddTo(CLI::App& verb) {
    const char* const group = "Clip parameters";
    verb.add_option("--set", assignments_,
                    "A parameter and its value, such as \"Field Layout=Split\"; may be repeated")
        ->allow_extra_args(false)
        ->group(group);
    AddPath(verb, "--set-xml", document_, "Values from a parameter document")->group(group);
    verb.add_flag("--reset", reset_, "First go back to what the file says, then apply --set")
        ->group(group);
}

bool ParameterOptions::IsEmpty() const {
    return assignments_.empty() && document_.empty() && !reset_;
}

void ParameterOptions::ApplyTo(ClipParameters& parameters) const {
    if (!document_.empty()) {
        parameters.Apply(ReadParameterFile(document_), document_);
    }
    if (reset_) {
        parameters.Reset();
    }
    if (!assignments_.empty()) {
        parameters.Assign(assignments_);
    }
}

void ParameterOptions::ApplyTo(Session& session, const std::filesystem::path& movie,
                               NMA::IMediaContainer3& container) const {
    if (!IsEmpty()) {
        ClipParameters parameters(session, movie, container);
        ApplyTo(parameters);
    }
}

}  // namespace cliphost
