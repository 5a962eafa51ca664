// The least that a program with a window can be on Windows: bare_win32_window WIDTH HEIGHT. It shows one
// solid picture.

#include <windows.h>

#include <cstdlib>

namespace {

LRESULT CALLBACK answer(HWND window, UINT message, WPARAM first, LPARAM second) {
    if (message == WM_DESTROY)
        PostQuitMessage(0);
    return DefWindowProcW(window, message, first, second);
}

}  // namespace

int main(int argc, char** argv) {
    if (argc < 3)
        return EXIT_FAILURE;
    WNDCLASSW kind{};
    kind.lpfnWndProc = answer;
    kind.lpszClassName = L"Bare window";
    kind.hbrBackground = CreateSolidBrush(RGB(62, 105, 214));
    RegisterClassW(&kind);
    const int width = std::atoi(argv[1]);
    const int height = std::atoi(argv[2]);
    const HWND window = CreateWindowExW(
        0, kind.lpszClassName, kind.lpszClassName, WS_POPUP, (GetSystemMetrics(SM_CXSCREEN) - width) / 2,
        (GetSystemMetrics(SM_CYSCREEN) - height) / 2, width, height, nullptr, nullptr, nullptr, nullptr);
    ShowWindow(window, SW_SHOW);
    UpdateWindow(window);
    MSG message{};
    while (GetMessageW(&message, nullptr, 0, 0) > 0)
        DispatchMessageW(&message);
    return EXIT_SUCCESS;
}
