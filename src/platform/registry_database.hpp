#pragma once

#include <sqlite3.h>

#include <cstddef>
#include <cstdint>
#include <memory>
#include <string>
#include <string_view>

#include "platform/registry.hpp"

namespace quabble {

// A prepared statement. Texts and bytes bound to it must outlive its steps.
class RegistryStatement {
 public:
    RegistryStatement(sqlite3* connection, std::string_view sql);

    RegistryStatement& bind(int index, std::string_view text);
    RegistryStatement& bind(int index, std::int64_t number);
    RegistryStatement& bindBytes(int index, const void* bytes, std::size_t size);

    bool nextRow() { return statement_ && sqlite3_step(statement_.get()) == SQLITE_ROW; }
    bool run() { return statement_ && sqlite3_step(statement_.get()) == SQLITE_DONE; }
    std::int64_t number(int column) const { return sqlite3_column_int64(statement_.get(), column); }
    std::string_view bytes(int column) const;

 private:
    struct Finalise {
        void operator()(sqlite3_stmt* statement) const { sqlite3_finalize(statement); }
    };
    std::unique_ptr<sqlite3_stmt, Finalise> statement_;
};

// A connection to the registry's database, with one transaction.
class RegistryDatabase {
 public:
    // Opens the file (an SQLite URI or a path), begins a transaction and makes sure that it is a registry,
    // which an empty one becomes when it is written; nothing when any of it fails.
    static std::unique_ptr<RegistryDatabase> open(const std::string& path, Access access);
    // A connection alone, without a transaction; it keeps a database in memory alive.
    static std::unique_ptr<RegistryDatabase> connect(const std::string& path);

    RegistryStatement prepare(std::string_view sql) { return {connection_.get(), sql}; }

    // Carries out a change that is part of the transaction. When one fails, none will be kept and no other
    // is carried out: a registry that has half of what was meant would be worse than the one before.
    bool change(RegistryStatement& statement);
    // Keeps what was changed and ends the transaction; false when nothing of it is kept.
    bool commit();

 private:
    struct Close {
        void operator()(sqlite3* connection) const { sqlite3_close(connection); }
    };
    explicit RegistryDatabase(sqlite3* connection) : connection_(connection) {}
    enum class Content { Nothing, Registry, SomethingElse };
    bool trustNothing();
    bool execute(const char* sql);
    bool beginReading();
    bool beginWriting();
    Content content();

    std::unique_ptr<sqlite3, Close> connection_;
    bool isKept_ = true;  // every change of the transaction was carried out
};

}  // namespace quabble
