#include "hosts/web/page_keys.hpp"

#include <algorithm>
#include <array>

namespace quabble {
namespace {

struct NamedCommand {
    std::string_view key;
    EditCommand command;
};
constexpr std::array namedCommands{
    NamedCommand{"ArrowLeft", EditCommand::Left}, NamedCommand{"ArrowRight", EditCommand::Right},
    NamedCommand{"ArrowUp", EditCommand::Up},     NamedCommand{"ArrowDown", EditCommand::Down},
    NamedCommand{"Insert", EditCommand::Click},   NamedCommand{"ContextMenu", EditCommand::Click},
    NamedCommand{"Home", EditCommand::Home},      NamedCommand{"End", EditCommand::End},
    NamedCommand{"Delete", EditCommand::Delete}};

struct NamedKey {
    std::string_view key;
    std::int16_t character;
};
constexpr std::array namedKeys{NamedKey{"Enter", keys::enter}, NamedKey{"Escape", keys::escape},
                               NamedKey{"Backspace", keys::backspace}, NamedKey{"Tab", keys::tab}};

std::optional<EditCommand> commandOf(const PageKey& key) {
    if (key.ctrl && key.key == "Enter")
        return EditCommand::Click;
    if (key.ctrl && key.editsText && (key.key == "a" || key.key == "A"))
        return EditCommand::SelectAll;
    const auto named = std::ranges::find(namedCommands, key.key, &NamedCommand::key);
    if (named == namedCommands.end())
        return std::nullopt;
    if (key.ctrl && named->command == EditCommand::Left)
        return EditCommand::WordLeft;
    if (key.ctrl && named->command == EditCommand::Right)
        return EditCommand::WordRight;
    return named->command;
}

// Names of keys have several letters, all of ASCII; a character is one code point. All that are not of ASCII
// mean the same.
std::optional<std::int16_t> characterOf(std::string_view key) {
    const auto named = std::ranges::find(namedKeys, key, &NamedKey::key);
    if (named != namedKeys.end())
        return named->character;
    if (key.size() == 1)
        return key.front();
    const auto isContinuation = [](char byte) { return (static_cast<unsigned char>(byte) & 0xC0U) == 0x80U; };
    const bool isCharacter = std::ranges::count_if(key, isContinuation) == std::ssize(key) - 1;
    return isCharacter ? std::optional<std::int16_t>('?') : std::nullopt;
}

}  // namespace

std::optional<InputEvent> translate(const PageKey& key) {
    const bool isCommand = (key.ctrl || key.alt) && !key.altGraph;
    const auto command = key.alt ? std::nullopt : commandOf(key);
    if (command == EditCommand::Click && key.isRepeated)
        return std::nullopt;
    if (command)
        return InputEvent{.kind = EventKind::Edit, .command = *command, .extends = key.shift};
    if (isCommand || (key.key == "Tab" && !key.editsText))
        return std::nullopt;
    const auto character = characterOf(key.key);
    if (character && !key.isRepeated)
        return InputEvent{.kind = EventKind::KeyPress, .key = *character};
    if (character == keys::backspace)
        return InputEvent{.kind = EventKind::Edit, .command = EditCommand::Backspace};
    return std::nullopt;
}

}  // namespace quabble
