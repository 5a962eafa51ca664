#include "hosts/desktop/registry/sqlite_registry.hpp"

#include <sqlite3.h>

#include <algorithm>
#include <array>
#include <utility>

#include "hosts/desktop/registry/registry_file.hpp"

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

// A prepared statement. Texts and bytes bound to it must outlive its steps.
class Statement {
 public:
    Statement(sqlite3* connection, std::string_view sql) {
        sqlite3_stmt* statement = nullptr;
        sqlite3_prepare_v2(connection, sql.data(), static_cast<int>(sql.size()), &statement, nullptr);
        statement_.reset(statement);
    }

    Statement& bind(int index, std::string_view text) {
        sqlite3_bind_text(statement_.get(), index, text.data(), static_cast<int>(text.size()), SQLITE_STATIC);
        return *this;
    }
    Statement& bind(int index, std::int64_t number) {
        sqlite3_bind_int64(statement_.get(), index, number);
        return *this;
    }
    Statement& bind(int index, std::span<const std::byte> bytes) {
        if (bytes.empty())
            sqlite3_bind_zeroblob(statement_.get(), index, 0);
        else
            sqlite3_bind_blob64(statement_.get(), index, bytes.data(), bytes.size(), SQLITE_STATIC);
        return *this;
    }

    bool nextRow() { return statement_ && sqlite3_step(statement_.get()) == SQLITE_ROW; }
    bool run() { return statement_ && sqlite3_step(statement_.get()) == SQLITE_DONE; }
    std::int64_t number(int column) const { return sqlite3_column_int64(statement_.get(), column); }
    std::string_view text(int column) const {
        const auto found = bytes(column);
        return {reinterpret_cast<const char*>(found.data()), found.size()};
    }
    std::span<const std::byte> bytes(int column) const {
        const void* data = sqlite3_column_blob(statement_.get(), column);
        const auto size = static_cast<std::size_t>(sqlite3_column_bytes(statement_.get(), column));
        return {static_cast<const std::byte*>(data), data == nullptr ? 0 : size};
    }

 private:
    struct Finalise {
        void operator()(sqlite3_stmt* statement) const { sqlite3_finalize(statement); }
    };
    std::unique_ptr<sqlite3_stmt, Finalise> statement_;
};

// A connection to the database, with one transaction.
class SqliteTransaction final : public RegistryTransaction {
 public:
    explicit SqliteTransaction(const std::string& path) {
        sqlite3* connection = nullptr;
        isOpen_ = sqlite3_open_v2(path.c_str(), &connection, SQLITE_OPEN_READWRITE, nullptr) == SQLITE_OK;
        connection_.reset(connection);
    }

    // False when the file is no registry, or not to be had.
    bool begin(Access access);

    bool createKey(std::string_view path, std::string_view classString) override;
    std::optional<RegistryValue> query(std::string_view key, std::string_view name) override;
    bool set(std::string_view key, std::string_view name, ValueType type,
             std::span<const std::byte> data) override;
    bool commit() override;

 private:
    struct Close {
        void operator()(sqlite3* connection) const { sqlite3_close(connection); }
    };
    enum class Content { Nothing, Registry, SomethingElse };
    Statement prepare(std::string_view sql) { return {connection_.get(), sql}; }
    bool trustNothing();
    bool execute(const char* sql);
    bool beginReading();
    bool beginWriting();
    Content content();
    bool change(Statement& statement);

    std::unique_ptr<sqlite3, Close> connection_;
    bool isOpen_ = false;
    bool canChange_ = false;  // it writes, and every change so far was carried out
};

bool SqliteTransaction::begin(Access access) {
    if (!isOpen_ || !trustNothing())
        return false;
    sqlite3_busy_timeout(connection_.get(), busyTimeout);
    if (sqlite3_db_readonly(connection_.get(), "main") != 0 || !beginReading())
        return false;
    canChange_ = access == Access::Write && beginWriting();
    return canChange_ || access == Access::Read;
}

// Nothing that somebody has written into the file is ever carried out.
bool SqliteTransaction::trustNothing() {
    sqlite3* connection = connection_.get();
    sqlite3_limit(connection, SQLITE_LIMIT_LENGTH, longestValue);
    constexpr std::array switches{
        std::pair{SQLITE_DBCONFIG_DEFENSIVE, 1}, std::pair{SQLITE_DBCONFIG_TRUSTED_SCHEMA, 0},
        std::pair{SQLITE_DBCONFIG_ENABLE_TRIGGER, 0}, std::pair{SQLITE_DBCONFIG_ENABLE_VIEW, 0},
        std::pair{SQLITE_DBCONFIG_ENABLE_FKEY, 1}};
    return std::ranges::all_of(switches, [&](const auto& option) {
        return sqlite3_db_config(connection, option.first, option.second, nullptr) == SQLITE_OK;
    });
}

bool SqliteTransaction::beginReading() {
    return execute("BEGIN") && content() != Content::SomethingElse;
}

// With a write-ahead log readers do not block a writer. A file that others are reading cannot be
// switched over to it; then the lock that it needs without the log is not to be had either. The file is
// looked at again, for it may have become another meanwhile.
bool SqliteTransaction::beginWriting() {
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

// Once a change has failed no other is carried out: a registry that has half of what was meant would be worse
// than the one before.
bool SqliteTransaction::change(Statement& statement) {
    canChange_ = canChange_ && statement.run();
    return canChange_;
}

bool SqliteTransaction::createKey(std::string_view path, std::string_view classString) {
    for (std::size_t end = 0; end != std::string_view::npos;) {
        end = path.find('\\', end + 1);
        Statement insertion = prepare("INSERT OR IGNORE INTO keys (path, class) VALUES (?1, ?2)");
        insertion.bind(1, path.substr(0, end));
        insertion.bind(2, end == std::string_view::npos ? classString : "");
        if (!change(insertion))
            return false;
    }
    return true;
}

std::optional<RegistryValue> SqliteTransaction::query(std::string_view key, std::string_view name) {
    Statement entry = prepare("SELECT type, data FROM entries WHERE key = ?1 AND name = ?2");
    entry.bind(1, key).bind(2, name);
    if (!entry.nextRow())
        return std::nullopt;
    const auto data = entry.bytes(1);
    return RegistryValue{static_cast<ValueType>(entry.number(0)), {data.begin(), data.end()}};
}

bool SqliteTransaction::set(std::string_view key, std::string_view name, ValueType type,
                            std::span<const std::byte> data) {
    Statement entry = prepare(
        "INSERT INTO entries (key, name, type, data) VALUES (?1, ?2, ?3, ?4) "
        "ON CONFLICT (key, name) DO UPDATE SET type = ?3, data = ?4");
    entry.bind(1, key).bind(2, name).bind(3, static_cast<std::int64_t>(type)).bind(4, data);
    return change(entry);
}

bool SqliteTransaction::commit() {
    return std::exchange(canChange_, false) && execute("COMMIT");
}

// The tables are compared before anything is looked for in them.
SqliteTransaction::Content SqliteTransaction::content() {
    Statement version = prepare("PRAGMA user_version");
    if (!version.nextRow())
        return Content::SomethingElse;
    std::string found;
    Statement schema = prepare("SELECT sql FROM sqlite_schema WHERE sql IS NOT NULL ORDER BY name DESC");
    while (schema.nextRow())
        found += withoutSpace(schema.text(0));
    const bool isNothing = version.number(0) == 0 && found.empty();
    const bool isOurs =
        version.number(0) == schemaVersion && found == withoutSpace(keysTable) + withoutSpace(entriesTable);
    if (!isNothing && !isOurs)
        return Content::SomethingElse;
    Statement check = prepare("PRAGMA integrity_check(1)");
    if (!check.nextRow() || check.text(0) != "ok")
        return Content::SomethingElse;
    return isOurs ? Content::Registry : Content::Nothing;
}

bool SqliteTransaction::execute(const char* sql) {
    return sqlite3_exec(connection_.get(), sql, nullptr, nullptr, nullptr) == SQLITE_OK;
}

}  // namespace

std::unique_ptr<RegistryTransaction> SqliteRegistryStore::begin(Access access) {
    if (!prepareRegistryFile(path_))
        return nullptr;
    auto transaction = std::make_unique<SqliteTransaction>(path_);
    return transaction->begin(access) ? std::move(transaction) : nullptr;
}

}  // namespace quabble
