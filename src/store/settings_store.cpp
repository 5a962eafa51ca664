#include "store/settings_store.hpp"

#include <algorithm>
#include <optional>
#include <span>
#include <string>

#include "store/version.hpp"

namespace quabble {
namespace {

constexpr std::size_t longestName = 25;  // a name of 24 bytes and the zero byte at its end

// The program's own key.
std::string ownKey() {
    return "Software\\Vorlane\\" + std::string(applicationTitle) + "\\" + versionText();
}

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

// A value's bytes; nothing when there is no such value or it is larger than that.
std::optional<std::vector<std::byte>> queryBytes(RegistryTransaction& registry, std::string_view name,
                                                 std::size_t largest) {
    auto value = registry.query(ownKey(), name);
    if (!value || value->data.size() > largest)
        return std::nullopt;
    return std::move(value->data);
}

// Reads bytes; what the stored value is too short for stays as it was. False when there is none to read.
bool query(RegistryTransaction& registry, std::string_view name, std::span<std::byte> bytes) {
    const auto stored = queryBytes(registry, name, bytes.size());
    if (stored)
        std::ranges::copy(*stored, bytes.begin());
    return stored.has_value();
}

template <typename Number, std::size_t count>
bool queryNumbers(RegistryTransaction& registry, std::string_view name, std::array<Number, count>& numbers) {
    auto bytes = bytesOf(numbers);
    const bool isStored = query(registry, name, bytes);
    for (std::size_t i = 0; i < count; ++i)
        numbers[i] = readNumber<Number>(bytes, i);
    return isStored;
}

std::string scoresName(std::int16_t table) {
    return std::to_string(table) + "STATS";
}
std::string playerName(std::int16_t table, std::size_t place) {
    return scoresName(table) + std::to_string(place + 1);
}

std::optional<std::string> queryName(RegistryTransaction& registry, std::string_view name) {
    const auto stored = queryBytes(registry, name, longestName);
    if (!stored)
        return std::nullopt;
    // A value without even the zero byte, which only others could have stored, is an empty name.
    const std::size_t length = stored->empty() ? 0 : stored->size() - 1;
    return std::string(reinterpret_cast<const char*>(stored->data()), length);
}

void loadTable(RegistryTransaction& registry, std::int16_t number, HighScoreTable& table) {
    queryNumbers(registry, scoresName(number), table.scores);
    for (std::size_t place = 0; place < table.names.size(); ++place) {
        const auto name = queryName(registry, playerName(number, place));
        table.names[place] = name.value_or(unknownName);
        if (!name)
            table.scores[place] = 0;
    }
}

// That a value cannot be set shows when the transaction is committed.
void setBytes(RegistryTransaction& registry, std::string_view name, std::span<const std::byte> bytes) {
    registry.set(ownKey(), name, ValueType::Binary, bytes);
}

void saveTable(RegistryTransaction& registry, std::int16_t number, const HighScoreTable& table) {
    setBytes(registry, scoresName(number), bytesOf(table.scores));
    for (std::size_t place = 0; place < table.names.size(); ++place) {
        const std::string& name = table.names[place];
        const auto withZero = std::as_bytes(std::span(name.c_str(), name.size() + 1));
        registry.set(ownKey(), playerName(number, place), ValueType::String, withZero);
    }
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

StoreResult SettingsStore::loadSettings(Settings& settings, HighScores& highScores) {
    const auto registry = registry_.begin(Access::Read);
    isGivenUp_ = registry == nullptr;
    if (isGivenUp_)
        return StoreResult::NotOpened;
    query(*registry, "SOLVINGDATA", settings.solvingData.bytes);
    query(*registry, "NUMWFSF", settings.numwfsf);
    if (!queryNumbers(*registry, "SOUNDOPTIONS", settings.soundOptions))
        settings.soundOptions.fill(1);
    for (std::int16_t table = 1; table <= highScoreTables; ++table)
        loadTable(*registry, table, highScores.table(table));
    return StoreResult::Done;
}

StoreResult SettingsStore::saveSettings(const Settings& settings, const HighScores& highScores) {
    const auto registry = isGivenUp_ ? nullptr : registry_.begin(Access::Write);
    if (!registry)
        return StoreResult::NotOpened;
    registry->createKey(ownKey(), "USERDATA");
    setBytes(*registry, "SOLVINGDATA", settings.solvingData.bytes);
    setBytes(*registry, "NUMWFSF", settings.numwfsf);
    setBytes(*registry, "SOUNDOPTIONS", bytesOf(settings.soundOptions));
    for (std::int16_t table = 1; table <= highScoreTables; ++table)
        saveTable(*registry, table, highScores.table(table));
    return registry->commit() ? StoreResult::Done : StoreResult::NotWritten;
}

}  // namespace quabble
