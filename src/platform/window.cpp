#include "platform/window.hpp"

#include <algorithm>
#include <cmath>
#include <ranges>

namespace quabble {

Window::Window(MessageLoop& loop, Window* owner) : loop_(loop), owner_(owner) {
    loop_.windows_.push_back(this);
}

Window::~Window() {
    if (shown_)
        loop_.frontEnd().closeWindow(id_);
    std::erase(loop_.windows_, this);
}

Size Window::outerSize() const {
    return {clientSize().width + nominalFrame.width, clientSize().height + nominalFrame.height};
}

void Window::setClientSize(Size size) {
    traits_.clientSize = size;
    canvas_.picture = Surface(size.width, size.height);
}

void Window::show() {
    shown_ = true;
    state_ = State::Normal;
    id_ = static_cast<WindowId>(++loop_.lastWindowId_);
    Form_Load();
    traits_.owner = owner_ == nullptr ? WindowId::none : owner_->id_;
    loop_.frontEnd().createWindow(id_, traits_);
    refresh();
}

void Window::unload() {
    if (!shown_)
        return;
    shown_ = false;
    Form_Unload();
    loop_.frontEnd().closeWindow(id_);
}

void Window::refresh() {
    const bool covered =
        std::ranges::any_of(controls_, [](const Control* control) { return control->visible; });
    if (!covered) {
        loop_.frontEnd().showPixels(id_, canvas_.picture);
        return;
    }
    composed_ = canvas_.picture;
    for (const Control* control : controls_) {
        if (control->visible)
            control->paint(composed_);
    }
    loop_.frontEnd().showPixels(id_, composed_);
}

void Window::minimise() {
    loop_.frontEnd().minimiseWindow(id_);
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

Task<> Window::handle(InputEvent event) {
    switch (event.kind) {
        case EventKind::MouseDown:
            if (Control* control = controlAt(event.x, event.y))
                co_await control->mouseDown();
            else
                co_await Form_MouseDown(event.x, event.y);
            break;
        case EventKind::MouseMove:
            if (controlAt(event.x, event.y) == nullptr)
                co_await Form_MouseMove(event.x, event.y);
            break;
        case EventKind::KeyPress:
            co_await Form_KeyPress(event.key);
            break;
        case EventKind::CloseButton:
            unload();
            break;
        case EventKind::Minimised:
            changeState(State::Minimised);
            break;
        case EventKind::Restored:
            changeState(State::Normal);
            break;
    }
}

void Window::changeState(State state) {
    if (state == state_)
        return;
    state_ = state;
    Form_Resize();
}

Control* Window::controlAt(float x, float y) const {
    const auto column = static_cast<std::int32_t>(std::floor(x));
    const auto row = static_cast<std::int32_t>(std::floor(y));
    const auto found = std::ranges::find_if(controls_ | std::views::reverse, [&](const Control* control) {
        return control->visible && control->area.contains(column, row);
    });
    return found == controls_.rend() ? nullptr : *found;
}

}  // namespace quabble
