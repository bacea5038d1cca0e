// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/cliphost/Session.h"

#include <fmt/format.h>

#include <cstdio>

#include "host_interfaces/util/NMALogger.h"
#include "reference_host/cliphost/Failure.h"
#include "reference_host/framework/HostPath.h"
#include "reference_host/header_parser/QTParser.h"
#include "reference_host/parameters/RegisterParameterComponents.h"
#include "reference_host/quicktime/RegisterQuickTimeComponents.h"
#include "reference_host/util/text/Paths.h"
#include "reference_host/xml/RegisterXmlComponents.h"

namespace cliphost {
namespace {

using host::DisplayPath;

aafTimeStamp_t ParseTime(const std::string& text) {
    int year = 0, month = 0, day = 0, hour = 0, minute = 0, second = 0, read = 0;
    const int fields = std::sscanf(text.c_str(), "%4d-%2d-%2dT%2d:%2d:%2d%n", &year, &month, &day,
                                   &hour, &minute, &second, &read);
    const std::string rest = fields == 6 ? text.substr(static_cast<std::size_t>(read)) : "?";
    if (fields != 6 || (!rest.empty() && rest != "Z") || month < 1 || month > 12 || day < 1 ||
        day > 31 || hour > 23 || minute > 59 || second > 59) {
        throw Failure(kExitCaller,
                      fmt::format("--pin-time {}: not a time; write 2026-01-31T12:00:00Z", text));
    }
    aafTimeStamp_t time{};
    time.date = {static_cast<aafInt16>(year), static_cast<aafUInt8>(month),
                 static_cast<aafUInt8>(day)};
    time.time = {static_cast<aafUInt8>(hour), static_cast<aafUInt8>(minute),
                 static_cast<aafUInt8>(second), 0};
    return time;
}

std::string WithoutLineEnd(std::string text) {
    while (!text.empty() && (text.back() == '\n' || text.back() == ' ')) {
        text.pop_back();
    }
    return text;
}

}  // namespace

Session::Session(const SessionOptions& options) {
    aaf_ = std::make_unique<AafLibrary>(
        options.aafLibrary.empty() ? options.programFolder / kAAFLibraryName : options.aafLibrary);
    if (!options.pinTime.empty() && !aaf_->PinTime(ParseTime(options.pinTime))) {
        throw Failure(kExitCaller, fmt::format("{}: this AAF library can't pin its time stamps",
                                               DisplayPath(aaf_->file())));
    }
    NMASetLogLevel(options.verbosity >= 2 ? 8 : options.verbosity == 1 ? 1 : 0);

    host_ = std::make_unique<host::Host>(options.host);
    const int verbosity = options.verbosity;
    host_->console().SetSink([this, verbosity](ncfUInt32 level, const std::string& text) {
        const std::string line = WithoutLineEnd(text);
        if (level <= 2) {
            notices_.push_back(line);
        }
        if (verbosity > 0) {
            fmt::print(stderr, "console {}: {}\n", level, line);
        }
    });
    host::RegisterXmlComponents(*host_);
    host::RegisterParameterComponents(*host_);
    host_->RegisterComponent(NCFCompID_QTParser, header_parser::QTParserMaker());
    host::RegisterQuickTimeComponents(*host_);

    host::LoadFailure failure;
    plugin_ = host_->LoadModule(options.plugin.empty()
                                    ? options.programFolder / "plugins" / "QuickTimePlugin.nvx"
                                    : options.plugin,
                                failure);
    if (!plugin_) {
        throw Failure(kExitCaller, failure.message);
    }
}

Session::~Session() {
    host_->console().SetSink({});
}

std::vector<std::string> Session::TakeNotices() {
    return std::exchange(notices_, {});
}

std::vector<std::string> Session::MissingDataFiles() const {
    std::vector<std::string> missing;
    for (const char* const name : {"FourCharMapper.xml", "AAFInfo.xml"}) {
        const std::filesystem::path file = plugin_->file().parent_path() / name;
        if (!std::filesystem::is_regular_file(file)) {
            missing.push_back(DisplayPath(file));
        }
    }
    return missing;
}

host::Ref<host::String> PathForModule(const std::filesystem::path& path) {
    std::error_code error;
    const std::filesystem::path absolute =
        std::filesystem::absolute(path, error).lexically_normal();
    if (!error && !std::filesystem::exists(absolute, error)) {
        throw Failure(kExitCaller,
                      fmt::format("{}: there is no such file or folder", DisplayPath(path)));
    }
    if (host::text::HoldsBackslash(absolute)) {
        throw Failure(kExitCaller,
                      fmt::format("{}: a name with a backslash in it can't be passed to the "
                                  "module, which separates folders by it; rename it",
                                  DisplayPath(path)));
    }
    return host::ModulePath(absolute);
}

}  // namespace cliphost
