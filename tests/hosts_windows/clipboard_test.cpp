#include "hosts/windows/clipboard.hpp"

#include <gtest/gtest.h>

#include <cstring>

#include "hosts/windows/registry/win32.hpp"

namespace quabble {
namespace {

class ClipboardTest : public testing::Test {
 protected:
    ~ClipboardTest() override { DestroyWindow(window); }

    // As another program does.
    void put(UINT format, std::wstring_view text) const {
        const HGLOBAL block = GlobalAlloc(GMEM_FIXED, text.size() * sizeof(wchar_t));
        std::memcpy(block, text.data(), text.size() * sizeof(wchar_t));
        OpenClipboard(window);
        EmptyClipboard();
        SetClipboardData(format, block);
        CloseClipboard();
    }

    const HWND window =
        CreateWindowExW(0, L"STATIC", L"", 0, 0, 0, 0, 0, HWND_MESSAGE, nullptr, nullptr, nullptr);
};

TEST_F(ClipboardTest, ExchangesTextOfAnyLanguage) {
    for (const char* text : {"Zo\u00EB \u20AC", "\u65E5\u672C \U0001F600", ""}) {
        putOnClipboard(window, text);
        EXPECT_EQ(clipboardTextFor(window), text);
    }
}

TEST_F(ClipboardTest, TakesWhatOthersPutThere) {
    put(CF_UNICODETEXT, std::wstring_view(L"cut\0off\0", 8));
    EXPECT_EQ(clipboardTextFor(window), "cut");
    put(CF_WAVE, L"no text");
    EXPECT_EQ(clipboardTextFor(window), "");
}

}  // namespace
}  // namespace quabble
