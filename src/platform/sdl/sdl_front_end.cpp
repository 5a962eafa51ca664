#include "platform/sdl/sdl_front_end.hpp"

#include <SDL2/SDL.h>

#include <algorithm>
#include <csignal>
#include <cstring>
#include <filesystem>

#include "platform/sdl/detached_process.hpp"
#include "platform/sdl/sdl_events.hpp"

namespace quabble {
namespace {

// The terminal's end asks the process to end like any other request; SDL turns SIGTERM into an event.
extern "C" void passOnHangUp(int) {
    std::raise(SIGTERM);
}

}  // namespace

// A window of the desktop and the picture it shows.
class SdlFrontEnd::DesktopWindow {
 public:
    DesktopWindow(const NativeWindow& traits, Point position, const DesktopWindow* owner) {
        const bool isDialog = owner != nullptr;
        SDL_SetHint(SDL_HINT_X11_WINDOW_TYPE, isDialog ? "_NET_WM_WINDOW_TYPE_DIALOG" : "");
        const Uint32 flags = SDL_WINDOW_HIDDEN | (isDialog ? Uint32{SDL_WINDOW_SKIP_TASKBAR} : 0U) |
                             (traits.borderless ? Uint32{SDL_WINDOW_BORDERLESS} : 0U);
        window_.reset(SDL_CreateWindow(traits.caption.c_str(), position.x, position.y,
                                       traits.clientSize.width, traits.clientSize.height, flags));
        if (isDialog && window_)
            SDL_SetWindowModalFor(sdl(), owner->sdl());
    }

    SDL_Window* sdl() const { return window_.get(); }

    // The first picture brings the window onto the screen.
    void show(const Surface& picture) {
        picture_ = picture;
        if (window_ && (SDL_GetWindowFlags(sdl()) & SDL_WINDOW_HIDDEN) != 0)
            SDL_ShowWindow(sdl());
        showAgain();
    }

    // A window that was uncovered, restored or resized gets its picture again.
    void showAgain() {
        SDL_Surface* screen = window_ ? SDL_GetWindowSurface(sdl()) : nullptr;
        if (screen == nullptr)
            return;
        const bool direct = screen->format->BytesPerPixel == 4 && screen->format->Rmask == 0xFF0000 &&
                            screen->format->Gmask == 0xFF00 && screen->format->Bmask == 0xFF;
        if (direct)
            copyTo(*screen);
        else
            convertTo(*screen);
        SDL_UpdateWindowSurface(sdl());
    }

 private:
    void copyTo(SDL_Surface& screen) const {
        const auto width = static_cast<std::size_t>(std::min(screen.w, picture_.width()));
        for (std::int32_t y = 0; y < std::min(screen.h, picture_.height()); ++y) {
            auto* line = static_cast<std::byte*>(screen.pixels) + std::ptrdiff_t{y} * screen.pitch;
            std::memcpy(line, picture_.row(y).data(), width * sizeof(std::uint32_t));
        }
    }

    void convertTo(SDL_Surface& screen) {
        if (picture_.isEmpty())
            return;
        SDL_Surface* source = SDL_CreateRGBSurfaceWithFormatFrom(
            picture_.row(0).data(), picture_.width(), picture_.height(), 32,
            picture_.width() * static_cast<int>(sizeof(std::uint32_t)), SDL_PIXELFORMAT_RGB888);
        if (source == nullptr)
            return;
        SDL_BlitSurface(source, nullptr, &screen, nullptr);
        SDL_FreeSurface(source);
    }

    struct Destroy {
        void operator()(SDL_Window* window) const { SDL_DestroyWindow(window); }
    };
    std::unique_ptr<SDL_Window, Destroy> window_;
    Surface picture_;
};

std::unique_ptr<SdlFrontEnd> SdlFrontEnd::open(std::string& problem) {
    // A window surface drawn by the processor opens at once; by way of OpenGL it takes many times as long.
    SDL_SetHint(SDL_HINT_FRAMEBUFFER_ACCELERATION, "0");
    SDL_SetHint(SDL_HINT_QUIT_ON_LAST_WINDOW_CLOSE, "0");
    SDL_SetHint(SDL_HINT_VIDEO_X11_NET_WM_BYPASS_COMPOSITOR, "0");
    SDL_SetHint(SDL_HINT_MOUSE_FOCUS_CLICKTHROUGH, "1");
    SDL_SetHint(SDL_HINT_APP_NAME, "quabble");
    SDL_SetHint("SDL_VIDEO_X11_WMCLASS", "quabble");
    if (SDL_Init(SDL_INIT_VIDEO) != 0) {
        problem = SDL_GetError();
        return nullptr;
    }
    SDL_EnableScreenSaver();
    SDL_StopTextInput();
    std::signal(SIGHUP, passOnHangUp);
    return std::unique_ptr<SdlFrontEnd>(new SdlFrontEnd);
}

SdlFrontEnd::~SdlFrontEnd() {
    windows_.clear();
    icon_.reset();
    SDL_Quit();
}

void SdlFrontEnd::run(MessageLoop& loop) {
    loop.wake();
    while (!loop.ended()) {
        waitForEvents(loop);
        loop.wake();
    }
}

// Blocks until something has happened or the program's wait is over, then posts all that has happened.
void SdlFrontEnd::waitForEvents(MessageLoop& loop) {
    if (SDL_PollEvent(nullptr) == 0)
        desktopWait_.sleep(windows_.empty() ? nullptr : windows_.begin()->second->sdl(), timeLeft(loop));
    SDL_Event event;
    while (SDL_PollEvent(&event) != 0) {
        if (event.type == SDL_QUIT) {
            loop.requestEnd();
            return;
        }
        take(event, loop);
    }
}

std::optional<milliseconds> SdlFrontEnd::timeLeft(const MessageLoop& loop) {
    const auto deadline = loop.nextDeadline();
    if (!deadline)
        return std::nullopt;
    return std::max(std::chrono::ceil<milliseconds>(*deadline - now()), milliseconds::zero());
}

void SdlFrontEnd::take(const SDL_Event& event, MessageLoop& loop) {
    const WindowId window = idOf(windowOf(event));
    if (event.type == SDL_WINDOWEVENT && (event.window.event == SDL_WINDOWEVENT_EXPOSED ||
                                          event.window.event == SDL_WINDOWEVENT_SIZE_CHANGED)) {
        if (DesktopWindow* shown = find(window))
            shown->showAgain();
    }
    auto input = translate(event);
    if (!isMeantForItsWindow(event) || !input)
        return;
    input->window = window;
    loop.post(*input);
}

// False for what a key does that has been held down since another window had the focus.
bool SdlFrontEnd::isMeantForItsWindow(const SDL_Event& event) {
    switch (event.type) {
        case SDL_KEYDOWN:
            textIsMeant_ =
                heldKeys_.isMeantFor(event.key.windowID, event.key.keysym.scancode, event.key.timestamp);
            return textIsMeant_;
        case SDL_KEYUP:
            heldKeys_.release(event.key.keysym.scancode);
            return true;
        case SDL_TEXTINPUT:
            return textIsMeant_;
        default:
            return true;
    }
}

void SdlFrontEnd::createWindow(WindowId window, const NativeWindow& traits) {
    auto made = std::make_unique<DesktopWindow>(traits, placeOf(traits), find(traits.owner));
    if (icon_ && made->sdl() != nullptr)
        SDL_SetWindowIcon(made->sdl(), icon_.get());
    windows_[window] = std::move(made);
}

Point SdlFrontEnd::placeOf(const NativeWindow& traits) {
    if (traits.position)
        return *traits.position;
    const DesktopWindow* owner = find(traits.owner);
    if (owner == nullptr)
        return {static_cast<std::int32_t>(SDL_WINDOWPOS_CENTERED),
                static_cast<std::int32_t>(SDL_WINDOWPOS_CENTERED)};
    Rect area;
    SDL_GetWindowPosition(owner->sdl(), &area.left, &area.top);
    SDL_GetWindowSize(owner->sdl(), &area.right, &area.bottom);
    return {area.left + (area.right - traits.clientSize.width) / 2,
            area.top + (area.bottom - traits.clientSize.height) / 2};
}

void SdlFrontEnd::showPixels(WindowId window, const Surface& picture) {
    if (DesktopWindow* shown = find(window))
        shown->show(picture);
}

void SdlFrontEnd::closeWindow(WindowId window) {
    windows_.erase(window);
}

void SdlFrontEnd::minimiseWindow(WindowId window) {
    if (const DesktopWindow* shown = find(window))
        SDL_MinimizeWindow(shown->sdl());
}

void SdlFrontEnd::setIcon(const Icon& icon) {
    SDL_Surface* borrowed =
        SDL_CreateRGBSurfaceWithFormatFrom(const_cast<unsigned char*>(icon.rgba.data()), icon.size.width,
                                           icon.size.height, 32, icon.size.width * 4, SDL_PIXELFORMAT_RGBA32);
    icon_.reset(borrowed);
}

void SdlFrontEnd::showMessageBox(const std::string& title, const std::string& text) {
    SDL_ShowSimpleMessageBox(SDL_MESSAGEBOX_ERROR, title.c_str(), text.c_str(), nullptr);
}

void SdlFrontEnd::openDocument(const std::string& document, const std::string& folder) {
    startDetached({"xdg-open", document}, folder);
}

void SdlFrontEnd::setTextInput(WindowId, std::optional<Rect> area) {
    if (!area) {
        SDL_StopTextInput();
        return;
    }
    SDL_Rect place{area->left, area->top, area->width(), area->height()};
    SDL_SetTextInputRect(&place);
    SDL_StartTextInput();
}

std::string SdlFrontEnd::clipboardText() {
    char* text = SDL_GetClipboardText();
    std::string copy = text == nullptr ? "" : text;
    SDL_free(text);
    return copy;
}

void SdlFrontEnd::setClipboardText(const std::string& text) {
    SDL_SetClipboardText(text.c_str());
}

void SdlFrontEnd::FreeSurface::operator()(SDL_Surface* surface) const {
    SDL_FreeSurface(surface);
}

Size SdlFrontEnd::screenSize() {
    SDL_Rect bounds{};
    SDL_GetDisplayBounds(0, &bounds);
    return {bounds.w, bounds.h};
}

std::string SdlFrontEnd::executableFolder() {
    std::error_code unknown;
    return std::filesystem::read_symlink("/proc/self/exe", unknown).parent_path().string();
}

SdlFrontEnd::DesktopWindow* SdlFrontEnd::find(WindowId window) {
    const auto found = windows_.find(window);
    return found == windows_.end() ? nullptr : found->second.get();
}

WindowId SdlFrontEnd::idOf(std::uint32_t sdlWindow) const {
    const auto found = std::ranges::find_if(windows_, [&](const auto& window) {
        return window.second->sdl() != nullptr && SDL_GetWindowID(window.second->sdl()) == sdlWindow;
    });
    return found == windows_.end() ? WindowId::none : found->first;
}

}  // namespace quabble
