#include "visits/words.hpp"

#include <algorithm>
#include <array>
#include <span>
#include <utility>

namespace quabble {
namespace {

template <typename Meaning>
using Word = std::pair<std::string_view, Meaning>;

constexpr Word<EventKind> eventWords[] = {
    {"press", EventKind::MouseDown},   {"move", EventKind::MouseMove},     {"release", EventKind::MouseUp},
    {"key", EventKind::KeyPress},      {"type", EventKind::TextInput},     {"edit", EventKind::Edit},
    {"close", EventKind::CloseButton}, {"minimise", EventKind::Minimised}, {"restore", EventKind::Restored},
    {"scale", EventKind::Rescaled}};

constexpr Word<EditCommand> editWords[] = {{"left", EditCommand::Left},
                                           {"right", EditCommand::Right},
                                           {"up", EditCommand::Up},
                                           {"down", EditCommand::Down},
                                           {"click", EditCommand::Click},
                                           {"word-left", EditCommand::WordLeft},
                                           {"word-right", EditCommand::WordRight},
                                           {"home", EditCommand::Home},
                                           {"end", EditCommand::End},
                                           {"backspace", EditCommand::Backspace},
                                           {"delete", EditCommand::Delete},
                                           {"select-all", EditCommand::SelectAll},
                                           {"copy", EditCommand::Copy},
                                           {"cut", EditCommand::Cut},
                                           {"paste", EditCommand::Paste}};

constexpr Word<std::int16_t> keyWords[] = {{"enter", keys::enter},
                                           {"escape", keys::escape},
                                           {"tab", keys::tab},
                                           {"space", keys::space},
                                           {"backspace", keys::backspace}};

constexpr Word<std::int32_t> scaleWords[] = {  // in quarters
    {"1", 4},     {"1.25", 5}, {"1.5", 6},   {"1.75", 7}, {"2", 8},     {"2.25", 9}, {"2.5", 10},
    {"2.75", 11}, {"3", 12},   {"3.25", 13}, {"3.5", 14}, {"3.75", 15}, {"4", 16}};

template <typename Meaning>
std::string_view wordFor(std::span<const Word<Meaning>> words, Meaning meaning) {
    const auto found = std::ranges::find(words, meaning, &Word<Meaning>::second);
    return found == words.end() ? std::string_view() : found->first;
}

template <typename Meaning>
std::optional<Meaning> meaningOf(std::span<const Word<Meaning>> words, std::string_view word) {
    const auto found = std::ranges::find(words, word, &Word<Meaning>::first);
    return found == words.end() ? std::nullopt : std::optional(found->second);
}

}  // namespace

std::string_view wordOf(EventKind kind) {
    return wordFor<EventKind>(eventWords, kind);
}
std::optional<EventKind> eventKindOf(std::string_view word) {
    return meaningOf<EventKind>(eventWords, word);
}

std::string_view wordOf(EditCommand command) {
    return wordFor<EditCommand>(editWords, command);
}
std::optional<EditCommand> editCommandOf(std::string_view word) {
    return meaningOf<EditCommand>(editWords, word);
}

std::string_view wordOfKey(std::int16_t key) {
    const std::string_view name = wordFor<std::int16_t>(keyWords, key);
    return name.empty() ? "x" : name;
}
std::optional<std::int16_t> keyOf(std::string_view word) {
    if (word.size() == 1 && word[0] > ' ')
        return word[0];
    return meaningOf<std::int16_t>(keyWords, word);
}

std::string_view wordOf(Scale scale) {
    return wordFor<std::int32_t>(scaleWords, scale.quarters());
}
std::optional<Scale> scaleOf(std::string_view word) {
    const auto quarters = meaningOf<std::int32_t>(scaleWords, word);
    return quarters ? std::optional(Scale::ofQuarters(*quarters)) : std::nullopt;
}

}  // namespace quabble
