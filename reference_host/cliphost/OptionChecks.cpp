// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/OptionChecks.h"

#include <fmt/format.h>

#include <algorithm>
#include <filesystem>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/OutputFile.h"
#include "reference_host/framework/HostPath.h"
#include "reference_host/system/FileSystem.h"
#include "reference_host/system/Paths.h"
#include "reference_host/util/text/FileUrl.h"
#include "reference_host/util/text/Number.h"

namespace cliphost {
namespace {

// With a lower rate a frame would last longer than timecode can count; no camera
// has a higher one.
constexpr double kSlowest = 0.01;
constexpr double kFastest = 10000.0;

constexpr char kMark = '\0';  // no argument holds it

// Each option of the program and of its verbs that takes a value.
template <class Action>
void ForEachValueOption(CLI::App& app, const Action& action) {
    std::vector<CLI::App*> apps = app.get_subcommands([](CLI::App*) { return true; });
    apps.push_back(&app);
    for (CLI::App* const one : apps) {
        for (CLI::Option* const option : one->get_options()) {
            if (option->get_items_expected_max() > 0) {
                action(*option);
            }
        }
    }
}

}  // namespace

CLI::Validator WholeNumber(std::uint64_t least, std::uint64_t most) {
    return CLI::Validator(
        [least, most](std::string& text) {
            std::uint64_t number = 0;
            return host::text::ReadNumber(text, number) && number >= least && number <= most
                       ? std::string()
                       : fmt::format("'{}' is not a whole number from {} to {}", text, least, most);
        },
        "", "WholeNumber");
}

CLI::Validator SmallWholeNumber(std::uint64_t least) {
    return WholeNumber(least, std::numeric_limits<std::uint32_t>::max());
}

CLI::Validator FrameRate() {
    return CLI::Validator(
        [](std::string& text) {
            double rate = 0.0;
            // What is no number is not within the bounds either.
            return host::text::ReadNumber(text, rate) && rate >= kSlowest && rate <= kFastest
                       ? std::string()
                       : fmt::format(
                             "'{}' is not a number of frames a second from {} to {}; write "
                             "it such as 25 or 23.976",
                             text, kSlowest, kFastest);
        },
        "", "FrameRate");
}

void RefuseEmptyTexts(CLI::App& app) {
    const CLI::Validator isThere(
        [](std::string& text) {
            return text.empty() ? std::string("an empty text is not a value") : std::string();
        },
        "", "NotEmpty");
    ForEachValueOption(app, [&](CLI::Option& option) { option.check(isThere); });
}

void TakeFileUrls(CLI::App& app) {
    const CLI::Validator toPath(
        [](std::string& text) {
            return !host::text::IsFileUrl(text) || host::system::PathTextOfUrl(text, text)
                       ? std::string()
                       : fmt::format(
                             "'{}' names no file of this machine; write file:///FOLDER/FILE "
                             "with %XX for special characters",
                             text);
        },
        "", "FileUrl");
    ForEachValueOption(app, [&](CLI::Option& option) { option.transform(toPath); });
}

std::string MarkedText(std::string argument) {
    const std::size_t equals =
        argument.rfind("--", 0) == 0 ? argument.find('=') : std::string::npos;
    const std::size_t start = equals == std::string::npos ? 0 : equals + 1;
    if (start < argument.size() && argument[start] == '[' && argument.back() == ']') {
        argument.insert(start, 1, kMark);
    }
    return argument;
}

void TakeMarkedTexts(CLI::App& app) {
    const CLI::Validator unmark(
        [](std::string& text) {
            text = WithoutMarks(std::move(text));
            return std::string();
        },
        "", "MarkedText");
    ForEachValueOption(app, [&](CLI::Option& option) { option.transform(unmark); });
}

std::string WithoutMarks(std::string text) {
    text.erase(std::remove(text.begin(), text.end(), kMark), text.end());
    return text;
}

void RefuseOutputOntoMovie(const std::filesystem::path& output,
                           const std::filesystem::path& movie) {
    std::error_code ignored;
    if (output != "-" && std::filesystem::equivalent(output, movie, ignored)) {
        throw Failure(kExitCaller, output, "this is the movie itself", "name another file");
    }
}

bool IsPlaceOf(const std::filesystem::path& output, const std::filesystem::path& file) {
    std::error_code error;
    const auto whole = [&](const std::filesystem::path& path) {
        return std::filesystem::weakly_canonical(host::system::WholePath(path), error);
    };
    const std::filesystem::path place = whole(output);
    return (!error && host::system::NameKey(place) == host::system::NameKey(whole(file))) ||
           std::filesystem::equivalent(output, file, error);
}

void RefuseOutputOnto(const std::filesystem::path& output, const std::vector<CallFile>& files) {
    if (output.empty() || OutputFile::IsDevice(output)) {
        return;
    }
    for (const CallFile& other : files) {
        if (!other.file.empty() && !OutputFile::IsDevice(other.file) &&
            IsPlaceOf(output, other.file)) {
            throw Failure(kExitCaller, output, fmt::format("this is {}", other.what),
                          "name another file");
        }
    }
}

}  // namespace cliphost
