#include "hosts/windows/keyboard.hpp"

#include <string>

#include "hosts/windows/registry/win32.hpp"
#include "hosts/windows/wide_text.hpp"

namespace quabble {
namespace {

bool isHeld(int key) {
    return GetKeyState(key) < 0;
}

// With Alt, as on a keyboard's AltGr, it is part of a character.
bool isCtrlHeld() {
    return isHeld(VK_CONTROL) && !isHeld(VK_MENU);
}

// What a key asks of a text being edited or of the program's pointer.
std::optional<EditCommand> commandOf(std::uintptr_t key) {
    const bool ctrl = isCtrlHeld();
    const bool shift = isHeld(VK_SHIFT);
    const auto when = [](bool isMeant, EditCommand command) {
        return isMeant ? std::optional(command) : std::nullopt;
    };
    switch (key) {
        case VK_LEFT:
            return ctrl ? EditCommand::WordLeft : EditCommand::Left;
        case VK_RIGHT:
            return ctrl ? EditCommand::WordRight : EditCommand::Right;
        case VK_UP:
            return EditCommand::Up;
        case VK_DOWN:
            return EditCommand::Down;
        case VK_APPS:
            return EditCommand::Click;
        case VK_RETURN:
            return when(ctrl, EditCommand::Click);
        case VK_HOME:
            return EditCommand::Home;
        case VK_END:
            return EditCommand::End;
        case VK_DELETE:
            return shift ? EditCommand::Cut : EditCommand::Delete;
        case VK_INSERT:
            return ctrl ? EditCommand::Copy : shift ? EditCommand::Paste : EditCommand::Click;
        case 'A':
            return when(ctrl, EditCommand::SelectAll);
        case 'C':
            return when(ctrl, EditCommand::Copy);
        case 'X':
            return when(ctrl, EditCommand::Cut);
        case 'V':
            return when(ctrl, EditCommand::Paste);
        default:
            return std::nullopt;
    }
}

}  // namespace

// Bits 16 to 23, and that it is one of the keys that came later to the keyboard.
std::size_t Keyboard::scanCodeOf(std::intptr_t details) {
    return static_cast<std::size_t>(details) >> 16 & 0x1FF;
}

bool Keyboard::isRepeated(std::intptr_t details) {
    return (HIWORD(details) & KF_REPEAT) != 0;
}

std::optional<InputEvent> Keyboard::press(std::uintptr_t key, std::intptr_t details) {
    if (!isRepeated(details))
        pressed_.set(scanCodeOf(details));
    const auto command = pressed_[scanCodeOf(details)] ? commandOf(key) : std::nullopt;
    if (!command || (command == EditCommand::Click && isRepeated(details)))
        return std::nullopt;
    return InputEvent{.kind = EventKind::Edit, .command = *command, .extends = isHeld(VK_SHIFT)};
}

std::vector<InputEvent> Keyboard::character(std::uintptr_t unit, std::intptr_t details) {
    const auto wide = static_cast<wchar_t>(unit);
    const bool isControl = wide < L' ' || wide == 0x7F;
    if ((isRepeated(details) && !pressed_[scanCodeOf(details)]) || (isControl && isCtrlHeld()))
        return {};
    std::vector<InputEvent> events;
    const bool isWhole = !IS_HIGH_SURROGATE(wide) && !IS_LOW_SURROGATE(wide);
    if (isWhole && !isRepeated(details))
        events.push_back({.kind = EventKind::KeyPress, .key = static_cast<std::int16_t>(wide)});
    else if (wide == keys::backspace)
        events.push_back({.kind = EventKind::Edit, .command = EditCommand::Backspace});
    if (IS_HIGH_SURROGATE(wide)) {
        firstOfPair_ = wide;
    } else if (!isControl) {
        const std::wstring text = isWhole ? std::wstring(1, wide) : std::wstring{firstOfPair_, wide};
        events.push_back({.kind = EventKind::TextInput, .text = utf8Of(text)});
    }
    return events;
}

}  // namespace quabble
