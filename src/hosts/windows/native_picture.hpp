#pragma once

#include <cstdint>
#include <memory>

#include "draw/scaling.hpp"

struct HBITMAP__;
struct HDC__;

namespace quabble {

// A copy of a window's picture that the system can paint from by itself.
class NativePicture {
 public:
    // Takes the picture over, as large as it is to be seen.
    void set(const Surface& picture, Size shown);

    // Paints it over an area of that size from the top left corner on, stretched when its own size is
    // another. Does nothing when there is none.
    void paint(HDC__* context, Size area) const;

 private:
    bool resize(Size size);

    struct Destroy {
        void operator()(HBITMAP__* bitmap) const;
        void operator()(HDC__* context) const;
    };
    std::unique_ptr<HDC__, Destroy> context_;
    std::unique_ptr<HBITMAP__, Destroy> bitmap_;  // goes before the context that it is selected into
    std::uint32_t* pixels_ = nullptr;
    Size size_;
    Magnifier magnifier_;
};

}  // namespace quabble
