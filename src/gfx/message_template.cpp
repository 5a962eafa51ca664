#include "gfx/message_template.hpp"

#include <cassert>

#include "gfx/string_table.hpp"

namespace quabble {

std::string fillText(std::string_view text, std::initializer_list<TemplateArgument> keysAndValues) {
    std::string filled(text);
    std::string_view value;
    for (const auto* argument = keysAndValues.begin(); argument != keysAndValues.end();) {
        const std::string& key = (argument++)->text();
        if (argument != keysAndValues.end())
            value = (argument++)->text();
        assert(!key.empty());
        for (auto at = filled.find(key); at != std::string::npos; at = filled.find(key)) {
            assert(value.find(key) == std::string_view::npos);
            filled.replace(at, key.size(), value);
        }
    }
    return filled;
}

std::string fillTemplate(std::uint16_t id, std::initializer_list<TemplateArgument> keysAndValues) {
    return fillText(loadString(id), keysAndValues);
}

}  // namespace quabble
