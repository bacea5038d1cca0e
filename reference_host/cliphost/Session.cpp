// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/cliphost/Session.h"

#include <fmt/format.h>

#include <algorithm>
#include <cstdio>

#include "host_interfaces/util/NMALogger.h"
#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/FileAccess.h"
#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/cliphost/Notice.h"
#include "reference_host/data_check/Findings.h"
#include "reference_host/framework/HostPath.h"
#include "reference_host/header_parser/QTParser.h"
#include "reference_host/parameters/RegisterParameterComponents.h"
#include "reference_host/quicktime/MovieComponents.h"
#include "reference_host/system/Paths.h"
#include "reference_host/xml/RegisterXmlComponents.h"

namespace cliphost {
namespace {

using host::DisplayPath;

bool HasFormOfTime(const std::string& text) {
    const std::string form = "0000-00-00T00:00:00Z";
    if (text.size() != form.size() && text.size() + 1 != form.size()) {
        return false;
    }
    return std::equal(text.begin(), text.end(), form.begin(), [](char is, char should) {
        return should == '0' ? is >= '0' && is <= '9' : is == should;
    });
}

int DaysIn(int year, int month) {
    constexpr int kDays[] = {31, 28, 31, 30, 31, 30, 31, 31, 30, 31, 30, 31};
    const bool isLeap = (year % 4 == 0 && year % 100 != 0) || year % 400 == 0;
    return kDays[month - 1] + (month == 2 && isLeap ? 1 : 0);
}

aafTimeStamp_t ParseTime(const std::string& text) {
    int year = 0, month = 0, day = 0, hour = 0, minute = 0, second = 0;
    const bool isTime =
        HasFormOfTime(text) && std::sscanf(text.c_str(), "%4d-%2d-%2dT%2d:%2d:%2d", &year, &month,
                                           &day, &hour, &minute, &second) == 6;
    if (!isTime || year < 1 || month < 1 || month > 12 || day < 1 || day > DaysIn(year, month) ||
        hour > 23 || minute > 59 || second > 59) {
        throw Failure(kExitCaller, host::system::PathOfText("--pin-time " + text), "not a time",
                      "write 2026-01-31T12:00:00Z");
    }
    aafTimeStamp_t time{};
    time.date = {static_cast<aafInt16>(year), static_cast<aafUInt8>(month),
                 static_cast<aafUInt8>(day)};
    time.time = {static_cast<aafUInt8>(hour), static_cast<aafUInt8>(minute),
                 static_cast<aafUInt8>(second), 0};
    return time;
}

// The module sees a failed creation; why the library is missing is told when the failure is.
template <auto make>
void RegisterMovieComponent(host::Host& host, const GUID& id) {
    host.RegisterComponent(id, host::MakerOf([](INCFUnknown*) -> decltype(make()) {
                               try {
                                   return make();
                               } catch (const host::MovieLibraryMissing&) {
                                   return nullptr;
                               }
                           }));
}

std::string WithoutLineEnd(std::string text) {
    while (!text.empty() && (text.back() == '\n' || text.back() == ' ')) {
        text.pop_back();
    }
    return text;
}

}  // namespace

std::filesystem::path ModuleFile(const SessionOptions& options) {
    return options.plugin.empty() ? options.programFolder / "plugins" / "QuickTimePlugin.nvx"
                                  : options.plugin;
}

std::unique_ptr<AafLibrary> LoadAafLibrary(const SessionOptions& options) {
    auto library = std::make_unique<AafLibrary>(
        options.aafLibrary.empty() ? options.programFolder / kAAFLibraryName : options.aafLibrary);
    if (!options.pinTime.empty() && !library->PinTime(ParseTime(options.pinTime))) {
        throw Failure(kExitCaller, library->file(), "this AAF library can't pin its time stamps",
                      "leave out --pin-time");
    }
    return library;
}

void RegisterServices(host::Host& host) {
    host::RegisterXmlComponents(host);
    host::RegisterParameterComponents(host);
    host.RegisterComponent(NCFCompID_QTParser, header_parser::QTParserMaker());
    RegisterMovieComponent<host::MakeQuickTimeWrapper>(host, QTWrapper::CompID_QuickTimeWrapper);
    RegisterMovieComponent<host::MakeQuickTimeProperty>(host, QuickTime::CompID_QuickTimeProperty);
}

Session::Session(const SessionOptions& options)
    : verbosity_(options.verbosity), aaf_(LoadAafLibrary(options)) {
    NMASetLogLevel(options.verbosity >= 2 ? 8 : options.verbosity == 1 ? 1 : 0);

    host_ = std::make_unique<host::Host>(options.host);
    host_->console().SetSink([this](ncfUInt32 level, const std::string& text) {
        const std::string line = WithoutLineEnd(text);
        if (level <= 2) {
            notices_.push_back(line);
        }
        if (verbosity_ > 0) {
            Notice("console {}: {}\n", level, line);
        }
    });
    RegisterServices(*host_);

    const std::filesystem::path module = ModuleFile(options);
    // The module looks for its data files by the path that it was loaded from.
    if (host::system::HoldsBackslash(host::system::WholePath(module))) {
        throw Failure(kExitCaller, BackslashProblem(module));
    }
    host::LoadFailure failure;
    plugin_ = host_->LoadModule(module, failure);
    if (!plugin_) {
        throw Failure(
            kExitCaller,
            Problem{{}, failure.message, "name another with --plugin FILE", failure.code});
    }
}

Session::~Session() {
    host_->console().SetSink({});
}

std::vector<std::string> Session::TakeNotices() {
    return std::exchange(notices_, {});
}

std::vector<std::filesystem::path> Session::DataFiles() const {
    const std::filesystem::path folder = plugin_->file().parent_path();
    return {folder / data_check::kDataFileNames[0], folder / data_check::kDataFileNames[1]};
}

Problem BackslashProblem(const std::filesystem::path& path) {
    return {path,
            "a name with a backslash in it can't be passed to the module, which separates folders "
            "by it",
            "rename it"};
}

host::Ref<host::String> PathForModule(const std::filesystem::path& path) {
    const std::filesystem::path absolute = AbsolutePath(path);
    if (Problem problem = WhyUnreachable(path)) {
        throw Failure(kExitCaller, std::move(problem));
    }
    if (host::system::HoldsBackslash(absolute)) {
        throw Failure(kExitCaller, BackslashProblem(path));
    }
    return host::ModulePath(absolute);
}

}  // namespace cliphost
