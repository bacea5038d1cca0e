// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <CLI/CLI.hpp>

#include "reference_host/cliphost/Session.h"

namespace cliphost {

// Each verb adds itself to the command line. It keeps its own options, and what
// it does runs once the whole line is read; `status` becomes the exit status.
void AddScan(CLI::App& app, const SessionOptions& session, int& status);
void AddDescribe(CLI::App& app, const SessionOptions& session, int& status);
void AddSamples(CLI::App& app, const SessionOptions& session, int& status);
void AddFormats(CLI::App& app, const SessionOptions& session, int& status);
void AddFrame(CLI::App& app, const SessionOptions& session, int& status);
void AddContact(CLI::App& app, const SessionOptions& session, int& status);
void AddAudio(CLI::App& app, const SessionOptions& session, int& status);
void AddTypes(CLI::App& app, const SessionOptions& session, int& status);
void AddParams(CLI::App& app, const SessionOptions& session, int& status);
void AddDump(CLI::App& app, const SessionOptions& session);
void AddCompare(CLI::App& app, const SessionOptions& session, int& status);
void AddVerify(CLI::App& app, const SessionOptions& session, int& status);
void AddRelink(CLI::App& app, const SessionOptions& session, int& status);
void AddCatalog(CLI::App& app, const SessionOptions& session, int& status);
void AddReport(CLI::App& app, const SessionOptions& session, int& status);
void AddFind(CLI::App& app, int& status);
void AddCheckData(CLI::App& app, const SessionOptions& session, int& status);
void AddValidate(CLI::App& app, const SessionOptions& session, int& status);
void AddHelpFiles(CLI::App& app);
void AddPlugin(CLI::App& app, const SessionOptions& session, int& status);

}  // namespace cliphost
