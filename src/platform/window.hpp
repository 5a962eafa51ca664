#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "base/task.hpp"
#include "draw/canvas.hpp"
#include "platform/control.hpp"
#include "platform/input_event.hpp"
#include "platform/message_loop.hpp"
#include "platform/place.hpp"

namespace quabble {

// A window of the program: a fixed size, a picture of its own that is seen as it was presented last, and the
// handlers of what happens to it. Measures in pixels are of its client area.
class Window {
 public:
    enum class State { Normal, Minimised };

    // What a fixed frame adds to a client area, nominally and on every machine alike. Layouts that start from
    // a window's outer size count with it.
    static constexpr Size nominalFrame{6, 29};

    // A window with an owner is a dialog. The loop and the owner must outlive it. It must not be destroyed
    // while one of its handlers runs or waits.
    explicit Window(MessageLoop& loop, Window* owner = nullptr);
    virtual ~Window();
    Window(const Window&) = delete;
    Window& operator=(const Window&) = delete;

    // A new one each time it is shown: events for an earlier one are ignored.
    WindowId id() const { return id_; }
    bool isDialog() const { return owner_ != nullptr; }
    bool isShown() const { return shown_; }
    State state() const { return state_; }

    Canvas& canvas() { return canvas_; }
    Size clientSize() const { return traits_.clientSize; }
    Size outerSize() const;

    // Loads the window (Form_Load), which sets its size and caption, paints it (Form_Paint) and puts it on
    // the screen. It must not be there yet.
    void show();
    // Closes the window (Form_Unload). It can be shown again.
    void unload();

    // Makes the picture, with the visible controls above it, what is seen of the window, if it is shown.
    void refresh();

    void minimise();

    Scale wantedScale() const { return wantedScale_; }
    // Where the pointer was seen last, and whether that is shown by a ring.
    Point pointer() const;
    bool isRingShown() const { return isRingShown_; }

    // What is to be seen of it, in words.
    Description describe() const;

 protected:
    MessageLoop& loop() { return loop_; }
    void setCaption(std::string caption) { traits_.caption = std::move(caption); }  // UTF-8
    void setClientSize(Size size) { traits_.clientSize = size; }
    void setPosition(Point position) { traits_.position = position; }
    void setBorderless() { traits_.borderless = true; }
    // The picture that it is first seen with is painted at scale 1, which is quicker, and another follows at
    // once.
    void showPlainFirst() { isPlainFirst_ = true; }
    void addControl(Control& control) { controls_.push_back(&control); }
    // The control that the keyboard goes to; null for the window itself.
    void setFocus(Control* control);

    // What is shown, by a window that has several screens; Windows-1252.
    virtual std::string screenName() const;
    // Whether the picture has something there that is to be clicked: the pointer is a hand above it.
    virtual bool isClickable(float /*x*/, float /*y*/) const { return false; }
    // What its picture shows, controls left out.
    virtual std::vector<Place> places() const { return {}; }
    virtual void Form_Load() {}
    // Paints all that is to be seen, as the window's state has it, on a canvas that is new: when it is shown,
    // and when its scale has changed.
    virtual void Form_Paint() {}
    // The user wants the window to close; this unloads it.
    virtual Task<> Form_QueryUnload();
    virtual void Form_Unload() {}
    // The window was minimised or restored.
    virtual void Form_Resize() {}
    virtual Task<> Form_MouseDown(float x, float y);
    virtual Task<> Form_MouseMove(float x, float y);
    virtual Task<> Form_KeyPress(std::int16_t key);

 private:
    friend class MessageLoop;
    Task<> handle(InputEvent event);
    void changeState(State state);
    void paintAtWantedScale();
    Control* controlAt(Point at) const;
    Task<> pressMouse(InputEvent event);
    Task<> moveMouse(InputEvent event);
    Task<> releaseMouse(InputEvent event);
    Task<> pressControl(Control& control, InputEvent event);
    Task<> pressKey(std::int16_t key);
    void dragControl(Point at);
    void editText(const InputEvent& event);
    void focusNext();
    bool isForPointer(EditCommand command) const;
    Task<> steerPointer(EditCommand command);
    std::optional<Rect> choosePlace(EditCommand command);
    std::vector<Place> placesInSight() const;
    std::vector<Rect> placesInReach() const;
    std::optional<Rect> ringedPlace() const;
    void hideRing();
    void tellWhereTextIsTyped();
    void tellPointer();

    MessageLoop& loop_;
    Window* owner_;
    WindowId id_ = WindowId::none;
    NativeWindow traits_;
    Canvas canvas_;
    Scale wantedScale_;
    bool isPlainFirst_ = false;
    Canvas composed_;
    std::vector<Control*> controls_;
    Control* focus_ = nullptr;
    Control* pressed_ = nullptr;  // the control on which the mouse button went down
    float pointerX_ = -1;         // where the pointer was seen last
    float pointerY_ = -1;
    Point mouse_{-1, -1};       // where the mouse itself was seen last
    bool isRingShown_ = false;  // the arrow keys have moved the pointer last
    Point goal_;                // of their steps
    PointerShape pointer_ = PointerShape::Arrow;
    int handlersRunning_ = 0;
    bool shown_ = false;
    State state_ = State::Normal;
};

}  // namespace quabble
