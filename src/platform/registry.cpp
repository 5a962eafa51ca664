#include "platform/registry.hpp"

#include <fcntl.h>
#include <pwd.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <atomic>
#include <cerrno>
#include <cstdlib>
#include <filesystem>

#include "platform/registry_database.hpp"

namespace quabble {
namespace {

constexpr mode_t userOnlyFolder = 0700;
constexpr mode_t userOnlyFile = 0600;

// More than a registry of ours ever takes, and little enough to be read through at every start.
constexpr off_t largestFile = off_t{8} << 20;
// Room for the endings that SQLite adds to the names it can take.
constexpr std::size_t longestPath = 500;

// True when nothing lies at the path, or a file that can be opened without waiting for anybody.
bool isFileOrNothing(const std::string& path) {
    struct stat status{};
    if (::stat(path.c_str(), &status) != 0)
        return errno == ENOENT;
    return S_ISREG(status.st_mode) && status.st_size <= largestFile;
}

// The database and the files that SQLite looks for beside it.
bool areFilesOrNothing(const std::string& database) {
    return database.size() <= longestPath &&
           std::ranges::all_of(std::array{"", "-journal", "-wal", "-shm"},
                               [&](const char* ending) { return isFileOrNothing(database + ending); });
}

// Makes the folders above a file and the file itself, empty; what exists already stays as it is. That it
// failed shows when the file is opened.
void prepareFile(const std::filesystem::path& file) {
    std::filesystem::path folder;
    for (const auto& part : file.parent_path()) {
        folder /= part;
        ::mkdir(folder.c_str(), userOnlyFolder);
    }
    ::close(::open(file.c_str(), O_RDWR | O_CREAT | O_CLOEXEC, userOnlyFile));
}

std::string homeFolder() {
    if (const char* home = std::getenv("HOME"); home != nullptr && *home == '/')
        return home;
    const passwd* user = ::getpwuid(::getuid());
    return user != nullptr && user->pw_dir != nullptr ? user->pw_dir : "/";
}

}  // namespace

Registry::Registry(std::string path) : path_(std::move(path)) {}

Registry Registry::inMemory() {
    static std::atomic<int> count{0};
    Registry registry("file:registry" + std::to_string(++count) + "?mode=memory&cache=shared");
    registry.keeper_ = RegistryDatabase::connect(registry.path_);
    return registry;
}

Registry::~Registry() = default;
Registry::Registry(Registry&& other) noexcept = default;
Registry& Registry::operator=(Registry&& other) noexcept = default;

// Whether there is a file of its own that can be read and written, or can be made.
bool Registry::hasUsableFile() const {
    if (!areFilesOrNothing(path_))
        return false;
    prepareFile(path_);
    // A change needs files beside it.
    return ::access(std::filesystem::path(path_).parent_path().c_str(), W_OK) == 0;
}

std::optional<RegistryKey> Registry::openKey(std::string_view name, Access access) {
    if (isGivenUp_)
        return std::nullopt;
    std::shared_ptr<RegistryDatabase> database;
    if (keeper_ || hasUsableFile())
        database = RegistryDatabase::open(path_, access);
    isGivenUp_ = !database;
    if (!database)
        return std::nullopt;
    return RegistryKey(std::move(database), std::string(name), "");
}

RegistryKey RegistryKey::createKey(std::string_view subkey, std::string_view classString) const {
    return {database_, path_ + "\\" + std::string(subkey), std::string(classString)};
}

bool RegistryKey::createWithParents() {
    for (std::size_t end = 0; end != std::string::npos;) {
        end = path_.find('\\', end + 1);
        const std::string part = path_.substr(0, end);
        auto insertion = database_->prepare("INSERT OR IGNORE INTO keys (path, class) VALUES (?1, ?2)");
        insertion.bind(1, part).bind(2, end == std::string::npos ? std::string_view(class_) : "");
        if (!database_->change(insertion))
            return false;
    }
    return true;
}

std::optional<RegistryKey::Found> RegistryKey::query(std::string_view name,
                                                     std::span<std::byte> buffer) const {
    auto entry = database_->prepare("SELECT type, data FROM entries WHERE key = ?1 AND name = ?2");
    entry.bind(1, path_).bind(2, name);
    if (!entry.nextRow())
        return std::nullopt;
    const std::string_view data = entry.bytes(1);
    if (data.size() > buffer.size())
        return std::nullopt;
    std::ranges::copy(std::as_bytes(std::span(data)), buffer.begin());
    return Found{static_cast<ValueType>(entry.number(0)), data.size()};
}

bool RegistryKey::set(std::string_view name, ValueType type, std::span<const std::byte> data) {
    if (!createWithParents())
        return false;
    auto entry = database_->prepare(
        "INSERT INTO entries (key, name, type, data) VALUES (?1, ?2, ?3, ?4) "
        "ON CONFLICT (key, name) DO UPDATE SET type = ?3, data = ?4");
    entry.bind(1, path_).bind(2, name).bind(3, static_cast<std::int64_t>(type));
    entry.bindBytes(4, data.data(), data.size());
    return database_->change(entry);
}

bool RegistryKey::commit() {
    return database_->commit();
}

std::string userRegistryPath(std::string_view programName) {
    const char* dataHome = std::getenv("XDG_DATA_HOME");
    const bool isGiven = dataHome != nullptr && *dataHome == '/';
    const std::string base = isGiven ? dataHome : homeFolder() + "/.local/share";
    return base + "/" + std::string(programName) + "/registry.db";
}

}  // namespace quabble
