// The state of the machine in memory, all of it in one place.
#pragma once

#include <cstdint>
#include <deque>
#include <functional>
#include <map>
#include <memory>
#include <set>
#include <string>
#include <vector>

#include "platform/console.h"
#include "platform/files.h"
#include "platform/messages.h"
#include "platform/simulated/disks.h"
#include "platform/simulated/screen.h"
#include "platform/simulated/simulated.h"

namespace platform::simulated {

struct RegistryRecord {
  std::string Name;  // full path as written
  struct Value {
    std::string Name;
    RegistryValue Stored;
  };
  std::map<std::string, Value> Values;  // by name in upper case
};

struct RegistryHandle {
  std::string Path;  // in upper case
  std::uint32_t Access = 0;
};

struct ProcessBehaviour {
  std::string Program;
  bool Refuses;
  int Waits;
  std::function<void()> Run;
};

struct RunningProcess {
  bool RunsForEver = false, Ended = false;
  int WaitsLeft = 0;
  std::function<void()> Run;
};

struct QueuedAnswer {
  Answer Given;
  std::function<void()> Meanwhile;
};

struct QueuedEvent {
  std::uint64_t Number;
  std::function<void()> Run;
};

struct Machine {
  std::map<char, std::shared_ptr<Disk>> Disks;
  std::string ProgramDirectory = "C:\\";
  bool ShortNames = true, HasRecycleBin = true;
  std::vector<std::string> RecycleBin;  // full paths
  unsigned CodePage = 1252;
  std::map<std::intptr_t, OpenFile> OpenFiles;
  std::map<std::string, std::uint64_t> Writes;  // by full path in upper case
  std::uint64_t WritesEver = 0;
  std::uint64_t Clock = 1'000'000, StartTime = 0;  // seconds: now, and when the machine was started

  std::map<std::string, RegistryRecord> Registry;  // by full path in upper case
  std::set<std::string> DeniedKeys;
  std::map<std::intptr_t, RegistryHandle> RegistryHandles;

  int CallsUntilFault = 0;
  Fault NextFault = Fault::Once;
  bool FaultReached = false;

  std::vector<StartedProcess> Started;
  std::vector<ProcessBehaviour> Behaviours;  // the latest counts
  std::set<std::string> ForAdministrators;   // programs, by full path in upper case
  std::map<std::intptr_t, RunningProcess> Processes;

  std::map<std::string, std::string> Environment;  // by name in upper case

  int KeysMade = 0;

  std::vector<Argument> Arguments;
  std::map<Stream, std::string> Streams;  // what was written
  bool HasConsole = false;
  std::uint64_t Ticks = 0;  // milliseconds

  std::deque<QueuedAnswer> Answers;
  std::vector<ShownMessage> Messages;
  std::deque<std::string> DialogPaths;
  std::vector<OpenFileName> Dialogs;
  std::deque<std::function<void(Window&)>> ModalScripts;
  std::deque<QueuedEvent> Events;
  std::uint64_t EventsQueued = 0;
  int PendingRuns = 0;
  bool PendingEventsRun = false;  // in a call that is under way, and in no modal turn or event loop begun since

  std::vector<std::shared_ptr<WindowFacts>> Windows;  // those that exist, in order of creation
  std::shared_ptr<WindowFacts> MainWindow;
  std::vector<const WindowFacts*> Modal;  // the last one alone takes input; null: a message box or a file dialog
  bool RefusesWindows = false;
  int DroppedExceptions = 0;
  std::uint64_t Slept = 0;  // milliseconds
  Bounds PrimaryMonitor = {0, 0, 15360, 11520};
  std::vector<Bounds> OtherMonitors;

  std::intptr_t LastHandle = 0;  // of all kinds; goes on over Reset, so that no old handle means something new
};

Machine& TheMachine();

// Counts a call that can fail; true when it is to fail.
bool Fails();

}  // namespace platform::simulated
