#pragma once

#include <cstddef>
#include <cstdint>
#include <memory>
#include <optional>
#include <span>
#include <string_view>
#include <vector>

namespace quabble {

// What a stored value is; the numbers are kept with it.
enum class ValueType : std::int32_t { String = 1, Binary = 3 };

struct RegistryValue {
    ValueType type = ValueType::Binary;
    std::vector<std::byte> data;
};

// What a transaction is for. One that reads sees the registry as it is when it begins, whatever others write
// meanwhile, and does not stop them from writing.
enum class Access { Read, Write };

// One look at a registry or one change of it, all or nothing. A registry is a tree of keys, whose paths are
// written with "\" between their parts; each has values. Paths and names are compared without regard to the
// case of ASCII letters. What is not committed is not kept. It must not outlive its store.
class RegistryTransaction {
 public:
    virtual ~RegistryTransaction() = default;

    // Makes the key, with its class, and what is missing of the keys above it. One that is there stays as it
    // is.
    virtual bool createKey(std::string_view path, std::string_view classString) = 0;

    // Nothing when there is no such key or value, or when it cannot be read.
    virtual std::optional<RegistryValue> query(std::string_view key, std::string_view name) = 0;

    // Sets a value of a key that is there, whatever type and size it had.
    virtual bool set(std::string_view key, std::string_view name, ValueType type,
                     std::span<const std::byte> data) = 0;

    // Keeps what was changed and ends the transaction. False, and then what was kept before stays, when that
    // fails, when a change before it failed, or when others have changed the registry meanwhile. Changes and
    // commits fail in a transaction that reads and in one that has ended.
    virtual bool commit() = 0;
};

// Where a registry lies between runs: what a host has to give. What is no registry, is damaged or was written
// by a later version is never touched.
class RegistryStore {
 public:
    virtual ~RegistryStore() = default;

    // Nothing when the registry cannot be read or, for a transaction that writes, it is known that it cannot
    // be changed. It comes back within a second or so, also when another program is writing.
    virtual std::unique_ptr<RegistryTransaction> begin(Access access) = 0;
};

}  // namespace quabble
