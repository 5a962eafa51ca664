#pragma once

#include <gtest/gtest.h>

#include <string>

#include "../support/kept.hpp"
#include "hosts/windows/registry/win32.hpp"
#include "hosts/windows/registry/windows_registry.hpp"

namespace quabble {

// A key of the user's that stands for all of the user's keys, one that no other has; it goes with the object.
struct RegistryPlace {
    RegistryPlace() {
        RegDeleteTreeW(HKEY_CURRENT_USER, path.c_str());
        make(L"Software");
        RegOpenKeyExW(HKEY_CURRENT_USER, path.c_str(), 0, KEY_ALL_ACCESS, &root);
    }
    ~RegistryPlace() {
        RegCloseKey(root);
        RegDeleteTreeW(HKEY_CURRENT_USER, path.c_str());
    }
    RegistryPlace(const RegistryPlace&) = delete;
    RegistryPlace& operator=(const RegistryPlace&) = delete;

    void make(const std::wstring& key) const {
        HKEY made = nullptr;
        RegCreateKeyExW(HKEY_CURRENT_USER, (path + L"\\" + key).c_str(), 0, nullptr, 0, KEY_ALL_ACCESS,
                        nullptr, &made, nullptr);
        RegCloseKey(made);
    }
    bool has(const std::wstring& key) const { return hasRegistryKey(root, key); }

    static inline int count = 0;
    const std::wstring path = L"Software\\Quabble tests " + std::to_wstring(++count);
    HKEY root = nullptr;
};

// Where the program keeps what it keeps, in such a place.
class WindowsRegistryFixture : public ::testing::Test {
 protected:
    static constexpr const wchar_t* key = L"Software\\Vorlane\\Quabble\\1.0";

    RegistryPlace place;
    WindowsRegistryStore registry{place.root, "Software\\Vorlane\\Quabble\\1.0"};
};

}  // namespace quabble
