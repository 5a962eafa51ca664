#pragma once

#include "platform/message_loop.hpp"

namespace quabble {

// Tells the user, until he closes the message, that the registry could not be opened; in front of the owner,
// if there is one.
Task<> showStoreMessage(MessageLoop& loop, Window* owner);

}  // namespace quabble
