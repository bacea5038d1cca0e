// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/OutputProblem.h"

#include <fmt/format.h>

#include <cerrno>
#include <system_error>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/framework/HostPath.h"

namespace cliphost {
namespace {

// What helps where an output can't be written; {} is the folder it lies in.
struct Row {
    int error;
    const char* hint;
};
constexpr Row kRows[] = {
    {ENOSPC, "make room there or name another place"},
#ifdef EDQUOT
    {EDQUOT, "make room there or name another place"},
#endif
    {EROFS, "name another place"},
    {EACCES, "get permission to write there or name another place"},
    {EPERM, "get permission to write there or name another place"},
    {EFBIG, "raise the limit of a file's size or write less"},
    {ENOENT, "make the folder {} first"},
    {ENOTDIR, "name another place"},
    {EISDIR, "a folder is there: name another file"},
    {EEXIST, "name another folder"},
    {ELOOP, "name another file"},
    {ENAMETOOLONG, "take a shorter name"},
    {EIO, nullptr},  // nothing that we know
};

std::string SystemText(int error) {
    return std::generic_category().message(error);
}

std::string HintFor(const std::filesystem::path& output, int error) {
    std::error_code ignored;
    const std::filesystem::path folder = AbsolutePath(output).parent_path();
    for (const Row& row : kRows) {
        if (row.error == error && row.hint &&
            (error != ENOENT || !std::filesystem::exists(folder, ignored))) {
            return fmt::format(fmt::runtime(row.hint), host::DisplayPath(folder));
        }
    }
    return {};
}

}  // namespace

Problem NotWritten(const std::filesystem::path& output, int error) {
    return {output, "not written: " + SystemText(error), HintFor(output, error)};
}

Problem FolderNotMade(const std::filesystem::path& folder, int error) {
    return {folder, "the folder can't be made: " + SystemText(error), HintFor(folder, error)};
}

int SystemErrorIn(std::string_view sentence) {
    for (const Row& row : kRows) {
        const std::string words = SystemText(row.error);
        if (sentence.size() >= words.size() &&
            sentence.substr(sentence.size() - words.size()) == words) {
            return row.error;
        }
    }
    return 0;
}

}  // namespace cliphost
