#include "app/app_state.hpp"

namespace quabble {

AppState::AppState(MessageLoop& messageLoop, std::uint64_t seed) : loop(messageLoop), random(seed) {}

MainWindow& AppState::frmQuabble() {
    if (!frmQuabble_)
        frmQuabble_ = std::make_unique<MainWindow>(*this);
    return *frmQuabble_;
}

ResultDialog& AppState::diagWow() {
    if (!diagWow_)
        diagWow_ = std::make_unique<ResultDialog>(loop, frmQuabble(), game, layoutUnit);
    return *diagWow_;
}

}  // namespace quabble
