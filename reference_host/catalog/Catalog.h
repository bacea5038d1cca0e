// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <functional>
#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "reference_host/catalog/Database.h"

namespace catalog {

// A row's cells by the names of their columns; one that is not there is null. Numbers are texts
// here: the column makes them numbers.
using Row = std::map<std::string, std::string>;
// What a catalog has of one movie: rows by the names of the tables. "movies" has one, with the
// movie's number in "id"; pictures are bytes.
using Entry = std::map<std::string, std::vector<Row>>;

// A catalog of movies in a file. Throws NoCatalog or a DatabaseError.
class Catalog {
public:
    enum class For {
        Reading,  // the file stays as it is; one of an older version is brought up in memory
        Changing,
        Making  // of a file that nobody else has: where the program ends early, the file is lost
    };
    Catalog(const std::filesystem::path& file, For what);
    ~Catalog();
    Catalog(Catalog&&) noexcept;
    Catalog& operator=(Catalog&&) noexcept;

    // By what a movie is known that need not be read again.
    struct Known {
        std::uint64_t size = 0;
        std::int64_t date = 0;
        std::string settings;
        bool hasFailed = false;
    };
    std::optional<Known> Find(std::string_view path);
    // All that is known of a movie.
    std::optional<Entry> Read(std::string_view path);
    // The paths that begin so, in their order.
    std::vector<std::string> PathsThatBegin(const std::string& text);

    // Each takes the place of what is there of its path; all or none.
    void Put(const std::vector<Entry>& entries);
    void Remove(const std::vector<std::string>& paths);
    // Takes the movies of another catalog; of one that both have, that which was looked at last,
    // and of two as late, what is here.
    void Take(Catalog& other);

    std::int64_t Count();
    Database& database() { return *database_; }

private:
    struct Statements;
    Statements& statements();

    std::unique_ptr<Database> database_;
    std::unique_ptr<Statements> statements_;
};

// Whether a catalog lies there, by the header of the file alone: what is behind it may be damaged.
// False where nothing does; throws NoCatalog or a DatabaseError for anything else.
bool IsCatalog(const std::filesystem::path& file);

}  // namespace catalog
