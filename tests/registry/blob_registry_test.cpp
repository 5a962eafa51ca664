#include "../support/registry_store_suite.hpp"
#include "hosts/headless/memory_blob.hpp"

namespace quabble {
namespace {

struct BlobPlace {
    MemoryBlob blob;

    std::unique_ptr<RegistryStore> open() { return std::make_unique<BlobRegistryStore>(blob); }
    std::string content() const {
        return {reinterpret_cast<const char*>(blob.bytes.data()), blob.bytes.size()};
    }

    static std::vector<std::pair<const char*, std::function<void(BlobPlace&)>>> damages() {
        return {{"garbage", [](BlobPlace& place) { place.blob.bytes.assign(200, std::byte{'x'}); }},
                {"of another version", [](BlobPlace& place) { place.blob.bytes[7] = std::byte{'2'}; }},
                {"cut off", [](BlobPlace& place) { place.blob.bytes.pop_back(); }},
                {"all but nothing", [](BlobPlace& place) { place.blob.bytes.resize(1); }},
                {"one bit turned over", [](BlobPlace& place) { place.blob.bytes.back() ^= std::byte{1}; }},
                {"longer than it was", [](BlobPlace& place) { place.blob.bytes.push_back({}); }}};
    }
};
INSTANTIATE_TYPED_TEST_SUITE_P(Blob, RegistryStoreSuite, BlobPlace);

// Storage that fails now and then, as that of a browser may.
struct FailingBlob final : Blob {
    MemoryBlob kept;
    bool canRead = true, canWrite = true;

    std::optional<std::vector<std::byte>> read() override { return canRead ? kept.read() : std::nullopt; }
    bool write(std::span<const std::byte> bytes) override { return canWrite && kept.write(bytes); }
};

TEST(BlobRegistry, SaysThatItsBlobCannotBeReadOrWritten) {
    FailingBlob blob;
    BlobRegistryStore store(blob);
    const auto transaction = store.begin(Access::Write);
    transaction->createKey("Software", "");
    blob.canWrite = false;
    EXPECT_FALSE(transaction->commit());
    EXPECT_TRUE(blob.kept.bytes.empty());
    blob.canRead = false;
    EXPECT_FALSE(store.begin(Access::Read));
}

// The file's checksum tells of accidents, not of malice: what is under a right one may still be anything.
TEST(BlobRegistry, OutlivesAnyBytesUnderARightChecksum) {
    const auto little = [](std::uint32_t number) {
        std::string bytes;
        for (int shift = 0; shift < 32; shift += 8)
            bytes += static_cast<char>(number >> shift);
        return bytes;
    };
    const auto opens = [&](const std::string& content) {
        std::uint32_t crc = 0xFFFFFFFF;
        for (const char character : content) {
            crc ^= static_cast<unsigned char>(character);
            for (int bit = 0; bit < 8; ++bit)
                crc = (crc & 1) != 0 ? (crc >> 1) ^ 0xEDB88320 : crc >> 1;
        }
        const std::string whole = "QUABBLE1" + little(~crc) + content;
        const auto bytes = std::as_bytes(std::span(whole));
        MemoryBlob blob({bytes.begin(), bytes.end()});
        return BlobRegistryStore(blob).begin(Access::Read) != nullptr;
    };
    const std::string key = little(1) + little(1) + "K" + little(0);
    EXPECT_TRUE(opens(little(0)));
    EXPECT_TRUE(opens(key + little(0)));
    EXPECT_TRUE(opens(key + little(1) + little(1) + "v" + little(3) + little(2) + "ab"));
    EXPECT_FALSE(opens("")) << "not even a number";
    EXPECT_FALSE(opens(little(0xFFFFFFFF))) << "keys that are not there";
    EXPECT_FALSE(opens(key + little(0xFFFFFFFF))) << "values that are not there";
    EXPECT_FALSE(opens(key + little(1) + little(1) + "v" + little(3) + little(0xFFFFFFFF) + "ab"));
    EXPECT_FALSE(opens(key + little(0) + "x")) << "something after the end";
}

}  // namespace
}  // namespace quabble
