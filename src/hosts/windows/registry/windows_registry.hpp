#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "hosts/windows/registry/registry_tree.hpp"
#include "registry/registry_store.hpp"

namespace quabble {

// The Windows registry: one key of it, with all that lies below, is what a transaction keeps whole. It reads
// all of it when it begins; a commit writes a new key beside it, values of other programs included, and lets
// that take its place. Transactions that begin or commit at the same time wait for each other, in other
// programs, too.
//
// Texts are kept as Windows keeps them, in UTF-16.
class WindowsRegistryStore final : public RegistryStore {
 public:
    // The path of the key below `root`. Its first part, as "Software", must be there; the others need not.
    WindowsRegistryStore(HKEY__* root, std::string_view key);

    std::unique_ptr<RegistryTransaction> begin(Access access) override;

 private:
    class Transaction;
    OpenRegistryKey open(const std::wstring& path) const;
    // The part of the path below the key; nothing when it is another key's.
    std::optional<std::wstring> pathBelow(std::string_view key) const;
    bool recover(HKEY__* parent) const;
    bool replace(const RegistryTree& before, const RegistryTree& after) const;
    bool swap(HKEY__* parent, bool hasOld) const;

    HKEY__* root_;
    std::wstring key_;
    std::wstring parent_;
    std::wstring name_;
    std::wstring newName_;  // a commit's, until it takes the place of the old one
    std::wstring oldName_;  // what a commit has replaced, until it is removed
};

}  // namespace quabble
