#pragma once

#include <cstddef>
#include <cstdint>

#define QUABBLE_PAGE(name) __attribute__((import_module("page"), import_name(name)))

// What the page does for the program: functions of its script, in page/program.js. Texts are UTF-8, sizes and
// places in device pixels, times in milliseconds; places are of the page, or of a window's client area.
namespace quabble::page {

QUABBLE_PAGE("now") double now();

QUABBLE_PAGE("createWindow")
void createWindow(std::uint32_t window, std::uint32_t owner, bool isBorderless, const char* caption,
                  std::size_t captionSize);
// The frame's place in the page, and in the frame the client area's.
QUABBLE_PAGE("placeWindow")
void placeWindow(std::uint32_t window, std::int32_t left, std::int32_t top, std::int32_t width,
                 std::int32_t height, std::int32_t clientLeft, std::int32_t clientTop,
                 std::int32_t clientWidth, std::int32_t clientHeight);
// A picture of the client area, at whatever scale: red, green, blue and 255 for each pixel.
QUABBLE_PAGE("showPixels")
void showPixels(std::uint32_t window, std::int32_t width, std::int32_t height, const std::uint32_t* pixels);
QUABBLE_PAGE("closeWindow") void closeWindow(std::uint32_t window);
QUABBLE_PAGE("minimiseWindow") void minimiseWindow(std::uint32_t window);
QUABBLE_PAGE("setPointer") void setPointer(std::uint32_t window, bool isHand);
// Without a width there is no text field.
QUABBLE_PAGE("setTextField")
void setTextField(std::uint32_t window, std::int32_t left, std::int32_t top, std::int32_t width,
                  std::int32_t height);

QUABBLE_PAGE("openDocument") void openDocument(const char* document, std::size_t size);

// Each text or file is first asked for its size, which is 0 when there is none, and then taken at once.
QUABBLE_PAGE("fileSize") std::size_t fileSize(const char* name, std::size_t nameSize);
QUABBLE_PAGE("clipboardSize") std::size_t clipboardSize();
// -1 when what is kept cannot be read.
QUABBLE_PAGE("storageSize") std::int32_t storageSize();
QUABBLE_PAGE("take") void take(void* to);

QUABBLE_PAGE("setClipboard") void setClipboard(const char* text, std::size_t size);
QUABBLE_PAGE("writeStorage") bool writeStorage(const void* bytes, std::size_t size);

// One or more lines of the record of the last game.
QUABBLE_PAGE("addToRecord") void addToRecord(const char* lines, std::size_t size);

}  // namespace quabble::page
