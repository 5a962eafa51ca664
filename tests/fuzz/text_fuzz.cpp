// Turns bytes into what someone types, pastes, marks and deletes in a text box, and into texts that come from
// outside.

#include <cassert>
#include <string>

#include "draw/windows_1252.hpp"
#include "gfx/message_template.hpp"
#include "hosts/headless/headless_front_end.hpp"
#include "platform/text_box.hpp"

namespace quabble {
namespace {

void requireCodePage(const std::string& outside) {
    const std::string inside = windows1252Of(outside);
    assert(inside.size() <= outside.size());
    for (const char character : inside)
        assert(static_cast<unsigned char>(character) >= ' ' && character != 127);
    const std::string again = windows1252Of(utf8Of(inside));
    assert(again.size() == inside.size());
    for (std::size_t i = 0; i < inside.size(); ++i)
        assert(again[i] == inside[i] || again[i] == '?');
}

void requireTemplate(const std::string& text) {
    assert(fillText(text, {"no such key", 7, "\x01\x02", "x"}).size() <= text.size());
    const std::string filled = fillText(text, {"|1", 12, "|2", "and", "|3"});
    assert(text.find('|') != std::string::npos || filled == text);
}

void requireSound(const TextBox& box) {
    assert(box.caret() <= box.text().size() && box.anchor() <= box.text().size());
    assert(box.text().size() <= TextBox::maxLength);
}

}  // namespace
}  // namespace quabble

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    using namespace quabble;
    HeadlessFrontEnd frontEnd;
    TextBox box(frontEnd);
    box.font = {Typeface::Sans, 11, false};
    box.area = Rect::ofSize(3, 3, 100, 28);
    for (std::size_t i = 0; i < size;) {
        const std::uint8_t what = data[i++];
        if (what < 96) {
            box.edit(static_cast<EditCommand>(what % 12), what >= 48);
        } else if (what < 128) {
            Task<> pressed = box.mouseDown({what * 5 - 500, 14}, what % 2 == 0);
            pressed.start();
            box.mouseDrag({what % 7 * 20, 14});
        } else {
            const std::size_t length = std::min<std::size_t>(what % 32, size - i);
            const std::string text(reinterpret_cast<const char*>(data) + i, length);
            i += length;
            requireCodePage(text);
            requireTemplate(text);
            if (what % 3 == 0)
                frontEnd.clipboard = text;
            else
                box.textInput(text);
        }
        requireSound(box);
    }
    Canvas canvas({106, 34}, Scale());
    box.paint(canvas, true);
    return 0;
}
