#include "app/store_message.hpp"

#include <string>

#include "gfx/message_dialog.hpp"
#include "store/version.hpp"

namespace quabble {

Task<> showStoreMessage(MessageLoop& loop, Window* owner) {
    MessageDialog message(loop, owner, std::string(applicationTitle), " Error Failerd");
    co_await loop.showModal(message);
}

}  // namespace quabble
