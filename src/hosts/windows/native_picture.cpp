#include "hosts/windows/native_picture.hpp"

#include "hosts/windows/registry/win32.hpp"

namespace quabble {

void NativePicture::set(const Surface& picture, Size shown) {
    if (shown != size_ && !resize(shown))
        return;
    const Size own{picture.width(), picture.height()};
    if (magnifier_.shownSize() != shown || magnifier_.pictureSize() != own)
        magnifier_ = Magnifier(own, shown);
    GdiFlush();  // what was painted before is read first
    magnifier_.show(picture, pixels_, shown.width * static_cast<std::ptrdiff_t>(sizeof(std::uint32_t)));
}

bool NativePicture::resize(Size size) {
    BITMAPINFO format{};
    format.bmiHeader.biSize = sizeof format.bmiHeader;
    format.bmiHeader.biWidth = size.width;
    format.bmiHeader.biHeight = -size.height;  // rows from the top
    format.bmiHeader.biPlanes = 1;
    format.bmiHeader.biBitCount = 32;
    void* pixels = nullptr;
    const HBITMAP bitmap = CreateDIBSection(nullptr, &format, DIB_RGB_COLORS, &pixels, nullptr, 0);
    if (bitmap == nullptr)
        return false;
    if (!context_)
        context_.reset(CreateCompatibleDC(nullptr));
    SelectObject(context_.get(), bitmap);
    bitmap_.reset(bitmap);
    pixels_ = static_cast<std::uint32_t*>(pixels);
    size_ = size;
    return true;
}

void NativePicture::paint(HDC context, Size area) const {
    if (!bitmap_)
        return;
    if (area == size_) {
        BitBlt(context, 0, 0, area.width, area.height, context_.get(), 0, 0, SRCCOPY);
        return;
    }
    SetStretchBltMode(context, HALFTONE);
    StretchBlt(context, 0, 0, area.width, area.height, context_.get(), 0, 0, size_.width, size_.height,
               SRCCOPY);
}

void NativePicture::Destroy::operator()(HBITMAP bitmap) const {
    DeleteObject(bitmap);
}

void NativePicture::Destroy::operator()(HDC context) const {
    DeleteDC(context);
}

}  // namespace quabble
