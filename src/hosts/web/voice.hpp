#pragma once

#include <map>
#include <string>
#include <string_view>
#include <vector>

#include "platform/front_end.hpp"
#include "platform/place.hpp"

namespace quabble {

// Tells the page what is to be read beside the pictures, and what is to be said aloud. Of what it has told
// before only changes are told, and nothing is said twice.
class Voice {
 public:
    // Something has happened; it is said with the next telling.
    void say(std::string_view words);

    // What there is to be seen of the window that takes input. Another screen of it is said; where another
    // window comes, the browser reads its name. What a dialog says is said when it appears.
    void tell(WindowId window, bool isDialog, Size clientSize, const Description& description);

    void close(WindowId window) { told_.erase(window); }

    // For somebody who asks: the screen, and all texts and rows of a table on it.
    void sayHowItStands(WindowId window) const;

    // The middle of one of the places of the window, by its number; outside the window when there is none.
    Point middleOf(WindowId window, std::size_t place) const;

 private:
    void tellPlaces(WindowId window, Size clientSize, const std::vector<Place>& before,
                    const std::vector<Place>& now) const;
    static std::string textsOf(const Description& description, Place::Role role);

    std::map<WindowId, Description> told_;
    WindowId focused_ = WindowId::none;
    std::string said_;
};

}  // namespace quabble
