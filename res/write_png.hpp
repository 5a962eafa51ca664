#pragma once

#include <vector>

// A picture of three bytes a pixel, red, green and blue, or of four, with what covers it, as a PNG file that
// is as small as libpng makes it: with whichever filter suits it best.
std::vector<unsigned char> smallestPng(const std::vector<unsigned char>& pixels, int width, int height);
