#include "gfx/spoken_words.hpp"

#include <algorithm>

#include "gfx/message_template.hpp"

namespace quabble {
namespace {

using ClusterSizes = std::array<std::int16_t, std::size_t{maxGridCols} * maxGridRows>;

std::size_t indexOf(CellPosition place) {
    return static_cast<std::size_t>((place.row - 1) * maxGridCols + place.column - 1);
}

// How many cells the cluster of each has; whole clusters are taken away until nothing is left.
ClusterSizes clusterSizesOf(PlayGrid grid) {
    ClusterSizes sizes{};
    grid.forEachCell([&](CellPosition start, const GridCell& first) {
        if (first.isEmpty())
            return;
        const PlayGrid before = grid;
        grid.clusterAtLeast(start, 1);
        const std::int16_t size = grid.removeMarked();
        before.forEachCell([&](CellPosition place, const GridCell& cell) {
            if (!cell.isEmpty() && grid.at(place).isEmpty())
                sizes[indexOf(place)] = size;
        });
    });
    return sizes;
}

}  // namespace

std::string_view blockWords(std::int16_t colour) {
    return spoken::blocks.at(static_cast<std::size_t>(colour - 1));
}

std::string wordsFor(const GridCell& cell) {
    if (cell.isEmpty())
        return std::string(spoken::empty);
    if (cell.kind == CellKind::Stone)
        return std::string(spoken::stone);
    const std::string_view block = blockWords(cell.colour);
    return cell.kind == CellKind::Bomb ? fillText(spoken::bomb, {"|1", block}) : std::string(block);
}

std::vector<Place> boardPlaces(const CellBox& box, const PlayGrid& grid) {
    const ClusterSizes sizes = clusterSizesOf(grid);
    std::vector<Place> places;
    grid.forEachCell([&](CellPosition at, const GridCell& cell) {
        std::string words = wordsFor(cell);
        if (cell.kind == CellKind::Block && !cell.isEmpty())
            words = fillText(spoken::cluster, {"|1", words, "|2", sizes[indexOf(at)]});
        places.push_back({box.cell(at.column - 1, at.row - 1), Place::Role::Cell,
                          fillText(spoken::cell, {"|1", at.column, "|2", at.row, "|3", words})});
    });
    return places;
}

std::vector<Place> textPlaces(const Rect& area, std::string_view text) {
    constexpr std::string_view blank = " \r\n";
    std::vector<Place> places;
    for (std::size_t at = text.find_first_not_of(blank); at != std::string_view::npos;
         at = text.find_first_not_of(blank, at)) {
        const std::size_t end = std::min(text.find('\n', at), text.size());
        const std::string_view line = text.substr(at, end - at);
        places.push_back(
            {area, Place::Role::Text, std::string(line.substr(0, line.find_last_not_of(blank) + 1))});
        at = end;
    }
    const auto count = static_cast<std::int32_t>(places.size());
    for (std::int32_t i = 0; i < count; ++i) {
        Rect& part = places[static_cast<std::size_t>(i)].area;
        part.top = area.top + area.height() * i / count;
        part.bottom = area.top + area.height() * (i + 1) / count;
    }
    return places;
}

}  // namespace quabble
