#pragma once

#include <bitset>

namespace quabble {

// Tells a key press that is meant for a window from the repetition of one that was meant for another: a key
// that is still down when a dialog opens or closes goes on repeating in the window that has the keyboard
// then. Keys have the desktop's numbers. Where it is not known which keys are held, every press is meant.
class HeldKeys {
 public:
    using Keys = std::bitset<256>;

    // The keyboard goes to another window. Which keys are down then may be told right after it.
    void changeWindow();
    void areDown(const Keys& keys);

    void press(unsigned key);
    void release(unsigned key);

    // Whether the window that has the keyboard should hear what is typed.
    bool isMeant() const { return isMeant_; }

 private:
    Keys held_;  // since before the window had the keyboard
    bool isAsked_ = false;
    bool isMeant_ = true;
};

}  // namespace quabble
