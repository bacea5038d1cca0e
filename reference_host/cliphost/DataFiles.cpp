// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/DataFiles.h"

#include <fmt/format.h>

#include "reference_host/xml/EventReader.h"
#include "reference_host/xml/InputFile.h"

namespace cliphost {
namespace {

constexpr const char* kPutBack = "put back the one that belongs to the module";

// "line 3, column 7: what is wrong" out of "3:7: what is wrong".
std::string InWords(const std::string& problem) {
    const std::size_t line = problem.find(':');
    const std::size_t column = line == std::string::npos ? line : problem.find(':', line + 1);
    return column == std::string::npos
               ? problem
               : fmt::format("line {}, column {}{}", problem.substr(0, line),
                             problem.substr(line + 1, column - line - 1), problem.substr(column));
}

Problem DocumentProblem(const std::filesystem::path& file) {
    host::XmlEvents events;
    host::EventReader reader(events, nullptr);
    std::string problem;
    const NCFRESULT result = host::ReadInputFile(
        file,
        [&](const char* bytes, std::size_t size, bool last) {
            return reader.Feed(bytes, size, last);
        },
        problem);
    if (!problem.empty()) {
        return {file, "this data file can't be read: " + problem, kPutBack};
    }
    if (result < 0) {
        return {file, "this data file is broken, " + InWords(reader.problem()), kPutBack};
    }
    return {};
}

}  // namespace

Problem DataFileProblem(const Session& session) {
    const std::vector<std::filesystem::path> files = session.DataFiles();
    for (const std::filesystem::path& file : files) {
        std::error_code ignored;
        if (!std::filesystem::exists(std::filesystem::symlink_status(file, ignored))) {
            return {file, "this data file is missing", "put it back beside the module"};
        }
    }
    for (const std::filesystem::path& file : files) {
        if (Problem problem = DocumentProblem(file)) {
            return problem;
        }
    }
    return {};
}

}  // namespace cliphost
