// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include <fmt/format.h>

#include <cstdio>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/Verbs.h"

namespace {

std::filesystem::path ProgramFolder(const char* name) {
    std::error_code error;
    const std::filesystem::path program = std::filesystem::read_symlink("/proc/self/exe", error);
    return (error ? std::filesystem::absolute(name) : program).parent_path();
}

}  // namespace

int main(int argc, char** argv) {
    using namespace cliphost;
    SessionOptions session;
    session.programFolder = ProgramFolder(argv[0]);
    int status = kExitFine;

    CLI::App app{
        "Hosts the QuickTime plug-in: scans folders, describes movies as AAF, "
        "maps and delivers their pictures and sound."};
    app.name("cliphost");
    app.require_subcommand(1);
    app.fallthrough();
    app.set_version_flag("--version", "cliphost 1.3.2");
    app.add_flag("-v", session.verbosity,
                 "Console lines of the module on standard error; twice for its log too");
    app.add_option("--plugin", session.plugin,
                   "Another module file than the one beside the program");
    app.add_option("--aaf-library", session.aafLibrary, "Another build of the AAF library");

    double editorRate = 25.0;
    double forcedRate = 0.0;
    ncfUInt32 singleFrameDuration = 60;
    bool movieHeaderDuration = false;
    bool useAlpha = false;
    const char* const settings = "Host and editor settings";
    app.add_option("--editor-rate", editorRate, "Frames per second of the project")
        ->check(CLI::PositiveNumber)
        ->capture_default_str()
        ->group(settings);
    auto* const forced = app.add_option("--forced-rate", forcedRate,
                                        "Frames per second that clips take instead of their own")
                             ->check(CLI::PositiveNumber)
                             ->group(settings);
    app.add_option("--single-frame-duration", singleFrameDuration,
                   "Length of one-frame clips, in frames")
        ->capture_default_str()
        ->group(settings);
    app.add_flag("--movie-header-duration", movieHeaderDuration,
                 "Take lengths from the movie header")
        ->group(settings);
    app.add_flag("--use-alpha", useAlpha, "Describe alpha channels too")->group(settings);
    app.parse_complete_callback([&] {
        session.host.editorFrameRate = editorRate;
        if (forced->count() > 0) {
            session.host.forcedFrameRate = forcedRate;
        }
        session.host.singleFrameDuration = singleFrameDuration;
        session.host.movieHeaderDuration = movieHeaderDuration;
        session.host.ignoreAlpha = !useAlpha;
    });

    AddScan(app, session, status);
    AddDescribe(app, session, status);
    AddSamples(app, session, status);
    AddFormats(app, session, status);
    AddFrame(app, session, status);
    AddContact(app, session, status);
    AddAudio(app, session, status);
    AddTypes(app, session, status);
    AddParams(app, session, status);
    AddPlugin(app, session, status);

    try {
        app.parse(argc, argv);
    } catch (const CLI::ParseError& error) {
        return app.exit(error) == 0 ? kExitFine : kExitCaller;
    } catch (const Failure& failure) {
        fmt::print(stderr, "cliphost: {}\n", failure.what());
        return failure.status();
    } catch (const std::exception& error) {
        fmt::print(stderr, "cliphost: {}\n", error.what());
        return kExitFile;
    }
    return status;
}
