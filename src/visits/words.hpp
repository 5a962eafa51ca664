#pragma once

#include <optional>
#include <string_view>

#include "platform/input_event.hpp"

namespace quabble {

// The words that visits are written with, and what they stand for; nothing for any other word.

std::string_view wordOf(EventKind kind);
std::optional<EventKind> eventKindOf(std::string_view word);

std::string_view wordOf(EditCommand command);
std::optional<EditCommand> editCommandOf(std::string_view word);

// A key with a meaning of its own has a name, any other is its character. All others mean the same, so that
// one letter may stand for them.
std::string_view wordOfKey(std::int16_t key);
std::optional<std::int16_t> keyOf(std::string_view word);

std::string_view wordOf(Scale scale);
std::optional<Scale> scaleOf(std::string_view word);

}  // namespace quabble
