#include "registry/blob_registry.hpp"

#include <algorithm>
#include <map>
#include <string>
#include <utility>

namespace quabble {
namespace {

using Bytes = std::vector<std::byte>;

// The blob: these eight bytes, of which the last is the version, the checksum of what follows, then the keys.
// A number takes four bytes, the least significant first; a text or a value its length and its bytes; a list
// its length and its items. A key is its path, its class and its values, a value its name, its type and its
// data.
constexpr std::string_view signature = "QUABBLE1";
constexpr std::size_t headerSize = 12;

char lowerCase(char character) {
    return character >= 'A' && character <= 'Z' ? static_cast<char>(character - 'A' + 'a') : character;
}

struct WithoutCase {
    using is_transparent = void;
    bool operator()(std::string_view left, std::string_view right) const {
        return std::ranges::lexicographical_compare(left, right, {}, lowerCase, lowerCase);
    }
};
template <typename Item>
using ByName = std::map<std::string, Item, WithoutCase>;

struct Key {
    std::string classString;
    ByName<RegistryValue> values;
};
using Keys = ByName<Key>;

// CRC-32 as in ISO 3309: the reflected polynomial 0xEDB88320, begun and ended with all bits turned over.
std::uint32_t checksumOf(std::span<const std::byte> bytes) {
    std::uint32_t remainder = 0xFFFFFFFF;
    for (const std::byte byte : bytes) {
        remainder ^= std::to_integer<std::uint32_t>(byte);
        for (int bit = 0; bit < 8; ++bit)
            remainder = (remainder >> 1) ^ ((remainder & 1) != 0 ? 0xEDB88320 : 0);
    }
    return ~remainder;
}

class Writer {
 public:
    void add(std::uint32_t number) {
        for (int shift = 0; shift < 32; shift += 8)
            bytes.push_back(static_cast<std::byte>(number >> shift));
    }
    void addBytes(std::span<const std::byte> added) { bytes.insert(bytes.end(), added.begin(), added.end()); }
    void add(std::span<const std::byte> item) {
        add(static_cast<std::uint32_t>(item.size()));
        addBytes(item);
    }
    void add(std::string_view text) { add(std::as_bytes(std::span(text))); }

    Bytes bytes;
};

// Takes what a Writer has added; once something is missing, all that follows is empty.
class Reader {
 public:
    explicit Reader(std::span<const std::byte> bytes) : rest_(bytes) {}

    std::uint32_t number() {
        std::uint32_t value = 0;
        int shift = 0;
        for (const std::byte byte : take(4)) {
            value |= std::to_integer<std::uint32_t>(byte) << shift;
            shift += 8;
        }
        return value;
    }
    std::span<const std::byte> item() { return take(number()); }
    std::string text() {
        const auto bytes = item();
        return {reinterpret_cast<const char*>(bytes.data()), bytes.size()};
    }
    bool isSound() const { return isSound_; }
    bool isAtEnd() const { return isSound_ && rest_.empty(); }

 private:
    std::span<const std::byte> take(std::size_t size) {
        isSound_ = isSound_ && size <= rest_.size();
        if (!isSound_)
            return {};
        return std::exchange(rest_, rest_.subspan(size)).first(size);
    }

    std::span<const std::byte> rest_;
    bool isSound_ = true;
};

Bytes encode(const Keys& keys) {
    Writer content;
    content.add(static_cast<std::uint32_t>(keys.size()));
    for (const auto& [path, key] : keys) {
        content.add(path);
        content.add(key.classString);
        content.add(static_cast<std::uint32_t>(key.values.size()));
        for (const auto& [name, value] : key.values) {
            content.add(name);
            content.add(static_cast<std::uint32_t>(value.type));
            content.add(value.data);
        }
    }
    Writer blob;
    blob.addBytes(std::as_bytes(std::span(signature)));
    blob.add(checksumOf(content.bytes));
    blob.addBytes(content.bytes);
    return blob.bytes;
}

// Nothing when the bytes are not a whole registry of this version. No bytes are an empty registry.
std::optional<Keys> decode(std::span<const std::byte> blob) {
    Keys keys;
    if (blob.empty())
        return keys;
    if (blob.size() < headerSize ||
        !std::ranges::equal(blob.first(signature.size()), std::as_bytes(std::span(signature))))
        return std::nullopt;
    const auto content = blob.subspan(headerSize);
    if (Reader(blob.subspan(signature.size())).number() != checksumOf(content))
        return std::nullopt;
    Reader reader(content);
    for (std::uint32_t left = reader.number(); left > 0 && reader.isSound(); --left) {
        Key& key = keys[reader.text()];
        key.classString = reader.text();
        for (std::uint32_t values = reader.number(); values > 0 && reader.isSound(); --values) {
            RegistryValue& value = key.values[reader.text()];
            value.type = static_cast<ValueType>(reader.number());
            const auto data = reader.item();
            value.data.assign(data.begin(), data.end());
        }
    }
    return reader.isAtEnd() ? std::optional(std::move(keys)) : std::nullopt;
}

class BlobTransaction final : public RegistryTransaction {
 public:
    BlobTransaction(Blob& blob, Bytes before, Keys keys, Access access)
        : blob_(blob),
          before_(std::move(before)),
          keys_(std::move(keys)),
          canChange_(access == Access::Write) {}

    bool createKey(std::string_view path, std::string_view classString) override {
        for (std::size_t end = 0; canChange_ && end != std::string_view::npos;) {
            end = path.find('\\', end + 1);
            const bool isWhole = end == std::string_view::npos;
            keys_.try_emplace(std::string(path.substr(0, end)),
                              Key{std::string(isWhole ? classString : ""), {}});
        }
        return canChange_;
    }

    std::optional<RegistryValue> query(std::string_view key, std::string_view name) override {
        const auto found = keys_.find(key);
        if (found == keys_.end())
            return std::nullopt;
        const auto value = found->second.values.find(name);
        return value == found->second.values.end() ? std::nullopt : std::optional(value->second);
    }

    bool set(std::string_view key, std::string_view name, ValueType type,
             std::span<const std::byte> data) override {
        const auto found = keys_.find(key);
        canChange_ = canChange_ && found != keys_.end();
        if (canChange_)
            found->second.values[std::string(name)] = {type, {data.begin(), data.end()}};
        return canChange_;
    }

    bool commit() override {
        return std::exchange(canChange_, false) && blob_.read() == before_ && blob_.write(encode(keys_));
    }

 private:
    Blob& blob_;
    Bytes before_;  // the blob as it was read
    Keys keys_;
    bool canChange_;
};

}  // namespace

std::unique_ptr<RegistryTransaction> BlobRegistryStore::begin(Access access) {
    auto bytes = blob_.read();
    auto keys = bytes ? decode(*bytes) : std::nullopt;
    if (!keys)
        return nullptr;
    return std::make_unique<BlobTransaction>(blob_, std::move(*bytes), std::move(*keys), access);
}

}  // namespace quabble
