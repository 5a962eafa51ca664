#include "gfx/string_table.hpp"

#include <algorithm>
#include <cassert>
#include <iterator>

namespace quabble {
namespace {

struct Entry {
    std::uint16_t id;
    std::string_view text;
};

constexpr Entry table[] = {
#include "strings.inc"
};

}  // namespace

std::string_view loadString(std::uint16_t id) {
    const auto entry =
        std::ranges::find_if(table, [&](const Entry& candidate) { return candidate.id == id; });
    assert(entry != std::end(table));
    return entry->text;
}

}  // namespace quabble
