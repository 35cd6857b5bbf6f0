#include "platform/events.h"

#include <utility>

#include "platform/simulated/machine.h"

namespace platform {
namespace {

using simulated::TheMachine;

void RunNextEvent() {
  const std::function<void()> run = std::move(TheMachine().Events.front().Run);
  TheMachine().Events.pop_front();
  run();
}

}  // namespace

// What waits waits on in a handler that events have brought.
void RunPendingEvents() {
  ++TheMachine().PendingRuns;
  if (TheMachine().PendingEventsRun) return;
  const simulated::EventLevel level(true);
  const std::uint64_t last = TheMachine().EventsQueued;
  while (!TheMachine().Events.empty() && TheMachine().Events.front().Number <= last) RunNextEvent();
}

// No time goes by here between two calls that a test looks at.
void RunPendingEventsAtIntervals() { RunPendingEvents(); }

void RunEventLoop() {
  const simulated::EventLevel level(false);
  const std::shared_ptr<simulated::WindowFacts> window = TheMachine().MainWindow;
  while (!(window && window->Closed) && !TheMachine().Events.empty()) RunNextEvent();
}

void Sleep(std::uint32_t milliseconds) { TheMachine().Slept += milliseconds; }

}  // namespace platform

namespace platform::simulated {

EventLevel::EventLevel(bool pendingEventsRun)
    : pendingEventsRun_(TheMachine().PendingEventsRun), outer_(std::exchange(pendingEventsRun_, pendingEventsRun)) {}

void QueueEvent(std::function<void()> event) {
  TheMachine().Events.push_back({++TheMachine().EventsQueued, std::move(event)});
}

int Pending() { return static_cast<int>(TheMachine().Events.size()); }

int PendingEventRuns() { return TheMachine().PendingRuns; }

std::uint64_t SleptMilliseconds() { return TheMachine().Slept; }

}  // namespace platform::simulated
