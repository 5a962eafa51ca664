#include "hosts/windows/registry/registry_tree.hpp"

#include <algorithm>

#include "hosts/windows/registry/win32.hpp"

namespace quabble {
namespace {

// How much room the names and values of a key want, in characters and bytes.
struct Extent {
    DWORD subkeys = 0;
    DWORD longestSubkey = 0;
    DWORD values = 0;
    DWORD longestName = 0;
    DWORD largestValue = 0;
};

std::optional<Extent> extentOf(HKEY key) {
    Extent extent;
    const LSTATUS result =
        RegQueryInfoKeyW(key, nullptr, nullptr, nullptr, &extent.subkeys, &extent.longestSubkey, nullptr,
                         &extent.values, &extent.longestName, &extent.largestValue, nullptr, nullptr);
    return result == ERROR_SUCCESS ? std::optional(extent) : std::nullopt;
}

bool readValues(HKEY key, const Extent& extent, RegistryTree::Key& into) {
    for (DWORD i = 0; i < extent.values; ++i) {
        std::wstring name(extent.longestName + 1, L'\0');
        auto length = static_cast<DWORD>(name.size());
        RegistryTree::Value value;
        value.data.resize(extent.largestValue);
        DWORD size = extent.largestValue;
        DWORD type = 0;
        if (RegEnumValueW(key, i, name.data(), &length, nullptr, &type,
                          reinterpret_cast<BYTE*>(value.data.data()), &size) != ERROR_SUCCESS)
            return false;
        name.resize(length);
        value.type = type;
        value.data.resize(size);
        into.values.emplace(std::move(name), std::move(value));
    }
    return true;
}

// The system does not say how long it is.
bool readClass(HKEY key, std::wstring& into) {
    LSTATUS result = ERROR_MORE_DATA;
    for (DWORD room = 32; result == ERROR_MORE_DATA; room *= 2) {
        into.resize(room);
        DWORD length = room;
        result = RegQueryInfoKeyW(key, into.data(), &length, nullptr, nullptr, nullptr, nullptr, nullptr,
                                  nullptr, nullptr, nullptr, nullptr);
        into.resize(result == ERROR_SUCCESS ? length : 0);
    }
    return result == ERROR_SUCCESS;
}

bool readKey(HKEY parent, const std::wstring& name, const std::wstring& path, RegistryTree& into) {
    HKEY opened = nullptr;
    if (RegOpenKeyExW(parent, name.c_str(), 0, KEY_READ, &opened) != ERROR_SUCCESS)
        return false;
    const OpenRegistryKey key(opened);
    const auto extent = extentOf(opened);
    RegistryTree::Key& stored = into.keys[path];
    if (!extent || !readClass(opened, stored.classString) || !readValues(opened, *extent, stored))
        return false;
    for (DWORD i = 0; i < extent->subkeys; ++i) {
        std::wstring subkey(extent->longestSubkey + 1, L'\0');
        auto length = static_cast<DWORD>(subkey.size());
        if (RegEnumKeyExW(opened, i, subkey.data(), &length, nullptr, nullptr, nullptr, nullptr) !=
            ERROR_SUCCESS)
            return false;
        subkey.resize(length);
        if (!readKey(opened, subkey, path.empty() ? subkey : path + L"\\" + subkey, into))
            return false;
    }
    return true;
}

// To Windows the letters of all languages have cases: two names may be one to it. Then one of their values is
// lost, which the count tells.
bool writeKey(HKEY parent, const std::wstring& name, const RegistryTree::Key& key) {
    HKEY made = nullptr;
    std::wstring classString = key.classString;
    if (RegCreateKeyExW(parent, name.c_str(), 0, classString.data(), 0, KEY_ALL_ACCESS, nullptr, &made,
                        nullptr) != ERROR_SUCCESS)
        return false;
    const OpenRegistryKey open(made);
    for (const auto& [valueName, value] : key.values) {
        // Windows looks beyond a text for a zero that it then keeps with it.
        std::vector<std::byte> data = value.data;
        data.insert(data.end(), sizeof(wchar_t), std::byte{1});
        if (RegSetValueExW(made, valueName.c_str(), 0, value.type, reinterpret_cast<const BYTE*>(data.data()),
                           static_cast<DWORD>(value.data.size())) != ERROR_SUCCESS)
            return false;
    }
    const auto extent = extentOf(made);
    return extent && extent->values == key.values.size();
}

}  // namespace

void CloseRegistryKey::operator()(HKEY__* key) const {
    RegCloseKey(key);
}

bool hasRegistryKey(HKEY parent, const std::wstring& name) {
    HKEY opened = nullptr;
    const LSTATUS result = RegOpenKeyExW(parent, name.c_str(), 0, KEY_QUERY_VALUE, &opened);
    const OpenRegistryKey key(opened);
    return result != ERROR_FILE_NOT_FOUND;
}

std::optional<RegistryTree> readRegistryTree(HKEY parent, const std::wstring& name) {
    RegistryTree tree;
    if (hasRegistryKey(parent, name) && !readKey(parent, name, L"", tree))
        return std::nullopt;
    return tree;
}

// A key comes before those below it.
bool writeRegistryTree(HKEY parent, const std::wstring& name, const RegistryTree& tree) {
    const bool isWritten = std::ranges::all_of(tree.keys, [&](const auto& entry) {
        const auto& [path, key] = entry;
        return writeKey(parent, path.empty() ? name : name + L"\\" + path, key);
    });
    HKEY written = nullptr;
    if (!isWritten || RegOpenKeyExW(parent, name.c_str(), 0, KEY_READ, &written) != ERROR_SUCCESS)
        return false;
    const OpenRegistryKey key(written);
    return RegFlushKey(written) == ERROR_SUCCESS;
}

}  // namespace quabble
