#include "hosts/desktop/sdl_front_end.hpp"

#include <SDL2/SDL.h>

#include <algorithm>
#include <csignal>
#include <cstdio>
#include <cstring>
#include <utility>

#include "hosts/desktop/detached_process.hpp"
#include "hosts/desktop/program_folder.hpp"
#include "hosts/desktop/sdl_events.hpp"
#include "hosts/desktop/x11/x11_window.hpp"

namespace quabble {
namespace {

// The terminal's end asks the process to end like any other request; SDL turns SIGTERM into an event.
extern "C" void passOnHangUp(int) {
    std::raise(SIGTERM);
}

// SDL also has displays that show nothing, and takes what the environment names. Of the pixels it can write
// on, those with a palette or ten bits a colour stay blank.
std::string whyUnusable() {
    const std::string driver = SDL_GetCurrentVideoDriver();
    if (driver != "x11" && driver != "wayland")
        return "\"" + driver + "\" shows nothing";
    SDL_DisplayMode mode{};
    SDL_GetDesktopDisplayMode(0, &mode);
    constexpr int fewestBits = 15;
    const bool hasTenBits = SDL_PIXELLAYOUT(mode.format) == SDL_PACKEDLAYOUT_2101010;
    if (SDL_BITSPERPIXEL(mode.format) < fewestBits || hasTenBits)
        return std::string("its colours cannot be drawn: ") + SDL_GetPixelFormatName(mode.format);
    return {};
}

void end(Program& program) {
    if (!program.requestEnd())
        std::fputs("Quabble could not save its settings and high scores.\n", stderr);
}

}  // namespace

std::unique_ptr<SdlFrontEnd> SdlFrontEnd::open(std::string& problem) {
    SDL_SetHint(SDL_HINT_QUIT_ON_LAST_WINDOW_CLOSE, "0");
    SDL_SetHint(SDL_HINT_VIDEO_X11_NET_WM_BYPASS_COMPOSITOR, "0");
    SDL_SetHint(SDL_HINT_MOUSE_FOCUS_CLICKTHROUGH, "1");
    SDL_SetHint(SDL_HINT_APP_NAME, "quabble");
    // Where Wayland leaves frames to the programs, SDL 2.26 with libdecor dies of events for windows that are
    // closed.
    SDL_version version{};
    SDL_GetVersion(&version);
    if (version.major == 2 && version.minor < 28)
        SDL_SetHint(SDL_HINT_VIDEO_WAYLAND_ALLOW_LIBDECOR, "0");
    SDL_SetHint("SDL_VIDEO_X11_WMCLASS", "quabble");
    SDL_SetHint(SDL_HINT_VIDEODRIVER, "x11,wayland");
    if (SDL_Init(SDL_INIT_VIDEO) != 0) {
        problem = SDL_GetError();
        return nullptr;
    }
    problem = whyUnusable();
    if (!problem.empty()) {
        SDL_Quit();
        return nullptr;
    }
    // On X11 a window surface drawn by the processor opens at once; by way of OpenGL it takes many times as
    // long. Wayland has no other way.
    if (std::strcmp(SDL_GetCurrentVideoDriver(), "x11") == 0)
        SDL_SetHint(SDL_HINT_FRAMEBUFFER_ACCELERATION, "0");
    X11Window::outliveErrors();
    listenToX11();
    SDL_EnableScreenSaver();
    SDL_StopTextInput();
    if (std::signal(SIGHUP, passOnHangUp) == SIG_IGN)
        std::signal(SIGHUP, SIG_IGN);  // as nohup wishes
    return std::unique_ptr<SdlFrontEnd>(new SdlFrontEnd);
}

SdlFrontEnd::~SdlFrontEnd() {
    windows_.clear();
    SDL_Quit();
}

void SdlFrontEnd::run(Program& program, const VisitFile& record) {
    program.start();
    // The program then ends as it would when asked to, but has no windows any more to close.
    X11Window::whenServerGoes([this, &program] {
        static decltype(windows_) abandoned;
        abandoned.swap(windows_);
        end(program);
    });
    while (!program.ended()) {
        waitForEvents(program);
        record.writeIfAsked();
        program.wake();
    }
    X11Window::whenServerGoes([] {});
}

// Blocks until something has happened or the program's wait is over, then posts all that has happened.
void SdlFrontEnd::waitForEvents(Program& program) {
    for (const WindowId window : std::exchange(unopened_, {}))
        program.post({.window = window, .kind = EventKind::CloseButton});
    if (SDL_PollEvent(nullptr) == 0)
        desktopWait_.sleep(windows_.empty() ? nullptr : windows_.begin()->second->sdl(), timeLeft(program));
    SDL_Event event;
    while (SDL_PollEvent(&event) != 0) {
        if (event.type == SDL_QUIT) {
            end(program);
            return;
        }
        take(event, program);
    }
}

std::optional<Clock::duration> SdlFrontEnd::timeLeft(const Program& program) {
    const auto deadline = program.nextDeadline();
    if (!deadline)
        return std::nullopt;
    return std::max(*deadline - now(), Clock::duration::zero());
}

void SdlFrontEnd::take(const SDL_Event& event, Program& program) {
    if (const auto reported = translateX11(event)) {
        take(*reported, program);
        return;
    }
    const WindowId window = idOf(windowOf(event));
    DesktopWindow* shown = find(window);
    if (event.type == SDL_WINDOWEVENT && (event.window.event == SDL_WINDOWEVENT_EXPOSED ||
                                          event.window.event == SDL_WINDOWEVENT_SIZE_CHANGED)) {
        if (shown != nullptr)
            shown->showAgain();
    }
    if (event.type == SDL_WINDOWEVENT && (event.window.event == SDL_WINDOWEVENT_DISPLAY_CHANGED ||
                                          event.window.event == SDL_WINDOWEVENT_SIZE_CHANGED))
        followScale(program);
    if (event.type == SDL_WINDOWEVENT &&
        (event.window.event == SDL_WINDOWEVENT_FOCUS_GAINED || event.window.event == SDL_WINDOWEVENT_SHOWN))
        handOnKeyboard(program);
    if (event.type == SDL_WINDOWEVENT && event.window.event == SDL_WINDOWEVENT_ENTER && shown != nullptr)
        showPointerOf(*shown);
    const bool isTyped = event.type == SDL_KEYDOWN || event.type == SDL_TEXTINPUT;
    auto input = translate(event);
    if (!input || (isTyped && !heldKeys_.isMeant()))
        return;
    input->window = window;
    if (shown != nullptr) {
        const Point place =
            shown->programPixel({static_cast<std::int32_t>(input->x), static_cast<std::int32_t>(input->y)});
        input->x = static_cast<float>(place.x);
        input->y = static_cast<float>(place.y);
    }
    program.post(*input);
}

// While a dialog is open the keyboard is the innermost one's, whichever of the program's windows the desktop
// has given it to.
void SdlFrontEnd::handOnKeyboard(const Program& program) {
    const DesktopWindow* dialog = find(program.modalWindow().value_or(WindowId::none));
    const SDL_Window* focused = SDL_GetKeyboardFocus();
    if (dialog != nullptr && focused != nullptr && focused != dialog->sdl())
        dialog->takeKeyboard();
}

void SdlFrontEnd::take(const X11Event& event, Program& program) {
    switch (event.kind) {
        case X11Event::Kind::KeyboardGained:
            heldKeys_.changeWindow();
            break;
        case X11Event::Kind::KeysDown:
            heldKeys_.areDown(event.down);
            break;
        case X11Event::Kind::KeyPressed:
            heldKeys_.press(event.key);
            break;
        case X11Event::Kind::KeyReleased:
            heldKeys_.release(event.key);
            break;
        case X11Event::Kind::ResourcesChanged:
            followScale(program);
            break;
        case X11Event::Kind::WindowDestroyed:
            if (const WindowId window = idOfX11(event.window); window != WindowId::none)
                lose(window, program);
            break;
    }
}

// Somebody else has destroyed a window. For a dialog that is closing it; without its main window the program
// ends.
void SdlFrontEnd::lose(WindowId window, Program& program) {
    windows_.at(window)->setLost();
    if (program.modalWindow() == window)
        program.post({.window = window, .kind = EventKind::CloseButton});
    else
        end(program);
}

Scale SdlFrontEnd::createWindow(WindowId window, const NativeWindow& traits) {
    auto made = std::make_unique<DesktopWindow>(traits, find(traits.owner));
    if (made->sdl() == nullptr) {
        std::fprintf(stderr, "Quabble cannot open a window: %s\n", SDL_GetError());
        unopened_.push_back(window);
        return {};
    }
    const Scale scale = made->scale();
    windows_[window] = std::move(made);
    return scale;
}

// An owner comes before its dialogs.
void SdlFrontEnd::followScale(Program& program) {
    for (const auto& [window, shown] : windows_) {
        if (shown->followScale())
            program.post({.window = window, .kind = EventKind::Rescaled, .scale = shown->scale()});
    }
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

void SdlFrontEnd::setPointer(WindowId window, PointerShape shape) {
    DesktopWindow* shown = find(window);
    if (shown == nullptr)
        return;
    shown->setPointer(shape);
    if (SDL_GetMouseFocus() == shown->sdl())
        showPointerOf(*shown);
}

// SDL knows one pointer for all windows.
void SdlFrontEnd::showPointerOf(const DesktopWindow& window) {
    const bool isHand = window.pointer() == PointerShape::Hand;
    if (isHand && hand_ == nullptr)
        hand_ = SDL_CreateSystemCursor(SDL_SYSTEM_CURSOR_HAND);
    SDL_SetCursor(isHand && hand_ != nullptr ? hand_ : SDL_GetDefaultCursor());
}

void SdlFrontEnd::openDocument(std::string_view document) {
    startDetached({"xdg-open", pathOrAddress(document)}, programFolder());
}

void SdlFrontEnd::setTextInput(WindowId window, std::optional<Rect> area) {
    const DesktopWindow* shown = find(window);
    if (shown == nullptr)
        return;
    if (!area) {
        SDL_StopTextInput();
        return;
    }
    const Rect place = shown->placeOf(*area);
    const SDL_Rect sdlPlace{place.left, place.top, place.width(), place.height()};
    SDL_SetTextInputRect(&sdlPlace);
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

Size SdlFrontEnd::screenSize() {
    SDL_Rect bounds{};
    SDL_GetDisplayBounds(0, &bounds);
    return {bounds.w, bounds.h};
}

FileBytes SdlFrontEnd::programFile(std::string_view name) {
    return readProgramFile(name);
}

DesktopWindow* SdlFrontEnd::find(WindowId window) {
    const auto found = windows_.find(window);
    return found == windows_.end() ? nullptr : found->second.get();
}

WindowId SdlFrontEnd::idOf(std::uint32_t sdlWindow) const {
    const auto found = std::ranges::find_if(
        windows_, [&](const auto& window) { return sdlWindow != 0 && window.second->sdlId() == sdlWindow; });
    return found == windows_.end() ? WindowId::none : found->first;
}

WindowId SdlFrontEnd::idOfX11(unsigned long x11Window) const {
    const auto found = std::ranges::find_if(windows_, [&](const auto& window) {
        const auto x11 = X11Window::of(window.second->sdl());
        return x11 && x11->id() == x11Window;
    });
    return found == windows_.end() ? WindowId::none : found->first;
}

}  // namespace quabble
