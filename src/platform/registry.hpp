#pragma once

#include <cstddef>
#include <cstdint>
#include <memory>
#include <optional>
#include <span>
#include <string>
#include <string_view>

namespace quabble {

// What a stored value is; the numbers are kept with it.
enum class ValueType : std::int32_t { String = 1, Binary = 3 };

class RegistryDatabase;

// What a transaction is for. One that reads sees the registry as it is when it begins, whatever others write
// meanwhile, and keeps nobody from writing; one that writes is alone in writing.
enum class Access { Read, Write };

// An open key of the registry. Key and value names are compared without regard to case (of ASCII letters).
// Destroying it closes the key.
class RegistryKey {
 public:
    struct Found {
        ValueType type = ValueType::Binary;
        std::size_t size = 0;  // bytes of the value
    };

    // Opens the subkey, of which parts are separated by "\". What is missing of it comes into being, with the
    // class, when its first value is set.
    RegistryKey createKey(std::string_view subkey, std::string_view classString) const;

    // Copies a value into the buffer's first bytes. Nothing, and the buffer as it was, when there is no such
    // value, it cannot be read, or it is larger than the buffer.
    std::optional<Found> query(std::string_view name, std::span<std::byte> buffer) const;

    // Sets a value; false when that fails, and then nothing of the transaction can be kept.
    bool set(std::string_view name, ValueType type, std::span<const std::byte> data);

    // Keeps what was set through this key and all others of its transaction; false when that fails, and then
    // what was kept before stays. What is not committed is not kept.
    bool commit();

 private:
    friend class Registry;
    RegistryKey(std::shared_ptr<RegistryDatabase> database, std::string path, std::string classString)
        : database_(std::move(database)), path_(std::move(path)), class_(std::move(classString)) {}
    bool createWithParents();

    std::shared_ptr<RegistryDatabase> database_;
    std::string path_;
    std::string class_;
};

// The user's registry: a tree of keys with values, kept in one database file. From the opening of a key of
// the root until it is committed, or it and all keys opened through it are closed, runs one transaction:
// others see all of it or nothing, and so does the next run after a crash. A file that is not a registry, is
// damaged, or was written by a later version is not touched; once it could not be read it stays closed, so
// that nobody overwrites what he never read.
class Registry {
 public:
    // The file is made, readable by the user alone, when a key is first opened; so are the folders above it.
    explicit Registry(std::string path);

    // A registry that is gone when the program ends.
    static Registry inMemory();

    ~Registry();
    Registry(Registry&& other) noexcept;
    Registry& operator=(Registry&& other) noexcept;
    Registry(const Registry&) = delete;
    Registry& operator=(const Registry&) = delete;

    // Opens a key of the root, which always exists. Nothing when the registry cannot be read and written;
    // another program that keeps it locked is waited for, up to a second.
    std::optional<RegistryKey> openKey(std::string_view name, Access access);

 private:
    bool hasUsableFile() const;

    std::string path_;
    bool isGivenUp_ = false;
    std::unique_ptr<RegistryDatabase> keeper_;  // holds what is in memory only
};

// The file that the registry of this user and program lies in: in the folder of the program's name below
// $XDG_DATA_HOME or, when that is unset, empty or relative, below ~/.local/share.
std::string userRegistryPath(std::string_view programName);

}  // namespace quabble
