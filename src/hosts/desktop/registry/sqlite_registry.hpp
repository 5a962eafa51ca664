#pragma once

#include <string>
#include <utility>

#include "registry/registry_store.hpp"

namespace quabble {

// A registry in one SQLite file, which is made when a transaction first begins. Whoever writes is alone in
// writing; another program that does is waited for, up to a second.
class SqliteRegistryStore final : public RegistryStore {
 public:
    explicit SqliteRegistryStore(std::string path) : path_(std::move(path)) {}

    std::unique_ptr<RegistryTransaction> begin(Access access) override;

 private:
    std::string path_;
};

}  // namespace quabble
