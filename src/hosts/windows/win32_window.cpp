#include "hosts/windows/win32_window.hpp"

#include <algorithm>
#include <utility>

#include "hosts/windows/dots.hpp"
#include "hosts/windows/registry/win32.hpp"
// after it
#include <imm.h>

#include "hosts/windows/resource_numbers.hpp"
#include "hosts/windows/wide_text.hpp"
#include "hosts/windows/window_procedure.hpp"

namespace quabble {
namespace {

DWORD styleOf(const NativeWindow& traits) {
    if (traits.borderless)
        return WS_POPUP;
    const bool isDialog = traits.owner != WindowId::none;
    return WS_CAPTION | WS_SYSMENU | (isDialog ? WS_POPUP : WS_OVERLAPPED | WS_MINIMIZEBOX);
}

Rect outerRectOf(HWND window) {
    RECT outer{};
    GetWindowRect(window, &outer);
    return {outer.left, outer.top, outer.right, outer.bottom};
}

void setIcons(HWND window) {
    const auto load = [](int width, int height) {
        return LoadImageW(GetModuleHandleW(nullptr), MAKEINTRESOURCEW(QUABBLE_ICON), IMAGE_ICON,
                          GetSystemMetrics(width), GetSystemMetrics(height), LR_DEFAULTCOLOR);
    };
    static const HANDLE large = load(SM_CXICON, SM_CYICON);
    static const HANDLE little = load(SM_CXSMICON, SM_CYSMICON);
    SendMessageW(window, WM_SETICON, ICON_BIG, reinterpret_cast<LPARAM>(large));
    SendMessageW(window, WM_SETICON, ICON_SMALL, reinterpret_cast<LPARAM>(little));
}

// Chosen from the window's menu, which numbers what is not the system's below 0xF000, in steps of 16.
constexpr UINT_PTR saveRecord = 0x0010;

void addToMenu(HWND window) {
    const HMENU menu = GetSystemMenu(window, FALSE);
    AppendMenuW(menu, MF_SEPARATOR, 0, nullptr);
    AppendMenuW(menu, MF_STRING, saveRecord, L"Save a record of the &last game");
}

// The corner from which a size lies in the middle of an area.
Point centred(Size size, const Rect& area) {
    return {area.left + (area.width() - size.width) / 2, area.top + (area.height() - size.height) / 2};
}

// As much of it as can be lies in the area, its top left corner first.
Point keptWithin(Point corner, Size size, const Rect& area) {
    return {std::max(std::min(corner.x, area.right - size.width), area.left),
            std::max(std::min(corner.y, area.bottom - size.height), area.top)};
}

}  // namespace

Win32Window::Win32Window(WindowId id, const NativeWindow& traits, const Win32Window* owner,
                         WindowListener& listener)
    : id_(id), traits_(traits), owner_(owner), listener_(listener) {
    // It is made where it will be, for it has the dots of the screen that it is made on.
    const HWND above = owner == nullptr ? nullptr : owner->handle();
    const Rect place = above == nullptr ? Rect{} : outerRectOf(above);
    handle_ = CreateWindowExW(above == nullptr ? 0 : WS_EX_DLGMODALFRAME, windowClassName,
                              wideOf(traits.caption).c_str(), styleOf(traits), place.left, place.top, 0, 0,
                              above, nullptr, GetModuleHandleW(nullptr), this);
    if (handle_ == nullptr)
        return;
    const unsigned dots = dotsPerInchOf(handle_);
    setFactor(factorAt(dots));
    const Size outer = outerSizeAround(sizeAt(factor_), handle_, dots);
    const Point corner = wantedCorner(outer);
    SetWindowPos(handle_, nullptr, corner.x, corner.y, outer.width, outer.height,
                 SWP_NOZORDER | SWP_NOACTIVATE);
    setTextInput(std::nullopt);
    if (above != nullptr)
        EnableWindow(above, FALSE);
    if (!traits.borderless)
        addToMenu(handle_);
}

// An owner that cannot take the keyboard would leave it to another program.
Win32Window::~Win32Window() {
    if (handle_ == nullptr)
        return;
    if (owner_ != nullptr)
        EnableWindow(owner_->handle(), TRUE);
    DestroyWindow(handle_);
}

double Win32Window::factorAt(unsigned dotsPerInch) const {
    if (owner_ != nullptr)
        return owner_->factor_;
    const Rect area = workAreaOf(handle_);
    const Size frame = outerSizeAround({}, handle_, dotsPerInch);
    return scaleFor(dotsPerInch, traits_.clientSize,
                    {area.width() - frame.width, area.height() - frame.height});
}

void Win32Window::setFactor(double factor) {
    factor_ = factor;
    scale_ = Scale::nearest(factor);
}

Size Win32Window::sizeAt(double factor) const {
    return factor < 1 ? scaled(traits_.clientSize, factor)
                      : Scale::nearest(factor).device(traits_.clientSize);
}

Size Win32Window::size() const {
    RECT client{};
    GetClientRect(handle_, &client);
    return {client.right, client.bottom};
}

// A place that the program asks for is meant for an unscaled window: the middle of its upper edge stays.
Point Win32Window::wantedCorner(Size outer) const {
    const Rect area = workAreaOf(handle_);
    const Rect screen = Rect::ofSize(0, 0, GetSystemMetrics(SM_CXSCREEN), GetSystemMetrics(SM_CYSCREEN));
    Point corner = centred(outer, owner_ == nullptr ? screen : outerRectOf(owner_->handle()));
    if (traits_.position) {
        const int wider = sizeAt(factor_).width - traits_.clientSize.width;
        corner = {traits_.position->x - wider / 2, traits_.position->y};
    }
    return keptWithin(corner, outer, area);
}

bool Win32Window::followScale() {
    const double factor = factorAt(dotsPerInchOf(handle_));
    const bool isAnother = factor != factor_;
    setFactor(factor);
    if (size() != sizeAt(factor) && !isMinimised_)
        resizeTo(sizeAt(factor));
    return isAnother;
}

// The middle of its upper edge stays where it is.
void Win32Window::resizeTo(Size client) const {
    const Size outer = outerSizeAround(client, handle_, dotsPerInchOf(handle_));
    const Rect before = outerRectOf(handle_);
    const Point corner = keptWithin({before.left + (before.width() - outer.width) / 2, before.top}, outer,
                                    workAreaOf(handle_));
    SetWindowPos(handle_, nullptr, corner.x, corner.y, outer.width, outer.height,
                 SWP_NOZORDER | SWP_NOACTIVATE);
}

void Win32Window::show(const Surface& picture) {
    picture_.set(picture, sizeAt(factor_));
    const bool opens = !std::exchange(isOpened_, true);
    if (opens)
        ShowWindow(handle_, SW_SHOW);
    RedrawWindow(handle_, nullptr, nullptr, RDW_INVALIDATE | RDW_UPDATENOW);
    if (opens && owner_ == nullptr)
        setIcons(handle_);  // which takes a while and need not be there before
}

void Win32Window::paint() const {
    PAINTSTRUCT painting{};
    picture_.paint(BeginPaint(handle_, &painting), size());
    EndPaint(handle_, &painting);
}

void Win32Window::minimise() const {
    ShowWindow(handle_, SW_MINIMIZE);
}

void Win32Window::setPointer(PointerShape shape) {
    pointer_ = shape;
    POINT place{};
    GetCursorPos(&place);
    if (WindowFromPoint(place) == handle_)
        SendMessageW(handle_, WM_SETCURSOR, 0, MAKELPARAM(HTCLIENT, 0));
}

// Outside the client area the system chooses.
bool Win32Window::showPointer(std::intptr_t where) const {
    if (LOWORD(where) != HTCLIENT)
        return false;
    const bool isHand = pointer_ == PointerShape::Hand;
    SetCursor(LoadCursorW(nullptr, MAKEINTRESOURCEW(isHand ? 32649 : 32512)));  // IDC_HAND, IDC_ARROW
    return true;
}

void Win32Window::setTextInput(std::optional<Rect> area) {
    textArea_ = area;
    ImmAssociateContextEx(handle_, nullptr, area ? IACE_DEFAULT : 0);
    placeInputMethod();
}

// What is being composed lies over the text, and what there is to choose from beside it.
void Win32Window::placeInputMethod() const {
    const HIMC context = textArea_ ? ImmGetContext(handle_) : nullptr;
    if (context == nullptr)
        return;
    const Rect area = scale_.device(*textArea_);
    COMPOSITIONFORM composition{};
    composition.dwStyle = CFS_POINT;
    composition.ptCurrentPos = {area.left, area.top};
    ImmSetCompositionWindow(context, &composition);
    CANDIDATEFORM candidates{};
    candidates.dwStyle = CFS_EXCLUDE;
    candidates.ptCurrentPos = {area.left, area.bottom};
    candidates.rcArea = {area.left, area.top, area.right, area.bottom};
    ImmSetCandidateWindow(context, &candidates);
    ImmReleaseContext(handle_, context);
}

Point Win32Window::programPixel(Point place) const {
    return scale_.pixelAt(pixelSeenAt(place, size(), scale_.device(traits_.clientSize)));
}

void Win32Window::report(InputEvent event) {
    event.window = id_;
    listener_.report(event);
}

// While a button is held the window hears of the pointer wherever it goes.
void Win32Window::reportPointer(EventKind kind, std::uintptr_t buttons, std::intptr_t place) {
    if (kind == EventKind::MouseDown)
        SetCapture(handle_);
    if (kind == EventKind::MouseUp && (buttons & (MK_LBUTTON | MK_RBUTTON | MK_MBUTTON)) == 0)
        ReleaseCapture();
    const Point seen = programPixel({static_cast<short>(LOWORD(place)), static_cast<short>(HIWORD(place))});
    report({.kind = kind,
            .x = static_cast<float>(seen.x),
            .y = static_cast<float>(seen.y),
            .extends = (buttons & MK_SHIFT) != 0});
}

void Win32Window::reportSize(std::uintptr_t how) {
    const bool isMinimised = how == SIZE_MINIMIZED;
    if (isMinimised == isMinimised_)
        return;
    isMinimised_ = isMinimised;
    report({.kind = isMinimised ? EventKind::Minimised : EventKind::Restored});
    if (!isMinimised)
        listener_.screensHaveChanged();  // which it could not follow meanwhile
}

std::optional<std::intptr_t> Win32Window::answer(unsigned message, std::uintptr_t first,
                                                 std::intptr_t second) {
    const auto result = answerFrame(message, first, second);
    return result ? result : answerInput(message, first, second);
}

std::optional<std::intptr_t> Win32Window::answerFrame(unsigned message, std::uintptr_t first,
                                                      std::intptr_t second) {
    switch (message) {
        case WM_PAINT:
            paint();
            return 0;
        case WM_ERASEBKGND:
            return 1;
        case WM_SIZE:
            reportSize(first);
            return 0;
        case WM_CLOSE:
            report({.kind = EventKind::CloseButton});
            return 0;
        case WM_SYSCOMMAND:
            return obeyMenu(first & 0xFFF0, second) ? std::optional<std::intptr_t>(0) : std::nullopt;
        case WM_GETDPISCALEDSIZE: {
            const auto dots = static_cast<unsigned>(first);
            const Size outer = outerSizeAround(sizeAt(factorAt(dots)), handle_, dots);
            *reinterpret_cast<SIZE*>(second) = {outer.width, outer.height};
            return 1;
        }
        case WM_DPICHANGED: {
            const RECT& wanted = *reinterpret_cast<const RECT*>(second);
            SetWindowPos(handle_, nullptr, wanted.left, wanted.top, wanted.right - wanted.left,
                         wanted.bottom - wanted.top, SWP_NOZORDER | SWP_NOACTIVATE);
            listener_.screensHaveChanged();
            return 0;
        }
        case WM_DISPLAYCHANGE:
        case WM_SETTINGCHANGE:
            listener_.screensHaveChanged();
            return std::nullopt;
        case WM_QUERYENDSESSION:
            return 1;
        case WM_ENDSESSION:
            if (first != 0)
                listener_.sessionEnds();
            return 0;
        default:
            return std::nullopt;
    }
}

// False when it is to do what it always does. Alt or F10 alone would hold up the game in a menu that nobody
// sees.
bool Win32Window::obeyMenu(std::uintptr_t command, std::intptr_t key) {
    if (command == saveRecord)
        listener_.recordIsWanted();
    return command == saveRecord || (command == SC_KEYMENU && key == 0);
}

std::optional<std::intptr_t> Win32Window::answerInput(unsigned message, std::uintptr_t first,
                                                      std::intptr_t second) {
    switch (message) {
        case WM_MOUSEMOVE:
            reportPointer(EventKind::MouseMove, first, second);
            return 0;
        case WM_LBUTTONDOWN:
        case WM_RBUTTONDOWN:
        case WM_MBUTTONDOWN:
            reportPointer(EventKind::MouseDown, first, second);
            return 0;
        case WM_LBUTTONUP:
        case WM_RBUTTONUP:
        case WM_MBUTTONUP:
            reportPointer(EventKind::MouseUp, first, second);
            return 0;
        case WM_SETCURSOR:
            return showPointer(second) ? std::optional<std::intptr_t>(1) : std::nullopt;
        case WM_SETFOCUS:
            keyboard_.begin();
            return std::nullopt;
        case WM_KEYDOWN:
            if (const auto event = keyboard_.press(first, second))
                report(*event);
            return 0;
        case WM_CHAR:
            for (const InputEvent& event : keyboard_.character(first, second)) {
                if (event.kind != EventKind::TextInput || textArea_)
                    report(event);
            }
            return 0;
        case WM_IME_STARTCOMPOSITION:
            placeInputMethod();
            return std::nullopt;
        default:
            return std::nullopt;
    }
}

}  // namespace quabble
