#pragma once

#include <utility>

#include "registry/blob_registry.hpp"

namespace quabble {

// A blob that is gone when the process ends.
struct MemoryBlob final : Blob {
    std::vector<std::byte> bytes;

    explicit MemoryBlob(std::vector<std::byte> written = {}) : bytes(std::move(written)) {}

    std::optional<std::vector<std::byte>> read() override { return bytes; }
    bool write(std::span<const std::byte> written) override {
        bytes.assign(written.begin(), written.end());
        return true;
    }
};

}  // namespace quabble
