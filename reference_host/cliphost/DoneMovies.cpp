// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/DoneMovies.h"

#include <fmt/format.h>

#include <algorithm>
#include <fstream>
#include <nlohmann/json.hpp>
#include <random>
#include <tuple>

#include "host_interfaces/Version.h"
#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/cliphost/OutputProblem.h"
#include "reference_host/cliphost/Session.h"
#include "reference_host/system/FileSystem.h"
#include "reference_host/system/Paths.h"
#include "reference_host/util/text/FileUrl.h"

namespace cliphost {
namespace {

using host::system::FileState;
using host::system::StateOf;
using host::text::PercentEncoded;
using nlohmann::ordered_json;

constexpr char kEnding[] = ".jsonl";

bool StartsWith(const std::string& text, std::string_view start) {
    return text.compare(0, start.size(), start) == 0;
}

// Options that change what is shown, or that name files which count by their content.
bool ChangesNoOutput(const std::string& argument) {
    static constexpr std::string_view kNames[] = {
        "-v",          "-q",           "--quiet", "--json", "--jsonl", "--plugin", "--aaf-library",
        "--no-config", "--columns-out"};
    return std::any_of(std::begin(kNames), std::end(kNames), [&](std::string_view name) {
        return StartsWith(argument, name) &&
               (argument.size() == name.size() || argument[name.size()] == '=');
    });
}

std::string DigestTextOfFile(const std::filesystem::path& file) {
    const std::optional<Digest> digest = DigestOfFile(file);
    return digest ? TextOf(*digest) : "none";
}

// Of an output's name in the form of the lines; empty: it is none.
std::filesystem::path PathOfName(const std::string& name) {
    std::string text;
    return host::text::PercentDecoded(name, text) ? host::system::PathOfText(text)
                                                  : std::filesystem::path();
}

std::string KeyOfOutput(const std::filesystem::path& output) {
    return host::system::PathText(host::system::NameKey(output));
}

std::string BytesOfDigest(const std::string& text) {
    const Digest digest = DigestOf(text);
    return {digest.begin(), digest.end()};
}

[[noreturn]] void FailToKeep(Problem problem) {
    problem.hint = "--skip-done will not find the outputs of this run";
    throw Failure(kExitCaller, std::move(problem));
}

}  // namespace

std::string SettingsText(const Session& session, const std::vector<std::string>& arguments) {
    std::string all = PRODUCT_VERSION_TEXT;
    std::vector<std::filesystem::path> files = session.DataFiles();
    files.push_back(session.plugin().file());
    files.push_back(session.aaf().file());
    for (const std::filesystem::path& file : files) {
        all += '\n' + DigestTextOfFile(file);
    }
    constexpr std::string_view kMap = "--map=";
    constexpr std::string_view kFiles[] = {"--set-xml=", "--columns="};
    for (const std::string& argument : arguments) {
        if (ChangesNoOutput(argument)) {
            continue;
        }
        all += '\0' + argument;
        for (const std::string_view option : kFiles) {
            if (StartsWith(argument, option)) {
                all += '\0' +
                       DigestTextOfFile(host::system::PathOfText(argument.substr(option.size())));
            }
        }
        if (StartsWith(argument, kMap) && argument[kMap.size()] != '/') {
            all += '\0' +
                   host::system::PathText(std::filesystem::current_path());  // FROM may be relative
        }
    }
    return TextOf(DigestOf(all));
}

std::string DoneMovies::KeyOf(const std::string& movie, const std::string& output) const {
    return BytesOfDigest(movie + '\0' + output);
}

std::vector<std::filesystem::path> DoneMovies::Load() {
    std::vector<std::filesystem::path> unread;
    std::error_code error;
    std::filesystem::directory_iterator entry(outFolder_ / kFolder, error);
    for (; !error && entry != std::filesystem::directory_iterator(); entry.increment(error)) {
        std::error_code ignored;
        if (entry->path().extension() != kEnding || !entry->is_regular_file(ignored)) {
            continue;
        }
        std::ifstream lines(entry->path(), std::ios::binary);
        std::string line;
        while (std::getline(lines, line) && !lines.eof()) {  // the last one may have no end
            LoadLine(line);
        }
        if (!lines.eof()) {
            unread.push_back(entry->path());
        }
    }
    outputsByOwner_.clear();
    for (const auto& [key, owner] : owners_) {
        outputsByOwner_.emplace(owner.movie, owner.output);
    }
    std::sort(unread.begin(), unread.end());
    return unread;
}

// The files come in any order; the date tells which line is the last.
void DoneMovies::NoteOwner(const std::string& movie, const std::string& output, std::int64_t date) {
    Owner owner{date, BytesOfDigest(movie), output};
    Owner& last = owners_[KeyOfOutput(PathOfName(output))];
    if (last.movie.empty() || std::tie(last.date, last.movie) < std::tie(owner.date, owner.movie)) {
        last = std::move(owner);
    }
}

// A line that is none is passed over. One of other settings tells the name of the output alone.
void DoneMovies::LoadLine(const std::string& line) {
    const ordered_json json = ordered_json::parse(line, nullptr, false);
    if (!json.is_object()) {
        return;
    }
    const auto text = [&](const char* name) {
        const auto member = json.find(name);
        return member != json.end() && member->is_string() ? member->get<std::string>() : "";
    };
    const auto state = [&](const char* size, const char* date, FileState& into) {
        const auto bytes = json.find(size);
        const auto written = json.find(date);
        const bool isThere = bytes != json.end() && bytes->is_number_unsigned() &&
                             written != json.end() && written->is_number_integer();
        if (isThere) {
            into = {bytes->get<std::uint64_t>(), written->get<std::int64_t>()};
        }
        return isThere;
    };
    Output output;
    if (!state("size", "date", output.movie) || !state("outputSize", "outputDate", output.state) ||
        text("movie").empty() || text("output").empty()) {
        return;
    }
    NoteOwner(text("movie"), text("output"), output.state.date);
    if (text("settings") == settings_) {
        output.digest = text("outputDigest");
        outputs_.emplace(KeyOf(text("movie"), text("output")), std::move(output));
    }
}

bool DoneMovies::Has(const std::filesystem::path& movie, const FileState& state,
                     const std::filesystem::path& output) const {
    const auto [first, last] = outputs_.equal_range(
        KeyOf(AbsoluteMachinePath(movie), PercentEncoded(host::system::PathText(output))));
    if (first == last) {
        return false;
    }
    const std::filesystem::path file = outFolder_ / output;
    const std::optional<FileState> there = StateOf(file);
    std::string digest;
    return there && std::any_of(first, last, [&](const auto& entry) {
               const Output& known = entry.second;
               if (!(known.movie == state) || known.state.size != there->size) {
                   return false;
               }
               if (known.state.date == there->date) {
                   return true;
               }
               if (digest.empty() && !known.digest.empty()) {
                   digest = DigestTextOfFile(file);
               }
               return !known.digest.empty() && known.digest == digest;
           });
}

std::vector<std::filesystem::path> DoneMovies::OutputsOf(const std::filesystem::path& movie) const {
    std::vector<std::filesystem::path> outputs;
    const auto [first, last] =
        outputsByOwner_.equal_range(BytesOfDigest(AbsoluteMachinePath(movie)));
    std::for_each(first, last, [&](const auto& entry) {
        if (std::filesystem::path name = PathOfName(entry.second); !name.empty()) {
            outputs.push_back(std::move(name));
        }
    });
    return outputs;
}

bool DoneMovies::Keeps(const std::filesystem::path& output) const {
    return owners_.count(KeyOfOutput(output)) > 0 && StateOf(outFolder_ / output);
}

void DoneMovies::Begin() {
    const std::filesystem::path folder = outFolder_ / kFolder;
    std::error_code error;
    std::filesystem::create_directory(folder, error);
    if (error) {
        FailToKeep(FolderNotMade(folder, error.default_error_condition().value()));
    }
    std::random_device random;
    written_ = folder / fmt::format("{:08x}{:08x}{}", random(), random(), kEnding);
    if (const int failed = stream_.Open(written_)) {
        FailToKeep(NotWritten(written_, failed));
    }
}

void DoneMovies::Add(const std::filesystem::path& movie, const FileState& state,
                     const std::filesystem::path& output, Known known) {
    if (written_.empty()) {
        Begin();
    }
    const std::filesystem::path file = outFolder_ / output;
    const std::optional<FileState> there = StateOf(file);
    if (!there) {
        return;  // it was taken away already
    }
    ordered_json line = {{"movie", AbsoluteMachinePath(movie)},
                         {"size", state.size},
                         {"date", state.date},
                         {"output", PercentEncoded(host::system::PathText(output))},
                         {"outputSize", there->size},
                         {"outputDate", there->date}};
    if (known == Known::ByContent) {
        line["outputDigest"] = DigestTextOfFile(file);
    }
    line["settings"] = settings_;
    // At once, so that no other line gets into it.
    const std::string text = line.dump() + '\n';
    if (const int failed = stream_.Write(text.data(), text.size())) {
        FailToKeep(NotWritten(written_, failed));
    }
}

}  // namespace cliphost
