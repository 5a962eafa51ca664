#pragma once

#include <cstdint>
#include <functional>
#include <string>
#include <string_view>
#include <utility>

#include "base/task.hpp"
#include "draw/canvas.hpp"
#include "platform/input_event.hpp"
#include "platform/place.hpp"

namespace quabble {

// Something that lies on a window above its picture and takes the mouse there and, while it has the focus,
// the keyboard. It becomes visible, and goes, when the window is presented; the picture beneath stays as it
// is.
class Control {
 public:
    virtual ~Control() = default;

    bool visible = false;
    Rect area;

    // What it is and does, in words.
    virtual Place place() const = 0;

    virtual void paint(Canvas& canvas, bool hasFocus) const = 0;
    virtual Task<> mouseDown(Point at, bool extends) = 0;
    // The pointer moved after a press on the control, and the button is still held.
    virtual void mouseDrag(Point /*at*/) {}
    // Whoever takes the focus also hears, after a press, where the button was let go.
    virtual Task<> mouseUp(Point at);

    // Whether it is there to be clicked, which the pointer's shape tells.
    virtual bool isClickable() const { return false; }
    virtual bool takesFocus() const { return false; }
    virtual bool takesText() const { return false; }
    // A key that the control with the focus may act on; false when it means nothing to it.
    virtual bool takesKey(std::int16_t /*key*/) const { return false; }
    virtual Task<> keyPress(std::int16_t key);
    virtual void textInput(std::string_view /*utf8*/) {}
    virtual void edit(EditCommand /*command*/, bool /*extends*/) {}
    virtual std::optional<EditedText> editedText() const { return std::nullopt; }
};

// Paints the bright ring around the control that has the focus.
void paintFocusRing(Canvas& canvas, const Rect& area);
// Paints the edge of a control that takes the keyboard and, while it has the focus, the ring.
void paintControlEdge(Canvas& canvas, const Rect& area, bool hasFocus);
constexpr Colour controlInk{16, 22, 48};

// Makes the task of what a click does.
using ClickHandler = std::function<Task<>()>;

// A line of text in the middle of a plain area, which can be clicked.
class Label final : public Control {
 public:
    explicit Label(ClickHandler onClick) : onClick_(std::move(onClick)) {}

    std::string caption;  // Windows-1252
    Font font;
    Colour textColour;
    Colour background;

    Place place() const override { return {area, Place::Role::Button, caption}; }
    void paint(Canvas& canvas, bool hasFocus) const override;
    Task<> mouseDown(Point, bool) override { return onClick_(); }
    bool isClickable() const override { return true; }

 private:
    ClickHandler onClick_;
};

// A button whose look is drawn on the window's picture; the control adds the ring of the focus.
// It acts when the mouse button is let go over it, so that moving off it takes a press back. The space key
// presses it while it has the focus.
class PushButton final : public Control {
 public:
    explicit PushButton(ClickHandler onClick) : onClick_(std::move(onClick)) {}

    std::string caption;  // Windows-1252

    Place place() const override { return {area, Place::Role::Button, caption}; }
    void paint(Canvas& canvas, bool hasFocus) const override;
    Task<> mouseDown(Point at, bool extends) override;
    Task<> mouseUp(Point at) override;
    bool isClickable() const override { return true; }
    bool takesFocus() const override { return true; }
    bool takesKey(std::int16_t key) const override { return key == keys::space; }
    Task<> keyPress(std::int16_t) override { return onClick_(); }

 private:
    ClickHandler onClick_;
};

}  // namespace quabble
