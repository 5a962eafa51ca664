#pragma once

#include <cstdint>
#include <initializer_list>
#include <string>
#include <string_view>

namespace quabble {

// A key or a value of a template: a text, or a number written in decimal digits.
class TemplateArgument {
 public:
    TemplateArgument(const char* text) : text_(text) {}
    TemplateArgument(std::string text) : text_(std::move(text)) {}
    TemplateArgument(std::string_view text) : text_(text) {}
    TemplateArgument(std::int32_t number) : text_(std::to_string(number)) {}
    const std::string& text() const { return text_; }

 private:
    std::string text_;
};

// Replaces every occurrence of each key by its value, pair by pair in the order given: key, value, key,
// value. A last key without a value gets the value of the pair before it (the first one the empty text). A
// value must not contain its own key.
std::string fillText(std::string_view text, std::initializer_list<TemplateArgument> keysAndValues);

// The same for the text of an id of the string table.
std::string fillTemplate(std::uint16_t id, std::initializer_list<TemplateArgument> keysAndValues);

}  // namespace quabble
