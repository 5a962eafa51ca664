#pragma once

#include <map>
#include <string>
#include <utility>
#include <vector>

#include "platform/front_end.hpp"
#include "platform/message_loop.hpp"

namespace quabble {

// A machine without a screen: windows are pictures in memory and time passes when told to.
class HeadlessFrontEnd final : public FrontEnd {
 public:
    struct Shown {
        NativeWindow traits;
        Surface picture;  // as shown last
        int timesShown = 0;
        bool minimised = false;
        bool takesText = false;
        PointerShape pointer = PointerShape::Arrow;
    };

    explicit HeadlessFrontEnd(std::string folder) : executableFolder_(std::move(folder)) {}

    // The loop that hears about windows being minimised; it must be set before a window is.
    void connect(MessageLoop& loop) { loop_ = &loop; }

    TimePoint now() override { return now_; }
    void createWindow(WindowId window, const NativeWindow& traits) override;
    void showPixels(WindowId window, const Surface& picture) override;
    void closeWindow(WindowId window) override;
    void minimiseWindow(WindowId window) override;
    void setPointer(WindowId window, PointerShape shape) override { windows_.at(window).pointer = shape; }
    void openDocument(const std::string& document, const std::string& folder) override {
        openedDocuments.push_back(document + " in " + folder);
    }
    void setTextInput(WindowId window, std::optional<Rect> area) override;
    std::string clipboardText() override { return clipboard; }
    void setClipboardText(const std::string& text) override { clipboard = text; }
    std::string executableFolder() override { return executableFolder_; }

    std::vector<std::string> openedDocuments;  // "document in folder"
    std::string clipboard;                     // UTF-8

    void advanceTo(TimePoint time) { now_ = std::max(now_, time); }
    void restoreWindow(WindowId window);

    // The windows on the screen, the topmost last.
    const std::map<WindowId, Shown>& windows() const { return windows_; }

 private:
    MessageLoop* loop_ = nullptr;
    std::string executableFolder_;
    TimePoint now_;
    std::map<WindowId, Shown> windows_;
};

}  // namespace quabble
