#include "gfx/ok_dialog.hpp"

#include "gfx/ok_button.hpp"
#include "gfx/spoken_words.hpp"

namespace quabble {

std::vector<Place> OkDialog::places() const {
    std::vector<Place> places = textPlaces(textBox_.rect(), text_);
    places.push_back(okPlace(okBox_));
    return places;
}

Task<> OkDialog::Form_MouseDown(float x, float y) {
    if (hitTest(okBox_, x, y))
        unload();
    co_return;
}

Task<> OkDialog::Form_MouseMove(float x, float y) {
    const bool over = hitTest(okBox_, x, y);
    if (over == okBox_.hovered)
        co_return;
    okBox_.hovered = over;
    drawOkButton(canvas(), okBox_);
    refresh();
}

Task<> OkDialog::Form_KeyPress(std::int16_t key) {
    if (key == keys::enter || key == keys::escape)
        unload();
    co_return;
}

}  // namespace quabble
