// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <filesystem>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

namespace cliphost {

// What a column of a table of movies is for.
enum class ColumnUse { Path, Name, Reel, Start, PassedOver, Comment };
// By its name in any case; what has no use of its own is a column of the bin.
ColumnUse UseOf(std::string_view name);

// The columns that a written table begins with, in their order.
inline constexpr const char* kFixedColumns[] = {"path",   "name", "reel",   "start timecode",
                                                "length", "rate", "tracks", "codec"};

// What a table tells of movies: a row for each, that names it by its path or by its file's name.
class MovieColumns {
public:
    struct Value {
        std::size_t column;
        std::string text;
    };
    struct Row {
        std::uint64_t number;
        std::string movie;          // as it stands there
        std::vector<Value> values;  // without empty ones
    };

    // Throws a Failure that names the row and the column.
    explicit MovieColumns(std::filesystem::path file);
    MovieColumns(std::filesystem::path file, std::string_view bytes);

    const std::filesystem::path& file() const { return file_; }
    const std::vector<Row>& rows() const { return rows_; }
    const std::string& NameOf(const Value& value) const { return header_[value.column]; }
    ColumnUse UseOf(const Value& value) const { return uses_[value.column]; }

    // The row of a movie: by its full path, or else by its file's name, with or without the ending.
    const Row* Find(const std::filesystem::path& movie) const;

private:
    void Load(struct CsvTable table);
    void LoadHeader();
    void LoadRow(const std::vector<std::string>& cells, std::uint64_t number);
    void CheckValue(const Row& row, const Value& value) const;

    std::filesystem::path file_;
    std::vector<std::string> header_;
    std::vector<ColumnUse> uses_;
    std::optional<std::size_t> path_, name_;
    std::vector<Row> rows_;
    std::unordered_map<std::string, std::size_t> byPath_;
    std::unordered_map<std::string, std::size_t> byName_;
};

// The table that a command line may name.
struct GivenColumns {
    std::filesystem::path file;                 // empty: none
    std::shared_ptr<const MovieColumns> table;  // once it is read

    void Read();  // throws a Failure
};

}  // namespace cliphost
