#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "draw/geometry.hpp"

namespace quabble {

// Something that a window's picture shows, in words. Texts and rows of a table are only there to be read; to
// all others the arrow keys go, and a click in the middle of their areas must mean something.
struct Place {
    enum class Role : std::uint8_t { Text, TableRow, Button, Link, Cell, TextField };
    Rect area;
    Role role = Role::Button;
    std::string words = {};  // Windows-1252

    bool isReached() const { return role != Role::Text && role != Role::TableRow; }
};

// The text in a field, Windows-1252, with the caret and the other end of the selection in characters from its
// start.
struct EditedText {
    std::string text = {};
    std::size_t caret = 0;
    std::size_t anchor = 0;
    friend bool operator==(const EditedText&, const EditedText&) = default;
};

// A window in words, for those who do not see it.
struct Description {
    std::string name;  // of the screen that it shows, Windows-1252
    std::vector<Place> places;
    std::optional<std::size_t> current;  // the place that the ring or the focus is at
    std::optional<EditedText> edited;    // of the text field that has the focus
};

}  // namespace quabble
