#pragma once

#include <optional>

#include "draw/scale.hpp"
#include "gfx/sprites.hpp"
#include "platform/front_end.hpp"

namespace quabble {

// The two pictures that come with the program, made for a scale when they are first asked for at it. At scale
// 1 they are taken as they are; at others from a large version of the same drawing, if there is one that
// belongs to it.
class Pictures {
 public:
    // The front end, which must outlive the pictures, has the files.
    explicit Pictures(FrontEnd& frontEnd) : frontEnd_(frontEnd) {}

    // What the games are drawn with; it stays until another scale is asked for. When the sheet is missing,
    // damaged or too small, plain coloured tiles with their numbers stand in for it.
    const Sprites& sprites(Scale scale);

    // What the splash shows; without pixels when there is none.
    Surface backdrop(Scale scale);

 private:
    FrontEnd& frontEnd_;
    std::optional<Sprites> sprites_;
    Scale scale_;
};

}  // namespace quabble
