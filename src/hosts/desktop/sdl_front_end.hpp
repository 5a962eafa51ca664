#pragma once

#include <map>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "hosts/desktop/desktop_wait.hpp"
#include "hosts/desktop/desktop_window.hpp"
#include "hosts/desktop/held_keys.hpp"
#include "hosts/desktop/x11_events.hpp"
#include "platform/front_end.hpp"
#include "platform/message_loop.hpp"

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

    // Waits for the desktop's events and passes them to the loop until the program has ended.
    void run(MessageLoop& loop);

    TimePoint now() override { return Clock::now(); }
    void createWindow(WindowId window, const NativeWindow& traits) override;
    void showPixels(WindowId window, const Surface& picture) override;
    void closeWindow(WindowId window) override;
    void minimiseWindow(WindowId window) override;
    void setPointer(WindowId window, PointerShape shape) override;
    void openDocument(const std::string& document, const std::string& folder) override;
    void setTextInput(WindowId window, std::optional<Rect> area) override;
    std::string clipboardText() override;
    void setClipboardText(const std::string& text) override;
    Size screenSize() override;
    std::string executableFolder() override;

 private:
    SdlFrontEnd() = default;
    DesktopWindow* find(WindowId window);
    WindowId idOf(std::uint32_t sdlWindow) const;
    WindowId idOfX11(unsigned long x11Window) const;
    void waitForEvents(MessageLoop& loop);
    std::optional<Clock::duration> timeLeft(const MessageLoop& loop);
    void take(const SDL_Event& event, MessageLoop& loop);
    void showPointerOf(const DesktopWindow& window);
    void handOnKeyboard(const MessageLoop& loop);
    void take(const X11Event& event, MessageLoop& loop);
    void lose(WindowId window, MessageLoop& loop);

    std::map<WindowId, std::unique_ptr<DesktopWindow>> windows_;
    std::vector<WindowId> unopened_;  // for want of a place on the desktop; they close at once
    DesktopWait desktopWait_;
    HeldKeys heldKeys_;
    SDL_Cursor* hand_ = nullptr;  // made when it is first shown; SDL frees it when it quits
};

}  // namespace quabble
