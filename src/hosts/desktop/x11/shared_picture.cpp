#include "hosts/desktop/x11/shared_picture.hpp"

#include <X11/Xlib.h>
#include <X11/Xutil.h>
#include <X11/extensions/XShm.h>
#include <sys/ipc.h>
#include <sys/shm.h>

#include <bit>
#include <cstdint>
#include <utility>

namespace quabble {
namespace {

bool isLikeSurface(const XImage& image) {
    constexpr int nativeOrder = std::endian::native == std::endian::little ? LSBFirst : MSBFirst;
    return image.bits_per_pixel == 32 && image.byte_order == nativeOrder && image.red_mask == 0xFF0000 &&
           image.green_mask == 0xFF00 && image.blue_mask == 0xFF;
}

}  // namespace

struct SharedPicture::Segment {
    explicit Segment(const X11Window& shownIn) : display(shownIn.display()), window(shownIn.id()) {}
    ~Segment();
    Segment(const Segment&) = delete;
    Segment& operator=(const Segment&) = delete;

    bool make(Size size);
    bool attach();

    Display* display;
    ::Window window;
    GC context = nullptr;
    Pixmap background = 0;
    XImage* image = nullptr;
    XShmSegmentInfo info{};
    bool isAttached = false;
};

SharedPicture::Segment::~Segment() {
    if (isAttached)
        XShmDetach(display, &info);
    if (info.shmaddr != nullptr)
        shmdt(info.shmaddr);
    if (image != nullptr) {
        image->data = nullptr;  // which lay in the segment
        XDestroyImage(image);
    }
    if (background != 0)
        XFreePixmap(display, background);
    if (context != nullptr)
        XFreeGC(display, context);
}

bool SharedPicture::Segment::make(Size size) {
    XWindowAttributes attributes{};
    if (XShmQueryExtension(display) == False || XGetWindowAttributes(display, window, &attributes) == 0)
        return false;
    context = XCreateGC(display, window, 0, nullptr);
    image =
        XShmCreateImage(display, attributes.visual, static_cast<unsigned>(attributes.depth), ZPixmap, nullptr,
                        &info, static_cast<unsigned>(size.width), static_cast<unsigned>(size.height));
    if (image == nullptr || !isLikeSurface(*image))
        return false;
    const auto bytes =
        static_cast<std::size_t>(image->bytes_per_line) * static_cast<std::size_t>(size.height);
    info.shmid = shmget(IPC_PRIVATE, bytes, IPC_CREAT | 0600);
    if (info.shmid < 0)
        return false;
    void* address = shmat(info.shmid, nullptr, 0);
    if (std::bit_cast<std::intptr_t>(address) != -1) {
        info.shmaddr = image->data = static_cast<char*>(address);
        isAttached = attach();
    }
    shmctl(info.shmid, IPC_RMID, nullptr);  // it goes with the last who is attached
    return isAttached;
}

// Gets what the server has to have for the picture, which it may refuse.
bool SharedPicture::Segment::attach() {
    static bool isRefused;
    isRefused = false;
    XSync(display, False);
    const auto before = XSetErrorHandler([](Display*, XErrorEvent*) {
        isRefused = true;
        return 0;
    });
    XShmAttach(display, &info);
    background = XCreatePixmap(display, window, static_cast<unsigned>(image->width),
                               static_cast<unsigned>(image->height), static_cast<unsigned>(image->depth));
    XSync(display, False);
    XSetErrorHandler(before);
    return !isRefused;
}

std::unique_ptr<SharedPicture> SharedPicture::of(const X11Window& window, Size size) {
    auto segment = std::make_unique<Segment>(window);
    if (!segment->make(size))
        return nullptr;
    return std::unique_ptr<SharedPicture>(new SharedPicture(std::move(segment)));
}

SharedPicture::SharedPicture(std::unique_ptr<Segment> segment) : segment_(std::move(segment)) {}

SharedPicture::~SharedPicture() = default;

Size SharedPicture::size() const {
    return {segment_->image->width, segment_->image->height};
}

void SharedPicture::show(const Surface& picture, Magnifier& magnifier) {
    const Segment& own = *segment_;
    magnifier.show(picture, reinterpret_cast<std::uint32_t*>(own.image->data), own.image->bytes_per_line);
    XShmPutImage(own.display, own.background, own.context, own.image, 0, 0, 0, 0,
                 static_cast<unsigned>(own.image->width), static_cast<unsigned>(own.image->height), False);
    XSetWindowBackgroundPixmap(own.display, own.window, own.background);
    XClearWindow(own.display, own.window);
    XFlush(own.display);
}

}  // namespace quabble
