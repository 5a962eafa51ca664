#pragma once

#include <optional>

#include "platform/front_end.hpp"

namespace quabble {

// Sleeps until the system has something to say, or for a time that is kept to a fraction of a millisecond
// where the system has a timer for that (from Windows 10 on).
class MessageWait {
 public:
    MessageWait();
    ~MessageWait();
    MessageWait(const MessageWait&) = delete;
    MessageWait& operator=(const MessageWait&) = delete;

    // Without a time it waits for ever.
    void sleep(std::optional<Clock::duration> longest) const;

 private:
    void* timer_;
};

}  // namespace quabble
