// Feeds any bytes to the settings: as the registry's file, as its blob, and as values of a sound registry.
// The first byte says which. What was loaded is saved and loaded again.

#include <cassert>
#include <cstdio>
#include <fstream>
#include <span>
#include <string>

#include "../support/files.hpp"
#include "hosts/desktop/registry/sqlite_registry.hpp"
#include "hosts/headless/memory_blob.hpp"
#include "store/settings_store.hpp"

namespace quabble {
namespace {

struct Store {
    Settings settings;
    HighScores highScores;
};

Store load(RegistryStore& registry) {
    Store store;
    SettingsStore(registry).loadSettings(store.settings, store.highScores);
    return store;
}

void requireRoundTrip(RegistryStore& registry) {
    const Store loaded = load(registry);
    if (SettingsStore(registry).saveSettings(loaded.settings, loaded.highScores) != StoreResult::Done)
        return;
    const Store again = load(registry);
    assert(again.settings.solvingData.bytes == loaded.settings.solvingData.bytes);
    assert(again.settings.soundOptions == loaded.settings.soundOptions);
    assert(again.highScores == loaded.highScores);
}

void tryAsFile(std::span<const unsigned char> bytes) {
    static const TemporaryFolder folder;
    const std::string path = folder.path / "registry.db";
    std::ofstream(path, std::ios::binary)
        .write(reinterpret_cast<const char*>(bytes.data()), static_cast<std::streamsize>(bytes.size()));
    SqliteRegistryStore registry(path);
    requireRoundTrip(registry);
    std::remove(path.c_str());
    for (const char* ending : {"-journal", "-wal", "-shm"})
        std::remove((path + ending).c_str());
}

void tryAsBlob(std::span<const unsigned char> bytes) {
    const auto content = std::as_bytes(bytes);
    MemoryBlob blob({content.begin(), content.end()});
    BlobRegistryStore registry(blob);
    requireRoundTrip(registry);
}

// Values one after another: a byte that chooses the name, a byte for the size, then the bytes themselves.
void tryAsValues(std::span<const unsigned char> bytes) {
    static const std::string names[] = {"SOLVINGDATA", "NUMWFSF", "SOUNDOPTIONS", "1STATS",
                                        "2STATS",      "1STATS1", "3STATS8"};
    MemoryBlob blob;
    BlobRegistryStore registry(blob);
    const auto transaction = registry.begin(Access::Write);
    const char* key = R"(Software\Vorlane\Quabble\1.0)";
    transaction->createKey(key, "USERDATA");
    while (bytes.size() >= 2) {
        const std::string& name = names[bytes[0] % std::size(names)];
        const auto value = bytes.subspan(2, std::min<std::size_t>(bytes[1], bytes.size() - 2));
        transaction->set(key, name, ValueType::Binary, std::as_bytes(value));
        bytes = bytes.subspan(2 + value.size());
    }
    transaction->commit();
    requireRoundTrip(registry);
}

}  // namespace
}  // namespace quabble

extern "C" int LLVMFuzzerTestOneInput(const unsigned char* data, std::size_t size) {
    if (size == 0)
        return 0;
    const auto bytes = std::span(data, size).subspan(1);
    if (data[0] % 2 == 0)
        quabble::tryAsFile(bytes);
    else if (data[0] % 8 == 7)
        quabble::tryAsBlob(bytes);
    else
        quabble::tryAsValues(bytes);
    return 0;
}
