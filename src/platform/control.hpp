#pragma once

#include <functional>
#include <string>

#include "base/task.hpp"
#include "platform/surface.hpp"
#include "platform/text.hpp"

namespace quabble {

// Something that lies on a window above its picture and takes the mouse there. It becomes visible, and goes,
// when the window is presented; the picture beneath stays as it is.
class Control {
 public:
    virtual ~Control() = default;

    bool visible = false;
    Rect area;

    virtual void paint(Surface& surface) const = 0;
    virtual Task<> mouseDown() = 0;
};

// A line of text in the middle of a plain area.
class Label final : public Control {
 public:
    std::string caption;  // Windows-1252
    Font font;
    Colour textColour;
    Colour background;
    std::function<Task<>()> onClick;

    void paint(Surface& surface) const override {
        surface.fill(area, background);
        drawText(surface, area, caption,
                 text_format::centre + text_format::verticalCentre + text_format::singleLine, textColour,
                 font);
    }
    Task<> mouseDown() override { return onClick(); }
};

}  // namespace quabble
