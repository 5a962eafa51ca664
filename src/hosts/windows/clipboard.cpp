#include "hosts/windows/clipboard.hpp"

#include <cstring>
#include <string_view>

#include "hosts/windows/registry/win32.hpp"
#include "hosts/windows/wide_text.hpp"

namespace quabble {
namespace {

// The clipboard, open as long as this lives. Other programs may have it open for a moment.
class OpenClipboardFor {
 public:
    explicit OpenClipboardFor(HWND window) {
        constexpr int attempts = 10;
        for (int i = 0; i < attempts && !(isOpen_ = OpenClipboard(window) != 0); ++i)
            Sleep(1);
    }
    ~OpenClipboardFor() {
        if (isOpen_)
            CloseClipboard();
    }
    OpenClipboardFor(const OpenClipboardFor&) = delete;
    OpenClipboardFor& operator=(const OpenClipboardFor&) = delete;

    bool isOpen() const { return isOpen_; }

 private:
    bool isOpen_ = false;
};

}  // namespace

// The text ends at a zero, or else with its block of memory.
std::string clipboardTextFor(HWND window) {
    const OpenClipboardFor clipboard(window);
    const HANDLE block = clipboard.isOpen() ? GetClipboardData(CF_UNICODETEXT) : nullptr;
    const void* memory = block == nullptr ? nullptr : GlobalLock(block);
    if (memory == nullptr)
        return {};
    const std::wstring_view all(static_cast<const wchar_t*>(memory), GlobalSize(block) / sizeof(wchar_t));
    std::string text = utf8Of(all.substr(0, all.find(L'\0')));
    GlobalUnlock(block);
    return text;
}

void putOnClipboard(HWND window, const std::string& text) {
    const std::wstring wide = wideOf(text);
    const OpenClipboardFor clipboard(window);
    const std::size_t size = (wide.size() + 1) * sizeof(wchar_t);
    const HGLOBAL block = clipboard.isOpen() ? GlobalAlloc(GMEM_MOVEABLE, size) : nullptr;
    if (block == nullptr)
        return;
    std::memcpy(GlobalLock(block), wide.c_str(), size);
    GlobalUnlock(block);
    EmptyClipboard();
    if (SetClipboardData(CF_UNICODETEXT, block) == nullptr)  // which takes the block
        GlobalFree(block);
}

}  // namespace quabble
