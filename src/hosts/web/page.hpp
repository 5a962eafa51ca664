#pragma once

#include <cstddef>
#include <cstdint>

#include "platform/front_end.hpp"

#define QUABBLE_PAGE(name) __attribute__((import_module("page"), import_name(name)))

// What the page does for the program: functions of its script, in page/program.js. Texts are UTF-8, sizes and
// places in device pixels, times in milliseconds; places are of the page, or of a window's client area.
namespace quabble::page {

QUABBLE_PAGE("now") double now();

QUABBLE_PAGE("createWindow")
void createWindow(WindowId window, WindowId owner, bool isBorderless, const char* caption,
                  std::size_t captionSize);
// The frame's place in the page, and in the frame the client area's.
QUABBLE_PAGE("placeWindow")
void placeWindow(WindowId window, std::int32_t left, std::int32_t top, std::int32_t width,
                 std::int32_t height, std::int32_t clientLeft, std::int32_t clientTop,
                 std::int32_t clientWidth, std::int32_t clientHeight);
// A picture of the client area, at whatever scale: red, green, blue and 255 for each pixel.
QUABBLE_PAGE("showPixels")
void showPixels(WindowId window, std::int32_t width, std::int32_t height, const std::uint32_t* pixels);
QUABBLE_PAGE("closeWindow") void closeWindow(WindowId window);
QUABBLE_PAGE("minimiseWindow") void minimiseWindow(WindowId window);
QUABBLE_PAGE("setPointer") void setPointer(WindowId window, bool isHand);
// Without a width there is no text field.
QUABBLE_PAGE("setTextField")
void setTextField(WindowId window, std::int32_t left, std::int32_t top, std::int32_t width,
                  std::int32_t height);

// What is read beside a window's picture; places are counted from 0, sizes in percent of the client area.
QUABBLE_PAGE("nameScreen") void nameScreen(WindowId window, const char* name, std::size_t nameSize);
QUABBLE_PAGE("clearPlaces") void clearPlaces(WindowId window);
// A place for the first time since they were cleared, or its new words. The role is one of Place::Role.
QUABBLE_PAGE("setPlace")
void setPlace(WindowId window, std::size_t place, std::uint32_t role, double left, double top, double width,
              double height, const char* words, std::size_t wordsSize);
// The place that the keyboard is at; -1 for none.
QUABBLE_PAGE("setCurrentPlace") void setCurrentPlace(WindowId window, std::int32_t place);
// What the text field is for, and what the program has in it; caret and anchor in characters.
QUABBLE_PAGE("setFieldText")
void setFieldText(WindowId window, const char* label, std::size_t labelSize, const char* text,
                  std::size_t textSize, std::size_t caret, std::size_t anchor);
// Says it, after what is being said.
QUABBLE_PAGE("say") void say(const char* words, std::size_t wordsSize);

QUABBLE_PAGE("openDocument") void openDocument(const char* document, std::size_t size);

// Each text or file is first asked for its size, which is 0 when there is none, and then taken at once.
QUABBLE_PAGE("fileSize") std::size_t fileSize(const char* name, std::size_t nameSize);
// -1 when what is kept cannot be read.
QUABBLE_PAGE("storageSize") std::int32_t storageSize();
QUABBLE_PAGE("take") void take(void* to);

QUABBLE_PAGE("setClipboard") void setClipboard(const char* text, std::size_t size);
QUABBLE_PAGE("writeStorage") bool writeStorage(const void* bytes, std::size_t size);

// One or more lines of the record of the last game.
QUABBLE_PAGE("addToRecord") void addToRecord(const char* lines, std::size_t size);

}  // namespace quabble::page
