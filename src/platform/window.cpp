#include "platform/window.hpp"

#include <algorithm>
#include <cassert>
#include <cmath>
#include <ranges>
#include <utility>

#include "draw/windows_1252.hpp"
#include "platform/places.hpp"

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

Point pixelAt(float x, float y) {
    return {static_cast<std::int32_t>(std::floor(x)), static_cast<std::int32_t>(std::floor(y))};
}
Point pixelOf(const InputEvent& event) {
    return pixelAt(event.x, event.y);
}

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
    mouse_ = {-1, -1};
    isRingShown_ = false;
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
    const std::optional<Rect> ringed = ringedPlace();
    const bool covered =
        std::ranges::any_of(controls_, [](const Control* control) { return control->visible; });
    ++loop_.picturesShown_;
    if (!covered && !ringed) {
        loop_.frontEnd().showPixels(id_, canvas_.picture());
        return;
    }
    composed_ = canvas_;
    for (const Control* control : controls_) {
        if (control->visible)
            control->paint(composed_, control == focus_);
    }
    if (ringed)
        paintPointerRing(composed_, *ringed);
    loop_.frontEnd().showPixels(id_, composed_.picture());
}

void Window::minimise() {
    if (shown_)
        loop_.frontEnd().minimiseWindow(id_);
}

Point Window::pointer() const {
    return pixelAt(pointerX_, pointerY_);
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
    const Control* control = controlAt(pointer());
    const bool takesInput = loop_.modalWindow() == nullptr || loop_.modalWindow() == this;
    const bool isHand =
        takesInput && (control == nullptr ? isClickable(pointerX_, pointerY_) : control->isClickable());
    const PointerShape shape = isHand ? PointerShape::Hand : PointerShape::Arrow;
    if (shape != std::exchange(pointer_, shape))
        loop_.frontEnd().setPointer(id_, shape);
}

Task<> Window::handle(InputEvent event) {
    const HandlerCount count(handlersRunning_);
    switch (event.kind) {
        case EventKind::MouseDown:
            hideRing();
            co_await pressMouse(event);
            break;
        case EventKind::MouseMove:
            // Desktops also tell where the mouse is when something below it has changed.
            if (pixelOf(event) == std::exchange(mouse_, pixelOf(event)) && isRingShown_)
                break;
            hideRing();
            co_await moveMouse(event);
            break;
        case EventKind::MouseUp:
            co_await releaseMouse(event);
            break;
        case EventKind::KeyPress:
            co_await pressKey(event.key);
            break;
        case EventKind::TextInput:
            editText(event);
            break;
        case EventKind::Edit:
            if (isForPointer(event.command))
                co_await steerPointer(event.command);
            else
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

Task<> Window::pressMouse(InputEvent event) {
    if (Control* control = controlAt(pixelOf(event)))
        co_await pressControl(*control, event);
    else
        co_await Form_MouseDown(event.x, event.y);
}

Task<> Window::moveMouse(InputEvent event) {
    pointerX_ = event.x;
    pointerY_ = event.y;
    tellPointer();
    if (pressed_ != nullptr)
        dragControl(pixelOf(event));
    else if (controlAt(pixelOf(event)) == nullptr)
        co_await Form_MouseMove(event.x, event.y);
}

Task<> Window::releaseMouse(InputEvent event) {
    if (Control* control = std::exchange(pressed_, nullptr)) {
        co_await control->mouseUp(pixelOf(event));
        refresh();
    }
}

Task<> Window::pressControl(Control& control, InputEvent event) {
    if (control.takesFocus()) {
        pressed_ = &control;
        setFocus(&control);
    }
    co_await control.mouseDown(pixelOf(event), event.extends);
    refresh();
}

void Window::dragControl(Point at) {
    pressed_->mouseDrag(at);
    refresh();
}

Task<> Window::pressKey(std::int16_t key) {
    if (focus_ != nullptr && key == keys::tab) {
        isRingShown_ = false;
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

bool Window::isForPointer(EditCommand command) const {
    switch (command) {
        case EditCommand::Up:
        case EditCommand::Down:
        case EditCommand::Click:
            return true;
        case EditCommand::Left:
        case EditCommand::Right:
            return focus_ == nullptr || !focus_->takesText();
        default:
            return false;
    }
}

// The keys move the pointer and click as the mouse does; the focus goes with the pointer. A click leaves it
// where it is, so that it is there again when a notice that covered everything has gone.
Task<> Window::steerPointer(EditCommand command) {
    if (state_ == State::Minimised)
        co_return;
    const std::optional<Rect> ringed = ringedPlace();
    const bool clicks = command == EditCommand::Click && (focus_ != nullptr || ringed);
    const std::optional<Rect> place = choosePlace(command);
    if (!place)
        co_return;
    const Point at = clicks && place == ringed ? pointer() : middleOf(*place);
    InputEvent event{.window = id_, .x = static_cast<float>(at.x), .y = static_cast<float>(at.y)};
    Control* control = controlAt(at);
    if (control != nullptr && control->takesFocus())
        setFocus(control);
    isRingShown_ = true;
    co_await moveMouse(event);
    refresh();
    if (!clicks)
        co_return;
    co_await pressMouse(event);
    if (shown_ && id_ == event.window)
        co_await releaseMouse(event);
}

// Where a key brings the pointer. Without a place that is seen to have it, it first comes to the nearest one.
std::optional<Rect> Window::choosePlace(EditCommand command) {
    const std::vector<Rect> places = placesInReach();
    const std::optional<Rect> from = focus_ == nullptr ? ringedPlace() : std::optional(focus_->area);
    if (!from) {
        const std::optional<Rect> first = placeNearestTo(places, pointer());
        if (first)
            goal_ = middleOf(*first);
        return first;
    }
    const bool isSideways = command == EditCommand::Left || command == EditCommand::Right;
    const std::optional<Rect> next =
        command == EditCommand::Click ? from : placeBeside(places, *from, command, goal_);
    if (next)
        (isSideways ? goal_.x : goal_.y) = isSideways ? middleOf(*next).x : middleOf(*next).y;
    return next ? next : from;
}

std::vector<Place> Window::placesInSight() const {
    std::vector<Place> seen = places();
    std::erase_if(seen, [&](const Place& place) { return controlAt(middleOf(place.area)) != nullptr; });
    for (const Control* control : controls_) {
        if (control->visible)
            seen.push_back(control->place());
    }
    return seen;
}

std::vector<Rect> Window::placesInReach() const {
    std::vector<Rect> reached;
    for (const Place& place : placesInSight()) {
        if (place.isReached())
            reached.push_back(place.area);
    }
    return reached;
}

std::optional<Rect> Window::ringedPlace() const {
    if (!isRingShown_)
        return std::nullopt;
    return placeAt(placesInReach(), pointer());
}

std::string Window::screenName() const {
    return windows1252Of(traits_.caption);
}

Description Window::describe() const {
    Description description{.name = screenName(), .places = placesInSight(), .current = {}, .edited = {}};
    const std::optional<Rect> current = focus_ == nullptr ? ringedPlace() : std::optional(focus_->area);
    const auto found = std::ranges::find_if(
        description.places, [&](const Place& place) { return place.isReached() && place.area == current; });
    if (found != description.places.end())
        description.current = static_cast<std::size_t>(found - description.places.begin());
    if (focus_ != nullptr)
        description.edited = focus_->editedText();
    return description;
}

void Window::hideRing() {
    if (std::exchange(isRingShown_, false))
        refresh();
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
