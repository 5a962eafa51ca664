#include "store/settings_store.hpp"

#include <optional>
#include <span>
#include <string>

#include "store/version.hpp"

namespace quabble {
namespace {

constexpr std::size_t nameBuffer = 25;  // a name of 24 bytes and the zero byte at its end

// Numbers are kept with their least significant byte first, whatever the machine.
template <typename Number>
Number readNumber(std::span<const std::byte> bytes, std::size_t index) {
    std::uint32_t value = 0;
    for (std::size_t i = 0; i < sizeof(Number); ++i)
        value |= std::to_integer<std::uint32_t>(bytes[index * sizeof(Number) + i]) << (8 * i);
    return static_cast<Number>(value);
}

template <typename Number>
void writeNumber(std::span<std::byte> bytes, std::size_t index, Number number) {
    for (std::size_t i = 0; i < sizeof(Number); ++i)
        bytes[index * sizeof(Number) + i] =
            static_cast<std::byte>(static_cast<std::uint32_t>(number) >> (8 * i));
}

template <typename Number, std::size_t count>
std::array<std::byte, count * sizeof(Number)> bytesOf(const std::array<Number, count>& numbers) {
    std::array<std::byte, count * sizeof(Number)> bytes{};
    for (std::size_t i = 0; i < count; ++i)
        writeNumber(std::span<std::byte>(bytes), i, numbers[i]);
    return bytes;
}

// Reads numbers; what the stored value is too short for keeps its old value. False when there is none to
// read.
template <typename Number, std::size_t count>
bool queryNumbers(const RegistryKey& key, std::string_view name, std::array<Number, count>& numbers) {
    auto bytes = bytesOf(numbers);
    if (!key.query(name, bytes))
        return false;
    for (std::size_t i = 0; i < count; ++i)
        numbers[i] = readNumber<Number>(bytes, i);
    return true;
}

std::string scoresName(std::int16_t table) {
    return std::to_string(table) + "STATS";
}
std::string playerName(std::int16_t table, std::size_t place) {
    return scoresName(table) + std::to_string(place + 1);
}

std::optional<std::string> queryName(const RegistryKey& key, std::string_view name) {
    std::array<std::byte, nameBuffer> buffer{};
    const auto found = key.query(name, buffer);
    if (!found)
        return std::nullopt;
    // A value without even the zero byte, which only others could have stored, is an empty name.
    const std::size_t length = found->size == 0 ? 0 : found->size - 1;
    return std::string(reinterpret_cast<const char*>(buffer.data()), length);
}

void loadTable(const RegistryKey& key, std::int16_t number, HighScoreTable& table) {
    queryNumbers(key, scoresName(number), table.scores);
    for (std::size_t place = 0; place < table.names.size(); ++place) {
        const auto name = queryName(key, playerName(number, place));
        table.names[place] = name.value_or(unknownName);
        if (!name)
            table.scores[place] = 0;
    }
}

void saveTable(RegistryKey& key, std::int16_t number, const HighScoreTable& table) {
    key.set(scoresName(number), ValueType::Binary, bytesOf(table.scores));
    for (std::size_t place = 0; place < table.names.size(); ++place) {
        const std::string& name = table.names[place];
        const auto withZero = std::as_bytes(std::span(name.c_str(), name.size() + 1));
        key.set(playerName(number, place), ValueType::String, withZero);
    }
}

// The program's own key.
std::optional<RegistryKey> openStore(Registry& registry, Access access) {
    const auto software = registry.openKey("Software", access);
    if (!software)
        return std::nullopt;
    const std::string subkey = "Vorlane\\" + std::string(applicationTitle) + "\\" + versionText();
    return software->createKey(subkey, "USERDATA");
}

}  // namespace

std::int16_t SolvingData::scoreTableIndex() const {
    return readNumber<std::int16_t>(bytes, 1);
}
void SolvingData::setScoreTableIndex(std::int16_t index) {
    writeNumber(std::span<std::byte>(bytes), 1, index);
}
void SolvingData::setSplashSeen() {
    writeNumber(std::span<std::byte>(bytes), 2, std::int16_t{1});
}

StoreResult loadSettings(Settings& settings, HighScores& highScores, Registry& registry) {
    const auto key = openStore(registry, Access::Read);
    if (!key)
        return StoreResult::NotOpened;
    key->query("SOLVINGDATA", settings.solvingData.bytes);
    key->query("NUMWFSF", settings.numwfsf);
    if (!queryNumbers(*key, "SOUNDOPTIONS", settings.soundOptions))
        settings.soundOptions.fill(1);
    for (std::int16_t table = 1; table <= highScoreTables; ++table)
        loadTable(*key, table, highScores.table(table));
    return StoreResult::Done;
}

StoreResult saveSettings(const Settings& settings, const HighScores& highScores, Registry& registry) {
    auto key = openStore(registry, Access::Write);
    if (!key)
        return StoreResult::NotOpened;
    key->set("SOLVINGDATA", ValueType::Binary, settings.solvingData.bytes);
    key->set("NUMWFSF", ValueType::Binary, settings.numwfsf);
    key->set("SOUNDOPTIONS", ValueType::Binary, bytesOf(settings.soundOptions));
    for (std::int16_t table = 1; table <= highScoreTables; ++table)
        saveTable(*key, table, highScores.table(table));
    return key->commit() ? StoreResult::Done : StoreResult::NotWritten;
}

}  // namespace quabble
