// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/MovieColumns.h"

#include <fmt/format.h>

#include <algorithm>

#include "reference_host/cliphost/CsvTable.h"
#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/cliphost/TimecodeText.h"
#include "reference_host/cliphost/Words.h"
#include "reference_host/system/Paths.h"
#include "reference_host/util/text/FileUrl.h"

namespace cliphost {
namespace {

struct Use {
    std::string_view name;
    ColumnUse use;
};
constexpr Use kUses[] = {
    {"path", ColumnUse::Path},
    {"name", ColumnUse::Name},
    {"reel", ColumnUse::Reel},
    {"tape", ColumnUse::Reel},
    {"start timecode", ColumnUse::Start},
    {"start tc", ColumnUse::Start},
    {"start", ColumnUse::Start},
    {"length", ColumnUse::PassedOver},
    {"rate", ColumnUse::PassedOver},
    {"tracks", ColumnUse::PassedOver},
    {"codec", ColumnUse::PassedOver},
};

}  // namespace

ColumnUse UseOf(std::string_view name) {
    const std::string small = InSmallLetters(std::string(name));
    const auto* const known = std::find_if(std::begin(kUses), std::end(kUses),
                                           [&](const Use& use) { return use.name == small; });
    return known == std::end(kUses) ? ColumnUse::Comment : known->use;
}

MovieColumns::MovieColumns(std::filesystem::path file) : file_(std::move(file)) {
    Load(ReadCsvFile(file_));
}

MovieColumns::MovieColumns(std::filesystem::path file, std::string_view bytes)
    : file_(std::move(file)) {
    Load(ParseCsv(file_, bytes));
}

void MovieColumns::Load(CsvTable table) {
    header_ = std::move(table.header);
    LoadHeader();
    for (const CsvTable::Row& row : table.rows) {
        LoadRow(row.cells, row.number);
    }
}

void MovieColumns::LoadHeader() {
    std::unordered_map<std::string, std::size_t> known;
    for (std::size_t i = 0; i < header_.size(); ++i) {
        const ColumnUse use = cliphost::UseOf(header_[i]);
        const bool isOnce = use == ColumnUse::Reel || use == ColumnUse::Start;
        const std::string key =
            isOnce ? std::to_string(static_cast<int>(use)) : InSmallLetters(header_[i]);
        const auto [first, isNew] = known.emplace(key, i);
        if (!isNew && !header_[i].empty()) {
            throw Failure(kExitCaller, file_,
                          fmt::format("row 1: columns {} and {} ({}) are for the same",
                                      first->second + 1, i + 1, header_[i]),
                          "leave one out");
        }
        if (!header_[i].empty() && header_[i].front() == '_') {
            throw Failure(kExitCaller, file_,
                          fmt::format("row 1: column {}: names that begin with _ are for programs",
                                      header_[i]),
                          "rename it or leave it out");
        }
        uses_.push_back(use);
        if (use == ColumnUse::Path) {
            path_ = i;
        } else if (use == ColumnUse::Name) {
            name_ = i;
        }
    }
    if (!path_ && !name_) {
        throw Failure(kExitCaller, file_, "no column tells which movie a row is for",
                      "its first row must name one path or name");
    }
}

void MovieColumns::LoadRow(const std::vector<std::string>& cells, std::uint64_t number) {
    const std::size_t which = path_ && !cells[*path_].empty() ? *path_ : name_.value_or(*path_);
    Row row{number, cells[which], {}};
    if (row.movie.empty()) {
        throw Failure(kExitCaller, file_, fmt::format("row {}: it names no movie", number));
    }
    for (std::size_t i = 0; i < cells.size(); ++i) {
        if (cells[i].empty() || i == which || uses_[i] == ColumnUse::PassedOver ||
            uses_[i] == ColumnUse::Path) {
            continue;
        }
        row.values.push_back({i, cells[i]});
        CheckValue(row, row.values.back());
    }
    if (host::text::IsFileUrl(row.movie)) {
        host::system::PathTextOfUrl(row.movie, row.movie);  // what it leaves is no movie's path
    }
    const auto add = [&](std::unordered_map<std::string, std::size_t>& rows,
                         const std::string& key) {
        if (const auto [known, isNew] = rows.emplace(key, rows_.size()); !isNew) {
            throw Failure(kExitCaller, file_,
                          fmt::format("rows {} and {} are both for {}", rows_[known->second].number,
                                      number, row.movie),
                          "leave one out, or name movies by their paths");
        }
    };
    const std::filesystem::path movie = host::system::PathOfText(row.movie);
    add(byPath_, host::system::PathText(AbsolutePath(movie)));
    if (!movie.has_parent_path()) {
        add(byName_, row.movie);
    }
    rows_.push_back(std::move(row));
}

void MovieColumns::CheckValue(const Row& row, const Value& value) const {
    if (NameOf(value).empty()) {
        throw Failure(kExitCaller, file_,
                      fmt::format("row {}: column {} has no name in the first row", row.number,
                                  value.column + 1));
    }
    if (UseOf(value) == ColumnUse::Start && !ReadTimecode(value.text)) {
        throw Failure(kExitCaller, file_,
                      fmt::format("row {}, column {}: '{}' is no timecode", row.number,
                                  NameOf(value), value.text),
                      "write it such as 01:00:00:00, or 01:00:00;00 where frames are dropped");
    }
}

const MovieColumns::Row* MovieColumns::Find(const std::filesystem::path& movie) const {
    if (const auto row = byPath_.find(host::system::PathText(AbsolutePath(movie)));
        row != byPath_.end()) {
        return &rows_[row->second];
    }
    for (const std::filesystem::path& name : {movie.filename(), movie.stem()}) {
        if (const auto row = byName_.find(host::system::PathText(name)); row != byName_.end()) {
            return &rows_[row->second];
        }
    }
    return nullptr;
}

void GivenColumns::Read() {
    if (!file.empty()) {
        table = std::make_shared<const MovieColumns>(file);
    }
}

}  // namespace cliphost
