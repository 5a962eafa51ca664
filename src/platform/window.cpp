#include "platform/window.hpp"

#include <algorithm>
#include <cassert>
#include <cmath>
#include <ranges>
#include <utility>

namespace quabble {
namespace {

// Counts a handler for as long as it runs.
class HandlerCount {
 public:
    explicit HandlerCount(int& running) : running_(running) { ++running_; }
    ~HandlerCount() { --running_; }
    HandlerCount(const HandlerCount&) = delete;
    HandlerCount& operator=(const HandlerCount&) = delete;

 private:
    int& running_;
};

}  // namespace

Window::Window(MessageLoop& loop, Window* owner) : loop_(loop), owner_(owner) {
    loop_.windows_.push_back(this);
}

Window::~Window() {
    assert(handlersRunning_ == 0);
    if (shown_)
        loop_.frontEnd().closeWindow(id_);
    std::erase(loop_.windows_, this);
}

Size Window::outerSize() const {
    return {clientSize().width + nominalFrame.width, clientSize().height + nominalFrame.height};
}

void Window::show() {
    assert(!shown_);
    state_ = State::Normal;
    focus_ = nullptr;
    pressed_ = nullptr;
    pointerX_ = pointerY_ = -1;
    pointer_ = PointerShape::Arrow;
    id_ = static_cast<WindowId>(++loop_.lastWindowId_);
    Form_Load();
    traits_.owner = owner_ == nullptr ? WindowId::none : owner_->id_;
    wantedScale_ = loop_.frontEnd().createWindow(id_, traits_);
    shown_ = true;
    canvas_ = Canvas(traits_.clientSize, isPlainFirst_ ? Scale() : wantedScale_);
    Form_Paint();
    tellWhereTextIsTyped();
    refresh();
}

void Window::unload() {
    if (!shown_)
        return;
    shown_ = false;
    Form_Unload();
    loop_.frontEnd().setTextInput(id_, std::nullopt);
    loop_.frontEnd().closeWindow(id_);
}

void Window::refresh() {
    if (!shown_)
        return;
    tellPointer();
    const bool covered =
        std::ranges::any_of(controls_, [](const Control* control) { return control->visible; });
    if (!covered) {
        loop_.frontEnd().showPixels(id_, canvas_.picture());
        return;
    }
    composed_ = canvas_;
    for (const Control* control : controls_) {
        if (control->visible)
            control->paint(composed_, control == focus_);
    }
    loop_.frontEnd().showPixels(id_, composed_.picture());
}

void Window::minimise() {
    if (shown_)
        loop_.frontEnd().minimiseWindow(id_);
}

Task<> Window::Form_QueryUnload() {
    unload();
    co_return;
}
Task<> Window::Form_MouseDown(float, float) {
    co_return;
}
Task<> Window::Form_MouseMove(float, float) {
    co_return;
}
Task<> Window::Form_KeyPress(std::int16_t) {
    co_return;
}

void Window::setFocus(Control* control) {
    focus_ = control;
    if (shown_)
        tellWhereTextIsTyped();
}

void Window::tellWhereTextIsTyped() {
    const bool takesText = focus_ != nullptr && focus_->takesText();
    loop_.frontEnd().setTextInput(id_, takesText ? std::optional(focus_->area) : std::nullopt);
}

// What is below a dialog cannot be clicked.
void Window::tellPointer() {
    const Point at{static_cast<std::int32_t>(std::floor(pointerX_)),
                   static_cast<std::int32_t>(std::floor(pointerY_))};
    const Control* control = controlAt(at);
    const bool takesInput = loop_.modalWindow() == nullptr || loop_.modalWindow() == this;
    const bool isHand =
        takesInput && (control == nullptr ? isClickable(pointerX_, pointerY_) : control->isClickable());
    const PointerShape shape = isHand ? PointerShape::Hand : PointerShape::Arrow;
    if (shape != std::exchange(pointer_, shape))
        loop_.frontEnd().setPointer(id_, shape);
}

Task<> Window::handle(InputEvent event) {
    const HandlerCount count(handlersRunning_);
    const Point at{static_cast<std::int32_t>(std::floor(event.x)),
                   static_cast<std::int32_t>(std::floor(event.y))};
    switch (event.kind) {
        case EventKind::MouseDown:
            if (Control* control = controlAt(at))
                co_await pressControl(*control, event);
            else
                co_await Form_MouseDown(event.x, event.y);
            break;
        case EventKind::MouseMove:
            pointerX_ = event.x;
            pointerY_ = event.y;
            tellPointer();
            if (pressed_ != nullptr)
                dragControl(at);
            else if (controlAt(at) == nullptr)
                co_await Form_MouseMove(event.x, event.y);
            break;
        case EventKind::MouseUp:
            if (Control* control = std::exchange(pressed_, nullptr)) {
                co_await control->mouseUp(at);
                refresh();
            }
            break;
        case EventKind::KeyPress:
            co_await pressKey(event.key);
            break;
        case EventKind::TextInput:
        case EventKind::Edit:
            editText(event);
            break;
        case EventKind::CloseButton:
            co_await Form_QueryUnload();
            break;
        case EventKind::Minimised:
            changeState(State::Minimised);
            break;
        case EventKind::Restored:
            changeState(State::Normal);
            break;
        case EventKind::Rescaled:
            wantedScale_ = event.scale;
            break;
    }
}

Task<> Window::pressControl(Control& control, InputEvent event) {
    if (control.takesFocus()) {
        pressed_ = &control;
        setFocus(&control);
    }
    const Point at{static_cast<std::int32_t>(std::floor(event.x)),
                   static_cast<std::int32_t>(std::floor(event.y))};
    co_await control.mouseDown(at, event.extends);
    refresh();
}

void Window::dragControl(Point at) {
    pressed_->mouseDrag(at);
    refresh();
}

Task<> Window::pressKey(std::int16_t key) {
    if (focus_ != nullptr && key == keys::tab) {
        focusNext();
        refresh();
    } else if (focus_ != nullptr && focus_->takesText() && key == keys::backspace) {
        focus_->edit(EditCommand::Backspace, false);
        refresh();
    } else if (focus_ != nullptr && focus_->takesKey(key)) {
        co_await focus_->keyPress(key);
    } else {
        co_await Form_KeyPress(key);
    }
}

void Window::editText(const InputEvent& event) {
    if (focus_ == nullptr)
        return;
    if (event.kind == EventKind::TextInput)
        focus_->textInput(event.text);
    else
        focus_->edit(event.command, event.extends);
    refresh();
}

void Window::focusNext() {
    const auto takesFocus = [](const Control* control) { return control->visible && control->takesFocus(); };
    const auto current = std::ranges::find(controls_, focus_);
    auto next = std::find_if(current + 1, controls_.end(), takesFocus);
    if (next == controls_.end())
        next = std::ranges::find_if(controls_, takesFocus);
    setFocus(*next);
}

void Window::paintAtWantedScale() {
    if (canvas_.scale() == wantedScale_)
        return;
    canvas_ = Canvas(traits_.clientSize, wantedScale_);
    Form_Paint();
    refresh();
}

void Window::changeState(State state) {
    if (state == state_)
        return;
    state_ = state;
    Form_Resize();
}

Control* Window::controlAt(Point at) const {
    const auto found = std::ranges::find_if(controls_ | std::views::reverse, [&](const Control* control) {
        return control->visible && control->area.contains(at.x, at.y);
    });
    return found == controls_.rend() ? nullptr : *found;
}

}  // namespace quabble
