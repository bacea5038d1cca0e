// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <filesystem>
#include <memory>
#include <stdexcept>
#include <string>
#include <string_view>
#include <utility>

struct sqlite3;
struct sqlite3_stmt;

namespace catalog {

// What the database library refused, in its words and with its code.
class DatabaseError : public std::runtime_error {
public:
    DatabaseError(int code, const std::string& words, int systemError = 0,
                  std::filesystem::path file = {})
        : std::runtime_error(words),
          code_(code),
          systemError_(systemError),
          file_(std::move(file)) {}

    static DatabaseError NoDatabase();

    bool IsLocked() const;      // somebody else holds it
    bool IsNoDatabase() const;  // the file is of another kind
    bool IsDamaged() const;
    bool IsReadOnly() const;
    bool IsHalfWritten() const;  // a killed program left it so, and we may not write
    bool HasMoved() const;       // another file is in its place
    bool CantOpen() const;
    // What the system said of a write or another step; 0 where it said nothing.
    int SystemError() const;
    // As it was opened, of several; empty for one in memory.
    const std::filesystem::path& file() const { return file_; }

private:
    int code_;
    int systemError_;
    std::filesystem::path file_;
};

class Statement;

// An open database file. What it is asked comes from the program alone; values from elsewhere are
// bound. Throws a DatabaseError.
class Database {
public:
    // Read: no statement changes it.
    enum class Access { Read, Change, Make };
    // Somebody else's lock is waited for so long.
    static constexpr int kPatience = 5000;  // milliseconds

    Database(const std::filesystem::path& file, Access access);
    // One in memory, without a file.
    Database();

    // Statements without an answer.
    void Run(const char* sql);
    Statement Prepare(std::string_view sql);
    // The number that a statement answers with; 0 for none.
    std::int64_t Number(std::string_view sql);
    // Takes what another one holds in place of its own; errors name the other's file from then on.
    void CopyFrom(Database& other);

private:
    friend class Statement;
    struct Closing {
        void operator()(sqlite3* handle) const;
    };
    void Open(const char* name, int flags);
    [[noreturn]] void Fail(int code);

    std::filesystem::path file_;
    std::unique_ptr<sqlite3, Closing> handle_;
};

// A statement that may be done many times. Parameters count from 1, columns from 0.
class Statement {
public:
    Statement& Bind(int parameter, std::int64_t value);
    Statement& Bind(int parameter, double value);
    Statement& Bind(int parameter, std::string_view text);
    Statement& BindBytes(int parameter, std::string_view bytes);
    // As it is in a row that another statement is at.
    Statement& BindCell(int parameter, const Statement& row, int column);

    // Whether there is a row; behind the last one, the statement can be done anew.
    bool Step();
    // Does it once, for what answers with nothing.
    void Do();

    int Columns() const;
    const char* NameOf(int column) const;
    bool IsNull(int column) const;
    bool IsInteger(int column) const;
    bool IsReal(int column) const;
    std::int64_t Integer(int column) const;
    double Real(int column) const;
    std::string Text(int column) const;

private:
    friend class Database;
    struct Finishing {
        void operator()(sqlite3_stmt* handle) const;
    };
    Statement(Database& database, sqlite3_stmt* handle) : database_(&database), handle_(handle) {}
    Statement& Check(int code);

    Database* database_;
    std::unique_ptr<sqlite3_stmt, Finishing> handle_;
};

// All that is done while it lives counts together, or not at all: Commit, or nothing.
class Transaction {
public:
    explicit Transaction(Database& database);
    ~Transaction();
    Transaction(const Transaction&) = delete;
    Transaction& operator=(const Transaction&) = delete;
    void Commit();

private:
    Database& database_;
    bool isOpen_ = true;
};

}  // namespace catalog
