// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <CLI/CLI.hpp>

#include "reference_host/cliphost/ClipParameters.h"

namespace cliphost {

// The options by which any verb lets the user change a clip's parameters. The
// verb keeps them and applies them to the container that it opens, before it
// takes a mapping of it.
class ParameterOptions {
public:
    void AddTo(CLI::App& verb);
    bool IsEmpty() const;

    // A document first, then the defaults, then single values, whatever their
    // order on the command line. Throws a Failure.
    void ApplyTo(ClipParameters& parameters) const;
    // The same for a container; asks for no parameters when there is nothing to
    // apply.
    void ApplyTo(Session& session, const std::filesystem::path& movie,
                 NMA::IMediaContainer3& container) const;

private:
    std::vector<std::string> assignments_;
    std::filesystem::path document_;
    bool reset_ = false;
};

}  // namespace cliphost
