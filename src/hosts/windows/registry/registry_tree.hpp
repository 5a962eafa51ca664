#pragma once

#include <cstddef>
#include <cstdint>
#include <map>
#include <memory>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "hosts/windows/registry/registry_names.hpp"

struct HKEY__;

namespace quabble {

struct CloseRegistryKey {
    void operator()(HKEY__* key) const;
};
using OpenRegistryKey = std::unique_ptr<HKEY__, CloseRegistryKey>;

// A key of the Windows registry and all that lies below it, whoever has put it there: each key by its path
// below the first one, whose own path is empty. Nothing in it is a key that does not exist.
struct RegistryTree {
    struct Value {
        std::uint32_t type = 0;  // the system's number of it
        std::vector<std::byte> data;
        friend bool operator==(const Value&, const Value&) = default;
    };
    struct Key {
        std::wstring classString;
        std::map<std::wstring, Value, WithoutCase> values;
        friend bool operator==(const Key&, const Key&) = default;
    };
    std::map<std::wstring, Key, WithoutCase> keys;
    friend bool operator==(const RegistryTree&, const RegistryTree&) = default;
};

bool hasRegistryKey(HKEY__* parent, const std::wstring& name);

// Nothing when the key cannot be read.
std::optional<RegistryTree> readRegistryTree(HKEY__* parent, const std::wstring& name);

// Writes a new key and has it on the disk when it comes back. False when not everything could be written, and
// then a part of it may be there.
bool writeRegistryTree(HKEY__* parent, const std::wstring& name, const RegistryTree& tree);

}  // namespace quabble
