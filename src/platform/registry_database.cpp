#include "platform/registry_database.hpp"

#include <algorithm>
#include <array>
#include <utility>

namespace quabble {
namespace {

// Another program's lock is waited for: long enough for one that saves, and short enough to end in time when
// the process is asked to.
constexpr int busyTimeout = 1000;  // milliseconds
constexpr std::int64_t schemaVersion = 1;
constexpr int longestValue = 1 << 20;  // bytes

constexpr std::string_view keysTable = R"(CREATE TABLE keys (
        path  TEXT NOT NULL PRIMARY KEY COLLATE NOCASE,
        class TEXT NOT NULL
    ))";
constexpr std::string_view entriesTable = R"(CREATE TABLE entries (
        key  TEXT NOT NULL COLLATE NOCASE REFERENCES keys (path),
        name TEXT NOT NULL COLLATE NOCASE,
        type INTEGER NOT NULL,
        data BLOB NOT NULL,
        PRIMARY KEY (key, name)
    ))";

std::string withoutSpace(std::string_view text) {
    std::string dense(text);
    std::erase_if(dense, [](char character) { return character == ' ' || character == '\n'; });
    return dense;
}

}  // namespace

RegistryStatement::RegistryStatement(sqlite3* connection, std::string_view sql) {
    sqlite3_stmt* statement = nullptr;
    sqlite3_prepare_v2(connection, sql.data(), static_cast<int>(sql.size()), &statement, nullptr);
    statement_.reset(statement);
}

RegistryStatement& RegistryStatement::bind(int index, std::string_view text) {
    sqlite3_bind_text(statement_.get(), index, text.data(), static_cast<int>(text.size()), SQLITE_STATIC);
    return *this;
}

RegistryStatement& RegistryStatement::bind(int index, std::int64_t number) {
    sqlite3_bind_int64(statement_.get(), index, number);
    return *this;
}

RegistryStatement& RegistryStatement::bindBytes(int index, const void* bytes, std::size_t size) {
    if (size == 0)
        sqlite3_bind_zeroblob(statement_.get(), index, 0);
    else
        sqlite3_bind_blob64(statement_.get(), index, bytes, size, SQLITE_STATIC);
    return *this;
}

std::string_view RegistryStatement::bytes(int column) const {
    const void* data = sqlite3_column_blob(statement_.get(), column);
    const auto size = static_cast<std::size_t>(sqlite3_column_bytes(statement_.get(), column));
    return data == nullptr ? std::string_view{} : std::string_view(static_cast<const char*>(data), size);
}

std::unique_ptr<RegistryDatabase> RegistryDatabase::connect(const std::string& path) {
    sqlite3* connection = nullptr;
    const int flags = SQLITE_OPEN_READWRITE | SQLITE_OPEN_CREATE | SQLITE_OPEN_URI;
    const int result = sqlite3_open_v2(path.c_str(), &connection, flags, nullptr);
    std::unique_ptr<RegistryDatabase> database(new RegistryDatabase(connection));
    if (result != SQLITE_OK || !database->trustNothing())
        return nullptr;
    sqlite3_busy_timeout(connection, busyTimeout);
    return database;
}

// Nothing that somebody has written into the file is ever carried out.
bool RegistryDatabase::trustNothing() {
    sqlite3* connection = connection_.get();
    sqlite3_limit(connection, SQLITE_LIMIT_LENGTH, longestValue);
    constexpr std::array switches{
        std::pair{SQLITE_DBCONFIG_DEFENSIVE, 1}, std::pair{SQLITE_DBCONFIG_TRUSTED_SCHEMA, 0},
        std::pair{SQLITE_DBCONFIG_ENABLE_TRIGGER, 0}, std::pair{SQLITE_DBCONFIG_ENABLE_VIEW, 0}};
    return std::ranges::all_of(switches, [&](const auto& option) {
        return sqlite3_db_config(connection, option.first, option.second, nullptr) == SQLITE_OK;
    });
}

std::unique_ptr<RegistryDatabase> RegistryDatabase::open(const std::string& path, Access access) {
    auto database = connect(path);
    const bool isWritable = database && sqlite3_db_readonly(database->connection_.get(), "main") == 0;
    if (!isWritable || !database->beginReading())
        return nullptr;
    if (access == Access::Write && !database->beginWriting())
        return nullptr;
    return database;
}

bool RegistryDatabase::beginReading() {
    return execute("BEGIN") && content() != Content::SomethingElse;
}

// With a write-ahead log those who read keep nobody from writing. A file that others are reading cannot be
// switched over to it; then the lock that it needs without the log is not to be had either. The file is
// looked at again, for it may have become another meanwhile.
bool RegistryDatabase::beginWriting() {
    if (!execute("ROLLBACK") || !execute("PRAGMA synchronous = EXTRA"))
        return false;
    sqlite3_busy_timeout(connection_.get(), 0);
    execute("PRAGMA journal_mode = WAL");
    sqlite3_busy_timeout(connection_.get(), busyTimeout);
    if (!execute("BEGIN EXCLUSIVE"))
        return false;
    if (const Content found = content(); found != Content::Nothing)
        return found == Content::Registry;
    return execute(std::string(keysTable).c_str()) && execute(std::string(entriesTable).c_str()) &&
           execute("PRAGMA user_version = 1");
}

bool RegistryDatabase::change(RegistryStatement& statement) {
    isKept_ = isKept_ && statement.run();
    return isKept_;
}

bool RegistryDatabase::commit() {
    return isKept_ && execute("COMMIT");
}

// The tables are compared before anything is looked for in them.
RegistryDatabase::Content RegistryDatabase::content() {
    RegistryStatement version = prepare("PRAGMA user_version");
    if (!version.nextRow())
        return Content::SomethingElse;
    std::string found;
    RegistryStatement schema =
        prepare("SELECT sql FROM sqlite_schema WHERE sql IS NOT NULL ORDER BY name DESC");
    while (schema.nextRow())
        found += withoutSpace(schema.bytes(0));
    const bool isNothing = version.number(0) == 0 && found.empty();
    const bool isOurs =
        version.number(0) == schemaVersion && found == withoutSpace(keysTable) + withoutSpace(entriesTable);
    if (!isNothing && !isOurs)
        return Content::SomethingElse;
    RegistryStatement check = prepare("PRAGMA integrity_check(1)");
    if (!check.nextRow() || check.bytes(0) != "ok")
        return Content::SomethingElse;
    return isOurs ? Content::Registry : Content::Nothing;
}

bool RegistryDatabase::execute(const char* sql) {
    return sqlite3_exec(connection_.get(), sql, nullptr, nullptr, nullptr) == SQLITE_OK;
}

}  // namespace quabble
