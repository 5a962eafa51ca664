#include "hosts/web/page_blob.hpp"

#include "hosts/web/page.hpp"

namespace quabble {

std::optional<std::vector<std::byte>> PageBlob::read() {
    const std::int32_t size = page::storageSize();
    if (size < 0)
        return std::nullopt;
    std::vector<std::byte> bytes(static_cast<std::size_t>(size));
    page::take(bytes.data());
    return bytes;
}

bool PageBlob::write(std::span<const std::byte> bytes) {
    return page::writeStorage(bytes.data(), bytes.size());
}

}  // namespace quabble
