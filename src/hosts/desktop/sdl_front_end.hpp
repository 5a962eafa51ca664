#pragma once

#include <map>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "app/program.hpp"
#include "hosts/desktop/desktop_wait.hpp"
#include "hosts/desktop/desktop_window.hpp"
#include "hosts/desktop/visit_file.hpp"
#include "hosts/desktop/x11/held_keys.hpp"
#include "hosts/desktop/x11/x11_events.hpp"
#include "platform/front_end.hpp"

struct SDL_Cursor;
union SDL_Event;

namespace quabble {

// The desktop, by way of SDL 2.
class SdlFrontEnd final : public FrontEnd {
 public:
    // Nothing when there is no display to open windows on; `problem` then says why.
    static std::unique_ptr<SdlFrontEnd> open(std::string& problem);
    ~SdlFrontEnd() override;
    SdlFrontEnd(const SdlFrontEnd&) = delete;
    SdlFrontEnd& operator=(const SdlFrontEnd&) = delete;

    // Starts the program, waits for the desktop's events and passes them on, until the program has ended.
    void run(Program& program, const VisitFile& record);

    TimePoint now() override { return Clock::now(); }
    Scale createWindow(WindowId window, const NativeWindow& traits) override;
    void showPixels(WindowId window, const Surface& picture) override;
    void closeWindow(WindowId window) override;
    void minimiseWindow(WindowId window) override;
    void setPointer(WindowId window, PointerShape shape) override;
    void openDocument(std::string_view document) override;
    void setTextInput(WindowId window, std::optional<Rect> area) override;
    std::string clipboardText() override;
    void setClipboardText(const std::string& text) override;
    Size screenSize() override;
    FileBytes programFile(std::string_view name) override;

 private:
    SdlFrontEnd() = default;
    DesktopWindow* find(WindowId window);
    WindowId idOf(std::uint32_t sdlWindow) const;
    WindowId idOfX11(unsigned long x11Window) const;
    void waitForEvents(Program& program);
    std::optional<Clock::duration> timeLeft(const Program& program);
    void take(const SDL_Event& event, Program& program);
    void showPointerOf(const DesktopWindow& window);
    void handOnKeyboard(const Program& program);
    void take(const X11Event& event, Program& program);
    void lose(WindowId window, Program& program);
    void followScale(Program& program);

    std::map<WindowId, std::unique_ptr<DesktopWindow>> windows_;
    std::vector<WindowId> unopened_;  // for want of a place on the desktop; they close at once
    DesktopWait desktopWait_;
    HeldKeys heldKeys_;
    SDL_Cursor* hand_ = nullptr;  // made when it is first shown; SDL frees it when it quits
};

}  // namespace quabble
