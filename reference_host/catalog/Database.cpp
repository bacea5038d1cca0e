// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/catalog/Database.h"

#include <sqlite3.h>

#include <cerrno>
#include <utility>

#include "reference_host/system/ErrorNumber.h"

namespace catalog {
namespace {

constexpr int kKindOfCode = 0xFF;  // the rest tells more

int FlagsOf(Database::Access access) {
    switch (access) {
        // Who reads may have to take back what a killed program has left half written. Where
        // nobody may write, the library opens it for reading.
        case Database::Access::Read:
        case Database::Access::Change:
            return SQLITE_OPEN_READWRITE;
        default:
            return SQLITE_OPEN_READWRITE | SQLITE_OPEN_CREATE;
    }
}

}  // namespace

DatabaseError DatabaseError::NoDatabase() {
    return {SQLITE_NOTADB, sqlite3_errstr(SQLITE_NOTADB)};
}

bool DatabaseError::IsLocked() const {
    const int kind = code_ & kKindOfCode;
    return kind == SQLITE_BUSY || kind == SQLITE_LOCKED;
}

bool DatabaseError::IsNoDatabase() const {
    return (code_ & kKindOfCode) == SQLITE_NOTADB;
}

bool DatabaseError::IsDamaged() const {
    return (code_ & kKindOfCode) == SQLITE_CORRUPT;
}

bool DatabaseError::IsReadOnly() const {
    return (code_ & kKindOfCode) == SQLITE_READONLY;
}

bool DatabaseError::IsHalfWritten() const {
    return code_ == SQLITE_READONLY_ROLLBACK || code_ == SQLITE_READONLY_RECOVERY;
}

bool DatabaseError::HasMoved() const {
    return code_ == SQLITE_READONLY_DBMOVED;
}

bool DatabaseError::CantOpen() const {
    return (code_ & kKindOfCode) == SQLITE_CANTOPEN;
}

int DatabaseError::SystemError() const {
    const int kind = code_ & kKindOfCode;
    return kind == SQLITE_FULL                               ? ENOSPC
           : kind == SQLITE_IOERR || kind == SQLITE_CANTOPEN ? systemError_
                                                             : 0;
}

void Database::Closing::operator()(sqlite3* handle) const {
    sqlite3_close(handle);
}

Database::Database(const std::filesystem::path& file, Access access) : file_(file) {
    // A name of another form could mean something else than a file.
    const std::filesystem::path whole =
        file.has_root_directory() ? file : std::filesystem::absolute(file);
    Open(whole.u8string().c_str(), FlagsOf(access));
    if (access == Access::Read) {
        Run("PRAGMA query_only = ON");
    }
}

Database::Database() {
    Open(":memory:", FlagsOf(Access::Make));
}

void Database::Open(const char* name, int flags) {
    sqlite3* handle = nullptr;
    const int code = sqlite3_open_v2(name, &handle, flags, nullptr);
    handle_.reset(handle);
    if (code != SQLITE_OK) {
        Fail(code);
    }
    sqlite3_extended_result_codes(handle, 1);
    sqlite3_busy_timeout(handle, kPatience);
    // The file may come from anybody.
    sqlite3_db_config(handle, SQLITE_DBCONFIG_DEFENSIVE, 1, nullptr);
    sqlite3_db_config(handle, SQLITE_DBCONFIG_TRUSTED_SCHEMA, 0, nullptr);
    Run("PRAGMA cell_size_check = ON; PRAGMA foreign_keys = ON");
}

void Database::Fail(int code) {
    const std::string words = handle_ ? sqlite3_errmsg(handle_.get()) : sqlite3_errstr(code);
    if (!handle_) {
        throw DatabaseError(code, words, 0, file_);
    }
    const auto systemError = static_cast<unsigned long>(sqlite3_system_errno(handle_.get()));
    throw DatabaseError(sqlite3_extended_errcode(handle_.get()), words,
                        systemError == 0 ? 0 : host::system::ErrorNumber(systemError), file_);
}

void Database::Run(const char* sql) {
    const int code = sqlite3_exec(handle_.get(), sql, nullptr, nullptr, nullptr);
    if (code != SQLITE_OK) {
        Fail(code);
    }
}

Statement Database::Prepare(std::string_view sql) {
    sqlite3_stmt* handle = nullptr;
    const int code = sqlite3_prepare_v2(handle_.get(), sql.data(), static_cast<int>(sql.size()),
                                        &handle, nullptr);
    if (code != SQLITE_OK) {
        Fail(code);
    }
    return {*this, handle};
}

std::int64_t Database::Number(std::string_view sql) {
    Statement statement = Prepare(sql);
    return statement.Step() ? statement.Integer(0) : 0;
}

void Database::CopyFrom(Database& other) {
    sqlite3_backup* const backup =
        sqlite3_backup_init(handle_.get(), "main", other.handle_.get(), "main");
    if (!backup) {
        Fail(SQLITE_ERROR);
    }
    constexpr int kAllPages = -1;
    sqlite3_backup_step(backup, kAllPages);
    const int code = sqlite3_backup_finish(backup);
    if (code != SQLITE_OK) {
        Fail(code);
    }
    file_ = other.file_;
}

void Statement::Finishing::operator()(sqlite3_stmt* handle) const {
    sqlite3_finalize(handle);
}

Statement& Statement::Check(int code) {
    if (code != SQLITE_OK) {
        database_->Fail(code);
    }
    return *this;
}

Statement& Statement::Bind(int parameter, std::int64_t value) {
    return Check(sqlite3_bind_int64(handle_.get(), parameter, value));
}

Statement& Statement::Bind(int parameter, double value) {
    return Check(sqlite3_bind_double(handle_.get(), parameter, value));
}

Statement& Statement::Bind(int parameter, std::string_view text) {
    return Check(sqlite3_bind_text64(handle_.get(), parameter, text.data(), text.size(),
                                     SQLITE_TRANSIENT, SQLITE_UTF8));
}

Statement& Statement::BindBytes(int parameter, std::string_view bytes) {
    return Check(sqlite3_bind_blob64(handle_.get(), parameter, bytes.data(), bytes.size(),
                                     SQLITE_TRANSIENT));
}

Statement& Statement::BindCell(int parameter, const Statement& row, int column) {
    return Check(sqlite3_bind_value(handle_.get(), parameter,
                                    sqlite3_column_value(row.handle_.get(), column)));
}

bool Statement::Step() {
    const int code = sqlite3_step(handle_.get());
    if (code == SQLITE_ROW) {
        return true;
    }
    const int reset = sqlite3_reset(handle_.get());
    if (code != SQLITE_DONE) {
        database_->Fail(reset);
    }
    sqlite3_clear_bindings(handle_.get());
    return false;
}

void Statement::Do() {
    while (Step()) {
    }
}

int Statement::Columns() const {
    return sqlite3_column_count(handle_.get());
}

const char* Statement::NameOf(int column) const {
    return sqlite3_column_name(handle_.get(), column);
}

bool Statement::IsNull(int column) const {
    return sqlite3_column_type(handle_.get(), column) == SQLITE_NULL;
}

bool Statement::IsInteger(int column) const {
    return sqlite3_column_type(handle_.get(), column) == SQLITE_INTEGER;
}

bool Statement::IsReal(int column) const {
    return sqlite3_column_type(handle_.get(), column) == SQLITE_FLOAT;
}

std::int64_t Statement::Integer(int column) const {
    return sqlite3_column_int64(handle_.get(), column);
}

double Statement::Real(int column) const {
    return sqlite3_column_double(handle_.get(), column);
}

std::string Statement::Text(int column) const {
    const void* const bytes = sqlite3_column_blob(handle_.get(), column);
    const int size = sqlite3_column_bytes(handle_.get(), column);
    return bytes ? std::string(static_cast<const char*>(bytes), static_cast<std::size_t>(size))
                 : std::string();
}

Transaction::Transaction(Database& database) : database_(database) {
    // At once, so that whoever else changes the file is waited for here.
    database.Run("BEGIN IMMEDIATE");
}

Transaction::~Transaction() {
    if (isOpen_) {
        try {
            database_.Run("ROLLBACK");
        } catch (const DatabaseError&) {
            // It has been taken back already.
        }
    }
}

void Transaction::Commit() {
    database_.Run("COMMIT");
    isOpen_ = false;
}

}  // namespace catalog
