// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/cliphost/Program.h"

#include <fmt/format.h>

#include <cerrno>
#include <cstdio>
#include <iostream>
#include <system_error>

#include "host_interfaces/Version.h"
#include "host_interfaces/aaf/AAFExports.h"
#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/Notice.h"
#include "reference_host/cliphost/OptionChecks.h"
#include "reference_host/cliphost/OutputFile.h"
#include "reference_host/cliphost/OutputProblem.h"
#include "reference_host/cliphost/PathOption.h"
#include "reference_host/cliphost/SettingsFile.h"
#include "reference_host/cliphost/SettingsOptions.h"
#include "reference_host/cliphost/Verbs.h"
#include "reference_host/quicktime/MovieComponents.h"
#include "reference_host/system/LibrarySearch.h"
#include "reference_host/system/OutputStream.h"
#include "reference_host/system/Process.h"
#include "reference_host/util/text/Printable.h"

namespace {

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
    const int error = host::system::StandardOutputError(errno);
    return OutputStatus(error != 0 ? error : EIO, status);
}

std::string CommandLineProblem(const CLI::App* app, const CLI::Error& error) {
    std::string text = error.what();
    const std::vector<std::string> rest = app->remaining();
    if (app->get_subcommands().empty() && !rest.empty()) {
        text = fmt::format("'{}' is neither a verb nor an option", rest.front());
    }
    return fmt::format("cliphost: {}\nRun with --help for more information.\n",
                       host::text::PrintableLines(cliphost::WithoutMarks(text)));
}

// Each verb's help ends with it, or with the verb's own.
void TellExitStatus(CLI::App& app) {
    constexpr char kStart[] = "Exit status: ";
    const std::string text =
        std::string(kStart) +
        "0, everything was done; 1, the content of a file is at fault; 2, the call "
        "is at fault:\na wrong option, a file that does not exist, an output that can't be "
        "written. Of several failures\nthe highest counts.";
    app.footer(text);
    for (CLI::App* const verb : app.get_subcommands([](CLI::App*) { return true; })) {
        const std::string own = verb->get_footer();
        if (own.find(kStart) == std::string::npos) {
            verb->footer(own.empty() ? text : own + "\n\n" + text);
        }
    }
}

int Run(const std::vector<std::string>& words) {
    using namespace cliphost;
    SessionOptions session;
    session.program = host::system::ProgramFile(words[0].c_str());
    session.programFolder = session.program.parent_path();
    int status = kExitFine;

    CLI::App app{
        "Hosts the QuickTime plug-in: scans folders, describes movies as AAF, "
        "maps and delivers their pictures and sound."};
    app.name("cliphost");
    app.require_subcommand(1);
    app.allow_windows_style_options(false);  // /a/b is a path everywhere
    app.fallthrough();
    app.set_version_flag("--version", "cliphost " PRODUCT_VERSION_TEXT);
    app.add_flag("-v", session.verbosity,
                 "Show the module's console lines on standard error; -vv shows its log too");
    AddPath(app, "--plugin", session.plugin,
            "Use this module file instead of the one beside the program");
    AddPath(app, "--aaf-library", session.aafLibrary, "Use this build of the AAF library");

    app.parse_complete_callback([&] {
        RefuseUnreadSettings(app);
        if (!session.aafLibrary.empty()) {
            host::system::MakeFoundAs(session.aafLibrary, kAAFLibraryName);
        }
    });

    AddSettings(app, session.host);

    AddScan(app, session, status);
    AddDescribe(app, session, status);
    AddSamples(app, session, status);
    AddFormats(app, session, status);
    AddFrame(app, session, status);
    AddContact(app, session, status);
    AddAudio(app, session, status);
    AddDump(app, session);
    AddCompare(app, session, status);
    AddVerify(app, session, status);
    AddRelink(app, session, status);
    AddCatalog(app, session, status);
    AddFind(app, status);
    AddReport(app, session, status);
    AddTypes(app, session, status);
    AddParams(app, session, status);
    AddPlugin(app, session, status);
    AddCheckData(app, session, status);
    AddValidate(app, session, status);
    AddHelpFiles(app);
    AddSettingsFile(app);
    TellExitStatus(app);

    RefuseEmptyTexts(app);
    TakeFileUrls(app);
    TakeMarkedTexts(app);  // before all others
    app.failure_message(CommandLineProblem);

    try {
        std::vector<std::string> arguments;
        for (std::size_t i = words.size() - 1; i > 0; --i) {  // the parser takes the last first
            arguments.push_back(MarkedText(words[i]));
        }
        try {
            app.parse(std::move(arguments));
        } catch (const CLI::FileError&) {
            RefuseGivenSettings(app);
        }
    } catch (const CLI::ParseError& error) {
        return app.exit(error) == 0 ? kExitFine : kExitCaller;
    } catch (const ReaderGone&) {
        return status;  // it has seen enough
    } catch (const Failure& failure) {
        TellProblem(failure.problem(), session.verbosity);
        return failure.status();
    } catch (const host::MovieLibraryMissing& missing) {
        Tell(std::string(missing.what()) + "; install cliphost anew, with all its files");
        return kExitCaller;
    } catch (const std::system_error& error) {
        if (std::ferror(stdout) != 0) {
            return OutputStatus(host::system::StandardOutputError(error.code().value()), status);
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

namespace cliphost {

int RunProgram(const std::vector<std::string>& commandLine) {
    host::system::PrepareProcess();
    return FlushOutput(Run(commandLine));
}

}  // namespace cliphost
