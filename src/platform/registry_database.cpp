#include "platform/registry_database.hpp"

namespace quabble {
namespace {

constexpr int busyTimeout = 10'000;  // milliseconds
constexpr std::int64_t schemaVersion = 1;

constexpr const char* schema = R"(
    CREATE TABLE keys (
        path  TEXT NOT NULL PRIMARY KEY COLLATE NOCASE,
        class TEXT NOT NULL
    );
    CREATE TABLE entries (
        key  TEXT NOT NULL COLLATE NOCASE REFERENCES keys (path),
        name TEXT NOT NULL COLLATE NOCASE,
        type INTEGER NOT NULL,
        data BLOB NOT NULL,
        PRIMARY KEY (key, name)
    );
    PRAGMA user_version = 1;
)";

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
    if (result != SQLITE_OK)
        return nullptr;
    sqlite3_busy_timeout(connection, busyTimeout);
    return database;
}

std::unique_ptr<RegistryDatabase> RegistryDatabase::open(const std::string& path) {
    auto database = connect(path);
    const bool isWritable = database && sqlite3_db_readonly(database->connection_.get(), "main") == 0;
    if (!isWritable || !database->begin() || !database->isOrBecomesRegistry())
        return nullptr;
    database->inTransaction_ = true;
    return database;
}

// What is not committed, or cannot be, is rolled back when the connection closes.
RegistryDatabase::~RegistryDatabase() {
    if (inTransaction_)
        execute("COMMIT");
}

bool RegistryDatabase::begin() {
    return execute("PRAGMA synchronous = EXTRA") && execute("BEGIN IMMEDIATE");
}

bool RegistryDatabase::change(RegistryStatement& statement) {
    inTransaction_ = inTransaction_ && statement.run();
    return inTransaction_;
}

bool RegistryDatabase::isOrBecomesRegistry() {
    RegistryStatement check = prepare("PRAGMA integrity_check(1)");
    RegistryStatement version = prepare("PRAGMA user_version");
    RegistryStatement tables =
        prepare("SELECT count(*), total(name IN ('keys', 'entries')) FROM sqlite_schema");
    const bool isSound = check.nextRow() && check.bytes(0) == "ok" && version.nextRow() && tables.nextRow();
    if (!isSound)
        return false;
    if (version.number(0) == 0 && tables.number(0) == 0)
        return execute(schema);
    return version.number(0) == schemaVersion && tables.number(1) == 2;
}

bool RegistryDatabase::execute(const char* sql) {
    return sqlite3_exec(connection_.get(), sql, nullptr, nullptr, nullptr) == SQLITE_OK;
}

}  // namespace quabble
