#pragma once

#include "registry/blob_registry.hpp"

namespace quabble {

// The bytes that the page keeps in the browser's storage.
class PageBlob final : public Blob {
 public:
    std::optional<std::vector<std::byte>> read() override;
    bool write(std::span<const std::byte> bytes) override;
};

}  // namespace quabble
