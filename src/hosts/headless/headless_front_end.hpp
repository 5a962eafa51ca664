#pragma once

#include <algorithm>
#include <functional>
#include <map>
#include <string>
#include <utility>
#include <vector>

#include "platform/front_end.hpp"
#include "platform/input_event.hpp"

namespace quabble {

// A machine without a screen: windows are pictures in memory, files too, and time passes when told to. It
// holds the program to what a front end may rely on.
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
    using Files = std::map<std::string, std::vector<std::byte>, std::less<>>;

    // The files that come with the program.
    explicit HeadlessFrontEnd(Files files = {}) : files_(std::move(files)) {}

    // Where the program is posted what happens; to be set before a window is minimised or restored.
    void connect(std::function<void(const InputEvent&)> post) { post_ = std::move(post); }

    TimePoint now() override { return now_; }
    Scale createWindow(WindowId window, const NativeWindow& traits) override;
    void showPixels(WindowId window, const Surface& picture) override;
    void closeWindow(WindowId window) override;
    void minimiseWindow(WindowId window) override;
    void setPointer(WindowId window, PointerShape shape) override { windows_.at(window).pointer = shape; }
    void setTextInput(WindowId window, std::optional<Rect> area) override {
        windows_.at(window).takesText = area.has_value();
    }
    FileBytes programFile(std::string_view name) override;
    void openDocument(std::string_view document) override { openedDocuments.emplace_back(document); }
    std::string clipboardText() override { return clipboard; }
    void setClipboardText(const std::string& text) override { clipboard = text; }

    std::vector<std::string> openedDocuments;
    std::string clipboard;  // UTF-8

    Scale scale;  // of the windows that are made

    // Another scale is wanted of all windows from now on.
    void rescale(Scale wanted);

    void advanceTo(TimePoint time) { now_ = std::max(now_, time); }
    void restoreWindow(WindowId window);

    // The windows on the screen, the topmost last.
    const std::map<WindowId, Shown>& windows() const { return windows_; }

 private:
    Files files_;
    std::function<void(const InputEvent&)> post_;
    TimePoint now_;
    WindowId latest_ = WindowId::none;
    Scale earlierScale_;
    std::map<WindowId, Shown> windows_;
};

}  // namespace quabble
