// The event pump of the window thread.
#pragma once

#include <cstdint>

namespace platform {

// Handles every event that waits, and returns at once when none does. In a handler that such a call has brought it only
// draws what has to be drawn, and what the user does waits for the outer call: keys that come faster than they are
// handled would nest without end. A modal window, message or dialog handles events itself, and its handlers may again
// let pending ones run, one level deep.
void RunPendingEvents();

// The same inside an operation that calls it again and again: does nothing when the last time was less than a hundredth
// of a second ago, since a look at the queue can take longer than what is done between two of them.
void RunPendingEventsAtIntervals();

// Handles events until the main window (the first one created) is closed.
void RunEventLoop();

// Does nothing for so many milliseconds.
void Sleep(std::uint32_t milliseconds);

}  // namespace platform
