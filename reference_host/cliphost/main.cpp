// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include <fcntl.h>
#include <fmt/format.h>
#include <unistd.h>

#include <cerrno>
#include <csignal>
#include <cstdio>
#include <iostream>
#include <system_error>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/Notice.h"
#include "reference_host/cliphost/OptionChecks.h"
#include "reference_host/cliphost/OutputFile.h"
#include "reference_host/cliphost/OutputProblem.h"
#include "reference_host/cliphost/Verbs.h"
#include "reference_host/util/text/Printable.h"

namespace {

std::filesystem::path ProgramFolder(const char* name) {
    std::error_code error;
    const std::filesystem::path program = std::filesystem::read_symlink("/proc/self/exe", error);
    return (error ? std::filesystem::absolute(name) : program).parent_path();
}

// If the caller closed a standard stream, the next file that is opened would get
// its number, and what is printed would go into that file.
void KeepStandardStreams() {
    for (const int stream : {STDIN_FILENO, STDOUT_FILENO, STDERR_FILENO}) {
        if (fcntl(stream, F_GETFD) < 0) {
            // Only errors may be lost; to write results there has to fail.
            open("/dev/null", stream == STDERR_FILENO ? O_WRONLY : O_RDONLY);
        }
    }
}

void Tell(const std::string& text) {
    cliphost::Notice("cliphost: {}\n", text);
}

// Printed text may get lost even here, when buffers are flushed.
int OutputStatus(int error, int status) {
    if (error == 0 || error == EPIPE) {
        return status;  // a reader that went away has seen enough
    }
    Tell(LineOf(cliphost::NotWritten("standard output", error)));
    return cliphost::kExitCaller;
}

int FlushOutput(int status) {
    if (std::cout.good() && std::ferror(stdout) != 0) {
        return status;  // it was told where it happened
    }
    errno = 0;
    std::cout.flush();
    if (std::fflush(stdout) == 0 && std::cout.good()) {
        return status;
    }
    return OutputStatus(errno != 0 ? errno : EIO, status);
}

std::string CommandLineProblem(const CLI::App* app, const CLI::Error& error) {
    std::string text = error.what();
    const std::vector<std::string> rest = app->remaining();
    if (app->get_subcommands().empty() && !rest.empty()) {
        text = fmt::format("'{}' is neither a verb nor an option", rest.front());
    }
    return fmt::format("cliphost: {}\nRun with --help for more information.\n",
                       host::text::PrintableLines(text));
}

int Run(int argc, char** argv) {
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
    app.footer(
        "Exit status: 0, everything was done; 1, the content of a file is at fault; 2, the call "
        "is at fault:\na wrong option, a file that does not exist, an output that can't be "
        "written. Of several failures\nthe highest counts.");
    app.set_version_flag("--version", "cliphost 1.3.2");
    app.add_flag("-v", session.verbosity,
                 "Show the module's console lines on standard error; -vv shows its log too");
    app.add_option("--plugin", session.plugin,
                   "Use this module file instead of the one beside the program");
    app.add_option("--aaf-library", session.aafLibrary, "Use this build of the AAF library");

    double editorRate = 25.0;
    double forcedRate = 0.0;
    ncfUInt32 singleFrameDuration = 60;
    bool movieHeaderDuration = false;
    bool useAlpha = false;
    const char* const settings = "Host and editor settings";
    app.add_option("--editor-rate", editorRate, "Frames per second of the project")
        ->check(FrameRate())
        ->capture_default_str()
        ->group(settings);
    auto* const forced = app.add_option("--forced-rate", forcedRate,
                                        "Frames per second to use instead of a clip's own")
                             ->check(FrameRate())
                             ->group(settings);
    app.add_option("--single-frame-duration", singleFrameDuration,
                   "Length of one-frame clips, in frames")
        ->check(SmallWholeNumber())
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

    RefuseEmptyTexts(app);
    TakeFileUrls(app);
    app.failure_message(CommandLineProblem);

    try {
        app.parse(argc, argv);
    } catch (const CLI::ParseError& error) {
        return app.exit(error) == 0 ? kExitFine : kExitCaller;
    } catch (const ReaderGone&) {
        return status;  // it has seen enough
    } catch (const Failure& failure) {
        TellProblem(failure.problem(), session.verbosity);
        return failure.status();
    } catch (const std::system_error& error) {
        if (std::ferror(stdout) != 0) {
            return OutputStatus(error.code().value(), status);
        }
        Tell(error.what());
        return kExitFile;
    } catch (const std::exception& error) {
        Tell(error.what());
        return kExitFile;
    }
    return status;
}

}  // namespace

int main(int argc, char** argv) {
    // A file that outgrows its limit fails to be written; the signal would end us.
    std::signal(SIGXFSZ, SIG_IGN);
    KeepStandardStreams();
    return FlushOutput(Run(argc, argv));
}
