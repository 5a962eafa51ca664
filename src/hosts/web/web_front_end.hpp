#pragma once

#include <functional>
#include <map>
#include <optional>
#include <string>
#include <string_view>

#include "hosts/web/page_layout.hpp"
#include "hosts/web/voice.hpp"
#include "platform/front_end.hpp"
#include "platform/input_event.hpp"

namespace quabble {

// A page in a browser. Windows are frames within it, and a page that is hidden counts as minimised.
class WebFrontEnd final : public FrontEnd {
 public:
    struct Shown {
        NativeWindow traits;
        WindowPlace place;
        bool isMinimised = false;
        std::optional<Rect> textArea;
    };

    explicit WebFrontEnd(const Page& page) : page_(page) {}

    // Where the program is posted what happens; to be set before the program starts.
    void connect(std::function<void(const InputEvent&)> post) { post_ = std::move(post); }

    // --- What happens to the page ---

    void resize(const Page& page);
    // From now on the page has the large versions of the pictures. Before that every picture is wanted at
    // scale 1, and shown larger.
    void takeLargePictures();
    void setHidden(bool isHidden);
    // The frame of a window that can be minimised was, or was restored.
    void setMinimised(WindowId window, bool isMinimised);

    // What happened to a window, at a device pixel of its client area.
    void pressMouse(WindowId window, Point at, bool shift);
    void moveMouse(WindowId window, Point at);
    void releaseMouse(WindowId window, Point at);
    bool editsText(WindowId window) const;

    // The frames in the page, the topmost last.
    const std::map<WindowId, Shown>& windows() const { return windows_; }

    // --- For those who do not see the pictures ---

    // What the window that takes input looks like now.
    void tell(WindowId window, const Description& description);
    // Somebody has chosen one of the places that the page was told of.
    void clickPlace(WindowId window, std::size_t place);
    // Somebody asks.
    void sayHowItStands(WindowId window) const { voice_.sayHowItStands(window); }

    // --- FrontEnd ---

    TimePoint now() override;
    Scale createWindow(WindowId window, const NativeWindow& traits) override;
    void showPixels(WindowId window, const Surface& picture) override;
    void closeWindow(WindowId window) override;
    void minimiseWindow(WindowId window) override;
    void setPointer(WindowId window, PointerShape shape) override;
    void setTextInput(WindowId window, std::optional<Rect> area) override;
    FileBytes programFile(std::string_view name) override;
    void say(std::string_view words) override { voice_.say(words); }
    void openDocument(std::string_view document) override;
    // What was copied in the page. What other programs have copied comes as typed text when it is pasted.
    std::string clipboardText() override { return clipboard_; }
    void setClipboardText(const std::string& text) override;

 private:
    struct Press {
        WindowId window = WindowId::none;
        Point at;
        TimePoint when;
    };

    Scale wantedScale() const;
    void place(WindowId window, Shown& shown);
    void placeTextField(WindowId window, const Shown& shown);
    InputEvent mouseEvent(WindowId window, EventKind kind, Point at) const;

    Page page_;
    std::function<void(const InputEvent&)> post_;
    bool hasLargePictures_ = false;
    bool isHidden_ = false;
    std::map<WindowId, Shown> windows_;
    Press lastPress_;
    std::string clipboard_;
    Voice voice_;
};

}  // namespace quabble
