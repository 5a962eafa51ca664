#pragma once

#include <cstdint>
#include <string>

#include "app/program.hpp"
#include "hosts/web/page_blob.hpp"
#include "hosts/web/web_front_end.hpp"

#define QUABBLE_EXPORT(name) extern "C" __attribute__((export_name(#name)))

namespace quabble {

// All that lives as long as the page.
struct Running {
    WebFrontEnd frontEnd;
    PageBlob blob;
    BlobRegistryStore registry{blob};
    Program program;
    WindowId windowTold = WindowId::none;
    std::uint64_t picturesTold = 0;

    Running(const Page& page, std::uint64_t seed) : frontEnd(page), program(frontEnd, registry, seed) {
        frontEnd.connect([this](const InputEvent& event) { program.post(event); });
    }

    // What has become of the pictures is told in words, too.
    void tell() {
        const Window* window = program.topmostWindow();
        if (window == nullptr || (windowTold == window->id() && picturesTold == program.picturesShown()))
            return;
        windowTold = window->id();
        picturesTold = program.picturesShown();
        frontEnd.tell(window->id(), window->describe());
    }
};

// What the page has started, and the text that it handed over last.
Running& runningNow();
const std::string& textHandedOver();

}  // namespace quabble
