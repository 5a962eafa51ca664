#pragma once

#include <map>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "app/program.hpp"
#include "hosts/windows/message_wait.hpp"
#include "hosts/windows/visit_file.hpp"
#include "hosts/windows/win32_window.hpp"
#include "platform/front_end.hpp"

namespace quabble {

// Windows, by its own interface.
class WindowsFrontEnd final : public FrontEnd, private WindowListener {
 public:
    // Starts the program, waits for the system's messages and passes them on, until the program has ended.
    // The record is written when the user wants it. The windows' class is there.
    void run(Program& program, const VisitFile& record);

    TimePoint now() override { return Clock::now(); }
    Scale createWindow(WindowId window, const NativeWindow& traits) override;
    void showPixels(WindowId window, const Surface& picture) override;
    void closeWindow(WindowId window) override;
    void minimiseWindow(WindowId window) override;
    void setPointer(WindowId window, PointerShape shape) override;
    void setTextInput(WindowId window, std::optional<Rect> area) override;
    Size screenSize() override;
    FileBytes programFile(std::string_view name) override;
    void openDocument(std::string_view document) override;
    std::string clipboardText() override;
    void setClipboardText(const std::string& text) override;

 private:
    void report(const InputEvent& event) override;
    void screensHaveChanged() override;
    void recordIsWanted() override { isRecordWanted_ = true; }
    void sessionEnds() override;

    void waitForMessages();
    bool continuesClick();
    void saveRecord(const VisitFile& record) const;
    Win32Window* find(WindowId window);

    Program* program_ = nullptr;  // that runs
    std::map<WindowId, std::unique_ptr<Win32Window>> windows_;
    std::unique_ptr<Win32Window> leaving_;
    std::vector<WindowId> unopened_;  // for want of a window; they close at once
    MessageWait messageWait_;
    bool isRecordWanted_ = false;
    struct Press {
        long time;  // milliseconds, by the system's messages
        Point place;
    };
    std::optional<Press> latestPress_;
};

}  // namespace quabble
