#pragma once

#include "registry/registry_store.hpp"

namespace quabble {

// Some bytes that are kept between runs, like a file or an entry of a browser's storage.
class Blob {
 public:
    virtual ~Blob() = default;

    // Empty when none were ever written; nothing when they cannot be read.
    virtual std::optional<std::vector<std::byte>> read() = 0;
    // Puts these in the place of those before; false when that fails, and then those before stay.
    virtual bool write(std::span<const std::byte> bytes) = 0;
};

// A registry that is read and written as one blob. Of two transactions that change it at the same time the
// first one to commit wins; between two programs the blob must not change between a read and the write that
// follows at once. That it cannot be written shows when a transaction is committed.
class BlobRegistryStore final : public RegistryStore {
 public:
    // The blob must outlive the store.
    explicit BlobRegistryStore(Blob& blob) : blob_(blob) {}

    std::unique_ptr<RegistryTransaction> begin(Access access) override;

 private:
    Blob& blob_;
};

}  // namespace quabble
