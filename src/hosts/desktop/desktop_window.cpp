#include "hosts/desktop/desktop_window.hpp"

#include <SDL2/SDL.h>

#include <algorithm>
#include <utility>
#include <vector>

#include "base/round_half_even.hpp"
#include "hosts/desktop/x11/icon.hpp"
#include "hosts/desktop/x11/refused_drops.hpp"
#include "hosts/desktop/x11/x11_window.hpp"
#include "platform/window.hpp"

namespace quabble {
namespace {

constexpr double plainDotsPerInch = 96;

Rect workArea() {
    SDL_Rect area{};
    SDL_GetDisplayUsableBounds(0, &area);
    return Rect::ofSize(area.x, area.y, area.w, area.h);
}

}  // namespace

DesktopWindow::DesktopWindow(const NativeWindow& traits, const DesktopWindow* owner)
    : traits_(traits), owner_(owner) {
    const bool isDialog = owner != nullptr;
    SDL_SetHint(SDL_HINT_X11_WINDOW_TYPE, isDialog ? "_NET_WM_WINDOW_TYPE_DIALOG" : "");
    const Uint32 flags = SDL_WINDOW_HIDDEN | SDL_WINDOW_ALLOW_HIGHDPI |
                         (isDialog ? Uint32{SDL_WINDOW_SKIP_TASKBAR} : 0U) |
                         (traits.borderless ? Uint32{SDL_WINDOW_BORDERLESS} : 0U);
    window_.reset(SDL_CreateWindow(traits.caption.c_str(), 0, 0, traits.clientSize.width,
                                   traits.clientSize.height, flags));
    if (!window_)
        return;
    setFactor(wantedFactor());
    const Size size = sizeAtScale();
    if (size != traits.clientSize)
        SDL_SetWindowSize(sdl(), size.width, size.height);
    moveTo(wantedPosition());
    if (isDialog)
        SDL_SetWindowModalFor(sdl(), owner->sdl());
    if (const auto x11 = X11Window::of(sdl())) {
        refuseDrops(*x11);
        if (isDialog) {
            x11->haveOnlyCloseButton();
            x11->beModal();
        }
        shared_ = SharedPicture::of(*x11, size);
    }
}

// SDL hides a window first and waits until the server says so. What the server refuses then must be heard
// before SDL quits, for errors end the process after that.
DesktopWindow::~DesktopWindow() {
    const auto x11 = X11Window::of(sdl());
    if (!isLost_ || !x11)
        return;
    x11->reportHidden();
    window_.reset();
    x11->waitForServer();
}

// Where the desktop scales windows by itself, on Wayland, it says so by the pixels that a window has.
double DesktopWindow::wantedFactor() const {
    if (owner_ != nullptr)
        return owner_->factor_;
    const auto x11 = X11Window::of(sdl());
    if (!x11) {
        Size pixels;
        SDL_GetWindowSizeInPixels(sdl(), &pixels.width, &pixels.height);
        return std::max(1.0, static_cast<double>(pixels.width) / size().width);
    }
    const Rect area = workArea();
    const Size frame = traits_.borderless ? Size{} : Window::nominalFrame;
    return scaleFor(x11->dotsPerInch().value_or(plainDotsPerInch), traits_.clientSize,
                    {area.width() - frame.width, area.height() - frame.height});
}

// Before the window is shown SDL would wait ten milliseconds for the answer that it has moved.
void DesktopWindow::moveTo(Point corner) const {
    const auto x11 = X11Window::of(sdl());
    if (x11 && !isOpened_)
        x11->moveTo(corner);
    else
        SDL_SetWindowPosition(sdl(), corner.x, corner.y);
}

void DesktopWindow::setFactor(double factor) {
    factor_ = factor;
    scale_ = Scale::nearest(factor);
}

// In the desktop's coordinates.
Size DesktopWindow::sizeAtScale() const {
    if (!X11Window::of(sdl()))
        return traits_.clientSize;
    return factor_ < 1 ? scaled(traits_.clientSize, factor_) : scale_.device(traits_.clientSize);
}

// The middle of the window's upper edge stays where it is.
bool DesktopWindow::followScale() {
    const double factor = window_ ? wantedFactor() : factor_;
    if (factor == factor_)
        return false;
    const Size before = size();
    setFactor(factor);
    const Size now = sizeAtScale();
    if (now == before)
        return true;
    Point corner;
    SDL_GetWindowPosition(sdl(), &corner.x, &corner.y);
    SDL_SetWindowSize(sdl(), now.width, now.height);
    moveTo({std::max(corner.x + (before.width - now.width) / 2, workArea().left), corner.y});
    return true;
}

// A place that the program asks for is meant for an unscaled window: the middle of its upper edge stays.
Point DesktopWindow::wantedPosition() const {
    const Size own = size();
    if (traits_.position) {
        SDL_Rect screen{};
        SDL_GetDisplayBounds(0, &screen);
        const std::int32_t left = screen.x + traits_.position->x + (traits_.clientSize.width - own.width) / 2;
        return {std::max(left, workArea().left), screen.y + traits_.position->y};
    }
    if (owner_ == nullptr) {
        SDL_Rect screen{};
        SDL_GetDisplayBounds(0, &screen);
        return {screen.x + (screen.w - own.width) / 2, screen.y + (screen.h - own.height) / 2};
    }
    Point corner;
    SDL_GetWindowPosition(owner_->sdl(), &corner.x, &corner.y);
    const Size around = owner_->size();
    return {corner.x + (around.width - own.width) / 2, corner.y + (around.height - own.height) / 2};
}

std::uint32_t DesktopWindow::sdlId() const {
    return window_ ? SDL_GetWindowID(sdl()) : 0;
}

void DesktopWindow::show(const Surface& picture) {
    picture_ = &picture;
    if (!window_)
        return;
    if (shared_)
        shared_->show(picture, magnifierFor(picture, shared_->size()));
    if (!std::exchange(isOpened_, true)) {
        if (!shared_)
            SDL_GetWindowSurface(sdl());  // for which SDL makes a Wayland window anew; that is not to be seen
        SDL_ShowWindow(sdl());
        if (const auto x11 = X11Window::of(sdl())) {  // what takes a while and need not be there before
            x11->setIcons(applicationIcons());
            x11->listenToResources();
        }
    }
    if (shared_)
        return;
    if (SDL_Surface* screen = SDL_GetWindowSurface(sdl()))
        fill(*screen, picture);
    SDL_UpdateWindowSurface(sdl());
}

// A shared picture is shown again by the server as long as the window keeps its size, and SDL's window
// surface has kept the picture.
void DesktopWindow::showAgain() {
    if (picture_ == nullptr || (shared_ && shared_->size() == size()))
        return;
    if (const auto x11 = X11Window::of(sdl()); x11 && shared_)
        shared_ = SharedPicture::of(*x11, size());
    else if (SDL_UpdateWindowSurface(sdl()) == 0)
        return;
    show(*picture_);
}

Magnifier& DesktopWindow::magnifierFor(const Surface& picture, Size shown) {
    const Size own{picture.width(), picture.height()};
    if (magnifier_.shownSize() != shown || magnifier_.pictureSize() != own)
        magnifier_ = Magnifier(own, shown);
    return magnifier_;
}

void DesktopWindow::fill(SDL_Surface& screen, const Surface& picture) {
    const Size shown{screen.w, screen.h};
    Magnifier& magnifier = magnifierFor(picture, shown);
    const bool isOfOurFormat = screen.format->BytesPerPixel == 4 && screen.format->Rmask == 0xFF0000 &&
                               screen.format->Gmask == 0xFF00 && screen.format->Bmask == 0xFF;
    if (isOfOurFormat) {
        magnifier.show(picture, static_cast<std::uint32_t*>(screen.pixels), screen.pitch);
        return;
    }
    Surface whole(shown.width, shown.height);
    const int stride = shown.width * static_cast<int>(sizeof(std::uint32_t));
    magnifier.show(picture, whole.row(0).data(), stride);
    SDL_Surface* source = SDL_CreateRGBSurfaceWithFormatFrom(whole.row(0).data(), shown.width, shown.height,
                                                             32, stride, SDL_PIXELFORMAT_RGB888);
    SDL_BlitSurface(source, nullptr, &screen, nullptr);
    SDL_FreeSurface(source);
}

// On Wayland one can only ask for it.
void DesktopWindow::takeKeyboard() const {
    if (SDL_SetWindowInputFocus(sdl()) != 0)
        SDL_RaiseWindow(sdl());
}

Point DesktopWindow::programPixel(Point place) const {
    return scale_.pixelAt(pixelSeenAt(place, size(), scale_.device(traits_.clientSize)));
}

Rect DesktopWindow::placeOf(const Rect& programPixels) const {
    const Size own = size();
    const auto across = [&](std::int32_t x) { return x * own.width / traits_.clientSize.width; };
    const auto down = [&](std::int32_t y) { return y * own.height / traits_.clientSize.height; };
    return {across(programPixels.left), down(programPixels.top), across(programPixels.right),
            down(programPixels.bottom)};
}

Size DesktopWindow::size() const {
    Size size = traits_.clientSize;
    SDL_GetWindowSize(sdl(), &size.width, &size.height);
    return size;
}

void DesktopWindow::Destroy::operator()(SDL_Window* window) const {
    SDL_DestroyWindow(window);
}

}  // namespace quabble
