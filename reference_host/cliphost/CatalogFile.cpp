// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/CatalogFile.h"

#include <fmt/format.h>

#include <cerrno>

#include "reference_host/cliphost/FileAccess.h"
#include "reference_host/cliphost/OutputProblem.h"

namespace cliphost {
namespace {

using catalog::Catalog;
using catalog::DatabaseError;

// Whether a catalog is there that may be replaced. Throws a Failure for anything else.
bool IsThere(const std::filesystem::path& file) {
    if (OutputFile::IsDevice(file)) {
        throw Failure(kExitCaller, file, "a catalog has to be a file", "name one");
    }
    std::error_code ignored;
    if (std::filesystem::is_directory(file, ignored)) {
        throw Failure(kExitCaller, NotWritten(file, EISDIR));
    }
    return WithCatalog(file, [&] { return catalog::IsCatalog(file); });
}

// Hints for movies don't help.
std::string HintForCatalog(const std::filesystem::path& file, const std::string& hint) {
    std::error_code ignored;
    if (std::filesystem::is_directory(file, ignored)) {
        return "name a catalog in it";
    }
    const bool isEmpty =
        std::filesystem::is_regular_file(file, ignored) && std::filesystem::is_empty(file, ignored);
    return isEmpty ? "remove it, and make it anew" : hint;
}

// What a killed program leaves beside a catalog belongs to that one alone: the library would put it
// into another.
void RemoveLeftovers(const std::filesystem::path& catalog) {
    for (const char* const ending : {"-journal", "-wal", "-shm"}) {
        std::filesystem::path leftover = catalog;
        std::error_code ignored;
        std::filesystem::remove(leftover += ending, ignored);
    }
}

}  // namespace

Failure CatalogFailure(const std::filesystem::path& file, const DatabaseError& error) {
    if (error.IsNoDatabase()) {
        return {kExitCaller, file, "is no SQLite file, so it is no catalog"};
    }
    if (error.IsLocked()) {
        return {kExitCaller, file,
                fmt::format("another program has kept it locked for {} seconds",
                            catalog::Database::kPatience / 1000),
                "try again when that is done"};
    }
    if (error.IsDamaged()) {
        return {kExitCaller, file, fmt::format("the catalog is damaged: {}", error.what()),
                "make it anew, without --update"};
    }
    if (error.IsHalfWritten()) {
        return {kExitCaller, file,
                "a program was killed that wrote to it, and what it began can't be taken back here",
                "get permission to write to it and to its folder"};
    }
    if (error.HasMoved()) {
        return {kExitCaller, file, "another run has replaced it", "start this one again"};
    }
    if (error.IsReadOnly()) {
        return {kExitCaller, NotWritten(file, EACCES)};
    }
    if (error.SystemError() != 0 && !error.CantOpen()) {
        return {kExitCaller, NotWritten(file, error.SystemError())};
    }
    return {kExitCaller, file, fmt::format("the database library says: {}", error.what())};
}

Failure CatalogFailure(const std::filesystem::path& file, const catalog::NoCatalog& error) {
    return {kExitCaller, file, error.what()};
}

Catalog OpenCatalog(const std::filesystem::path& file, Catalog::For what) {
    if (Problem problem = WhyUnreadable(file)) {
        problem.hint = HintForCatalog(file, problem.hint);
        throw Failure(kExitCaller, std::move(problem));
    }
    return WithCatalog(file, [&] { return Catalog(file, what); });
}

NewCatalog::NewCatalog(const std::filesystem::path& file)
    : file_(file), takesPlace_(IsThere(file)), output_(file, OutputFile::Writer::Other) {
    // What the system says of the place is plainer than what the library does.
    output_.TryPlace();
    WithCatalog(file_, [&] { catalog_.emplace(output_.NameForOther(), Catalog::For::Making); });
}

void NewCatalog::Finish() {
    catalog_.reset();
    RemoveLeftovers(output_.PlaceOfOther());
    output_.Finish();
}

void NewCatalog::FinishIfFree() {
    catalog_.reset();
    std::error_code error;
    if (!std::filesystem::exists(output_.PlaceOfOther(), error)) {
        RemoveLeftovers(output_.PlaceOfOther());
    }
    output_.FinishIfFree();
}

}  // namespace cliphost
