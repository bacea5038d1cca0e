// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/catalog/Catalog.h"

#include <algorithm>
#include <fstream>
#include <system_error>

#include "reference_host/catalog/Schema.h"

namespace catalog {
namespace {

constexpr char kPicture[] = "picture";  // the one column of bytes

std::vector<std::string> NamesIn(std::string_view list) {
    std::vector<std::string> names;
    for (std::size_t at = 0; at < list.size();) {
        const std::size_t end = std::min(list.find(", ", at), list.size());
        names.emplace_back(list.substr(at, end - at));
        at = end + 2;
    }
    return names;
}

std::string InsertInto(const Table& table, std::size_t columns) {
    std::string sql = std::string("INSERT INTO ") + table.name + " (" + table.key + ", " +
                      table.columns + ") VALUES (?";
    for (std::size_t i = 0; i < columns; ++i) {
        sql += ", ?";
    }
    return sql + ")";
}

std::string SelectFrom(const Table& table) {
    return std::string("SELECT ") + table.key + ", " + table.columns + " FROM " + table.name +
           " WHERE " + table.key + " = ? ORDER BY " + table.order;
}

// Of the header of the library's files.
constexpr std::size_t kHeaderSize = 100;
constexpr char kFileMark[] = "SQLite format 3";  // with its byte of zero
constexpr std::size_t kVersionAt = 60;
constexpr std::size_t kApplicationAt = 68;

std::int32_t BigEndian32(const char* bytes) {
    std::uint32_t number = 0;
    for (int i = 0; i < 4; ++i) {
        number = number << 8 | static_cast<unsigned char>(bytes[i]);
    }
    return static_cast<std::int32_t>(number);
}

// Behind all texts that begin with this one.
std::string Behind(std::string text) {
    while (!text.empty() && static_cast<unsigned char>(text.back()) == 0xFF) {
        text.pop_back();
    }
    if (!text.empty()) {
        ++text.back();
    }
    return text;
}

}  // namespace

// Prepared once for all movies.
struct Catalog::Statements {
    struct OfTable {
        std::vector<std::string> columns;
        Statement insert;
        Statement select;
    };

    explicit Statements(Database& database)
        : find(database.Prepare("SELECT size, date, settings, failed FROM movies WHERE path = ?")),
          removeTexts(database.Prepare(kRemoveTexts)),
          remove(database.Prepare("DELETE FROM movies WHERE path = ?1 OR id = ?2")),
          looked(database.Prepare("SELECT looked FROM movies WHERE path = ?")),
          fillTexts(database.Prepare(kFillTexts)) {
        for (std::size_t i = 0; i < kTableCount; ++i) {
            std::vector<std::string> columns = NamesIn(kTables[i].columns);
            Statement insert = database.Prepare(InsertInto(kTables[i], columns.size()));
            tables.push_back(
                {std::move(columns), std::move(insert), database.Prepare(SelectFrom(kTables[i]))});
        }
    }

    // The child rows go with the movie. `id`: of what comes in its place, which another path may
    // have where somebody has changed paths.
    void Remove(std::string_view path, std::string_view id = {}) {
        for (Statement* const each : {&removeTexts, &remove}) {
            each->Bind(1, path);
            if (!id.empty()) {
                each->Bind(2, id);
            }
            each->Do();
        }
    }

    Statement find;
    Statement removeTexts;
    Statement remove;
    Statement looked;
    Statement fillTexts;
    std::vector<OfTable> tables;
};

Catalog::Catalog(const std::filesystem::path& file, For what)
    : database_(std::make_unique<Database>(file, what == For::Reading ? Database::Access::Read
                                                 : what == For::Making
                                                     ? Database::Access::Make
                                                     : Database::Access::Change)) {
    if (what == For::Making) {
        database_->Run("PRAGMA journal_mode = MEMORY; PRAGMA synchronous = OFF");
    } else if (VersionOf(*database_) == static_cast<std::int64_t>(kSteps.count)) {
        return;
    } else if (what == For::Reading) {
        auto copy = std::make_unique<Database>();
        copy->CopyFrom(*database_);
        database_ = std::move(copy);
    }
    BringUp(*database_);
}

Catalog::~Catalog() = default;
Catalog::Catalog(Catalog&&) noexcept = default;
Catalog& Catalog::operator=(Catalog&&) noexcept = default;

Catalog::Statements& Catalog::statements() {
    if (!statements_) {
        statements_ = std::make_unique<Statements>(*database_);
    }
    return *statements_;
}

std::optional<Catalog::Known> Catalog::Find(std::string_view path) {
    Statement& find = statements().find;
    std::optional<Known> known;
    find.Bind(1, path);
    while (find.Step()) {
        known = Known{static_cast<std::uint64_t>(find.Integer(0)), find.Integer(1), find.Text(2),
                      find.Integer(3) != 0};
    }
    return known;
}

std::optional<Entry> Catalog::Read(std::string_view path) {
    Statement find = database_->Prepare("SELECT id FROM movies WHERE path = ?");
    find.Bind(1, path);
    if (!find.Step()) {
        return std::nullopt;
    }
    Entry entry;
    for (std::size_t t = 0; t < kTableCount; ++t) {
        std::vector<Row>& rows = entry[kTables[t].name];
        Statement& select = statements().tables[t].select;
        select.Bind(1, find.Integer(0));
        while (select.Step()) {
            Row& row = rows.emplace_back();
            for (int column = 0; column < select.Columns(); ++column) {
                if (!select.IsNull(column)) {
                    row[select.NameOf(column)] = select.Text(column);
                }
            }
        }
    }
    return entry;
}

std::vector<std::string> Catalog::PathsThatBegin(const std::string& text) {
    Statement select =
        database_->Prepare("SELECT path FROM movies WHERE path >= ?1 AND path < ?2 ORDER BY path");
    select.Bind(1, text).Bind(2, Behind(text));
    std::vector<std::string> paths;
    while (select.Step()) {
        paths.push_back(select.Text(0));
    }
    return paths;
}

void Catalog::Put(const std::vector<Entry>& entries) {
    Statements& all = statements();
    Transaction together(*database_);
    for (const Entry& entry : entries) {
        const Row& movie = entry.at("movies").at(0);
        const std::string& id = movie.at("id");
        all.Remove(movie.at("path"), id);
        for (std::size_t t = 0; t < kTableCount; ++t) {
            const auto rows = entry.find(kTables[t].name);
            if (rows == entry.end()) {
                continue;
            }
            Statements::OfTable& table = all.tables[t];
            for (const Row& row : rows->second) {
                table.insert.Bind(1, id);
                for (std::size_t c = 0; c < table.columns.size(); ++c) {
                    const auto cell = row.find(table.columns[c]);
                    if (cell == row.end()) {
                        continue;
                    }
                    const int parameter = static_cast<int>(c) + 2;
                    if (cell->first == kPicture) {
                        table.insert.BindBytes(parameter, cell->second);
                    } else {
                        table.insert.Bind(parameter, cell->second);
                    }
                }
                table.insert.Do();
            }
        }
        all.fillTexts.Bind(1, id).Do();
    }
    together.Commit();
}

void Catalog::Remove(const std::vector<std::string>& paths) {
    Transaction together(*database_);
    for (const std::string& path : paths) {
        statements().Remove(path);
    }
    together.Commit();
}

void Catalog::Take(Catalog& other) {
    Statements& all = statements();
    Statements& from = other.statements();
    Transaction together(*database_);
    Statement movies = other.database_->Prepare("SELECT id, path, looked FROM movies ORDER BY id");
    while (movies.Step()) {
        const std::string path = movies.Text(1);
        bool isHere = false;
        all.looked.Bind(1, path);
        while (all.looked.Step()) {
            isHere = all.looked.Integer(0) >= movies.Integer(2);
        }
        if (isHere) {
            continue;
        }
        all.Remove(path, movies.Text(0));
        for (std::size_t t = 0; t < kTableCount; ++t) {
            Statement& row = from.tables[t].select;
            Statement& insert = all.tables[t].insert;
            row.Bind(1, movies.Integer(0));
            while (row.Step()) {
                for (int column = 0; column < row.Columns(); ++column) {
                    insert.BindCell(column + 1, row, column);
                }
                insert.Do();
            }
        }
        all.fillTexts.Bind(1, movies.Integer(0)).Do();
    }
    together.Commit();
}

std::int64_t Catalog::Count() {
    return database_->Number("SELECT count(*) FROM movies");
}

bool IsCatalog(const std::filesystem::path& file) {
    std::error_code error;
    const auto status = std::filesystem::status(file, error);
    if (!std::filesystem::exists(status)) {
        return false;
    }
    char header[kHeaderSize] = {};
    std::ifstream stream(file, std::ios::binary);
    if (!stream) {
        Database(file, Database::Access::Read);  // tells why
    }
    stream.read(header, sizeof header);
    const auto size = static_cast<std::size_t>(stream.gcount());
    if (size > 0 && (size < sizeof header || std::string_view(header, sizeof kFileMark) !=
                                                 std::string_view(kFileMark, sizeof kFileMark))) {
        throw DatabaseError::NoDatabase();
    }
    CheckStamp({BigEndian32(header + kApplicationAt), BigEndian32(header + kVersionAt)});
    return true;
}

}  // namespace catalog
