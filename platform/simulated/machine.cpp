#include "platform/simulated/machine.h"

#include <memory>
#include <utility>

namespace platform::simulated {

Machine& TheMachine() {
  // Never destroyed: the program's own global objects may still close files when it ends.
  static Machine& machine = *std::make_unique<Machine>().release();
  static bool fresh = false;
  if (!std::exchange(fresh, true)) Reset();
  return machine;
}

bool Fails() {
  Machine& machine = TheMachine();
  if (machine.FaultReached && machine.NextFault != Fault::Once) return true;
  if (machine.CallsUntilFault == 0 || --machine.CallsUntilFault > 0) return false;
  machine.FaultReached = true;
  if (machine.NextFault == Fault::PowerCut) CutPower();
  return true;
}

void FailCall(int n, Fault fault) {
  TheMachine().CallsUntilFault = n;
  TheMachine().NextFault = fault;
  TheMachine().FaultReached = false;
}

bool CallFailed() { return TheMachine().FaultReached; }

void Reset() {
  Machine fresh;
  fresh.LastHandle = TheMachine().LastHandle;
  TheMachine() = std::move(fresh);
  AddDisk('C', std::uint64_t{10} << 30);
  SetProgramDirectory("C:\\Tolvaris");
}

}  // namespace platform::simulated
