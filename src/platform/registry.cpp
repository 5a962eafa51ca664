#include "platform/registry.hpp"

#include <fcntl.h>
#include <pwd.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <atomic>
#include <cstdlib>
#include <filesystem>

#include "platform/registry_database.hpp"

namespace quabble {
namespace {

constexpr mode_t userOnlyFolder = 0700;
constexpr mode_t userOnlyFile = 0600;

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

std::optional<RegistryKey> Registry::openKey(std::string_view name) {
    if (!keeper_) {
        prepareFile(path_);
        // A change needs a journal beside the file.
        isGivenUp_ |= ::access(std::filesystem::path(path_).parent_path().c_str(), W_OK) != 0;
    }
    if (isGivenUp_)
        return std::nullopt;
    std::shared_ptr<RegistryDatabase> database = RegistryDatabase::open(path_);
    isGivenUp_ = !database;
    if (isGivenUp_)
        return std::nullopt;
    return RegistryKey(std::move(database), std::string(name));
}

std::optional<RegistryKey> RegistryKey::createKey(std::string_view subkey, std::string_view classString) {
    std::string path = path_ + "\\" + std::string(subkey);
    for (std::size_t end = 0; end != std::string::npos;) {
        end = path.find('\\', end + 1);
        const std::string part = path.substr(0, end);
        auto insertion = database_->prepare("INSERT OR IGNORE INTO keys (path, class) VALUES (?1, ?2)");
        insertion.bind(1, part).bind(2, end == std::string::npos ? classString : std::string_view(""));
        if (!database_->change(insertion))
            return std::nullopt;
    }
    return RegistryKey(database_, std::move(path));
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
    auto entry = database_->prepare(
        "INSERT INTO entries (key, name, type, data) VALUES (?1, ?2, ?3, ?4) "
        "ON CONFLICT (key, name) DO UPDATE SET type = ?3, data = ?4");
    entry.bind(1, path_).bind(2, name).bind(3, static_cast<std::int64_t>(type));
    entry.bindBytes(4, data.data(), data.size());
    return database_->change(entry);
}

std::string userRegistryPath(std::string_view programName) {
    const char* dataHome = std::getenv("XDG_DATA_HOME");
    const bool isGiven = dataHome != nullptr && *dataHome == '/';
    const std::string base = isGiven ? dataHome : homeFolder() + "/.local/share";
    return base + "/" + std::string(programName) + "/registry.db";
}

}  // namespace quabble
