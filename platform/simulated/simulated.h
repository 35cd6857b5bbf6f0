// The test's side of the machine in memory: what stands on its disks and in its registry, what its user does, and what
// goes wrong. Only tests include this. Reset() first: every test starts on a fresh machine. A test that puts something
// on a disk that cannot be there gets a std::logic_error.
#pragma once

#include <cstddef>
#include <cstdint>
#include <functional>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "platform/console.h"
#include "platform/controls.h"
#include "platform/messages.h"

namespace platform::simulated {

// A machine with an empty disk C: (10 GB free), the program in C:\Tolvaris, no drive A:, an empty registry and a user
// with no answers queued. Nothing fails.
void Reset();

// --- Disks. Paths match without regard to letter case; attribute sets are those of platform/files.h.

void AddDisk(char letter, std::uint64_t freeBytes);  // an empty disk; also "a disk is put into the drive"
void RemoveDisk(char letter);                        // with all that is on it
void SetFreeSpace(char letter, std::uint64_t bytes);
void SetProgramDirectory(const std::string& directory);
void KeepNoShortNames();  // from now on no file and no directory gets one, as on a disk that is set up so

void KeepNoRecycleBin();              // the shell cannot recycle any more
std::vector<std::string> Recycled();  // full paths of what was put into the recycle bin, in order

void PutDirectory(const std::string& path, std::uint32_t attributes = 0x10);                       // with its parents
void PutFile(const std::string& path, std::string_view content, std::uint32_t attributes = 0x20);  // with its parents
// A file whose name has letters that the code page lacks, each a "?" here: only its short name leads to it, if any.
void PutForeignFile(const std::string& path, std::string_view content);
void SetAttributes(const std::string& path, std::uint32_t attributes);  // if it exists
// As if another program held it: it cannot be opened, renamed, replaced or deleted.
void LockFile(const std::string& path, bool locked = true);
void RemoveFile(const std::string& path);
std::optional<std::string> Content(const std::string& path);  // of a file; nothing when there is none
bool DirectoryStands(const std::string& path);
std::vector<std::string> AllFiles();                // full paths, ascending
std::uint64_t WriteCount(const std::string& path);  // how often the file's content was changed or replaced, ever
std::uint64_t WritesEver();                         // all files together

std::size_t OpenFiles();  // how many the program holds open

void TakeNoNewFiles(const std::string& directory);  // nothing can be created there; what is there can be written
void PassTime(std::uint64_t seconds);               // of the clock that tells when files were changed
void SetAge(const std::string& path, std::uint64_t seconds);  // since the file's last change

// The machine is started anew. Contents that were not flushed to the disk (by File::Flush) are as they were before;
// open files are closed. A file that was created or emptied but never flushed since is half written. Names are always
// on the disk: what was deleted is gone, and what was renamed has its new name, with whatever content was flushed.
void CutPower();

// --- Registry, below HKEY_CURRENT_USER.

struct RegistryValue {
  std::uint32_t Type = 0;
  std::string Data;  // the stored bytes
};
void PutValue(const std::string& key, const std::string& name, std::uint32_t type, std::string_view data);
void PutText(const std::string& key, const std::string& name, const std::string& text);  // REG_SZ with its zero
std::optional<RegistryValue> StoredValue(const std::string& key, const std::string& name);
std::optional<std::string> StoredText(const std::string& key, const std::string& name);  // a REG_SZ without its zero
std::vector<std::string> Keys();                                                         // every key's full path
void DenyKey(const std::string& key, bool denied = true);  // can no longer be opened, or created
std::size_t OpenRegistryHandles();                         // that the program has not closed yet

// --- Faults.

enum class Fault {
  Once,
  FromThenOn,  // all later calls fail as well
  PowerCut     // the power goes before the call does anything, and all later calls fail
};

// The n-th call (from 1) that can fail, counted from now, fails: of files, disks, registry, initialisation files,
// pictures, processes, hashes, signatures and streams. A write that fails has written half of its bytes. 0: none. Reset
// by Reset().
void FailCall(int n, Fault fault = Fault::Once);
bool CallFailed();  // whether the fault has been reached

// --- Other programs.

struct StartedProcess {
  std::string CommandLine, Directory;
  std::uint32_t CreationFlags;
  std::string Verb;  // what the shell was asked for; empty: the program was started without it
};
const std::vector<StartedProcess>& StartedProcesses();

// What happens when a command line that starts with `program` is started: `run` is called when the process is waited
// for the `waits`-th time (or at its start when 0), and then it has ended. A program that is not a file on a disk does
// not start; one that is, but was not given a behaviour, runs for ever.
void OnProcess(const std::string& program, int waits, std::function<void()> run);
void RefuseToStart(const std::string& program);         // also: the person does not let it run as an administrator
void RequireAdministrator(const std::string& program);  // the shell alone can start it
std::size_t HeldProcesses();                            // how many Process objects still stand for a started program

// --- The code page: 1252 after Reset.

// 932 or 65001 from now on, of which the machine knows where a character begins, and the ASCII letters. Files and texts
// are taken to be in it.
void SetCodePage(unsigned page);

// --- The environment: empty after Reset.

void SetEnvironment(const std::string& name, const std::string& value);

// --- The console: after Reset there are no arguments, and the streams are redirected.

void SetArguments(const std::vector<std::string>& utf8);
void UseConsole();                      // both streams go to one
std::string TakeStream(Stream stream);  // what was written since the last call, UTF-8

// --- The user.

struct ShownMessage {
  std::string Text, Title;
  Buttons Choice;
  Icon Symbol;
  bool operator==(const ShownMessage&) const = default;
};
// Answers to message boxes, in order. With none queued, or one that the message has no button for, a message gets Ok,
// or Cancel where there is no Ok.
void QueueAnswer(Answer answer);
void QueueAnswer(Answer answer, std::function<void()> meanwhile);  // what happens before the answer is given
const std::vector<ShownMessage>& ShownMessages();
void ForgetMessages();

void QueueFileDialog(const std::string& path);  // what the next file dialog ends with; empty, or none queued: Cancel
const std::vector<OpenFileName>& ShownFileDialogs();  // as they were asked

// Runs when the next modal window is shown, as the user in front of it. The window closes afterwards if the script did
// not close it. With none queued a modal window is closed at once.
void QueueModal(std::function<void(Window&)> script);

// Events that wait: each runs the next time that the program lets pending events run (all that wait at that moment,
// in order), and not in a handler that such events have brought. Pending() tells how many are left.
void QueueEvent(std::function<void()> event);
int Pending();
int PendingEventRuns();  // how often the program has let pending events run since Reset

// What a user's hand does; nothing on a control or window that is disabled, hidden (also: not shown yet), closed, or
// behind a modal window, a message or a file dialog. A control that is clicked gets the keyboard focus.
void Click(Button& button);
void Click(ImageButton& button);
void Click(CheckBox& box);              // changes its value
void Choose(ListBox& list, int index);  // selects and clicks
void Choose(ComboBox& box, int index);
void DoubleClick(ListBox& list);
void PressKey(ListBox& list, int keyCode);              // up 38, down 40, home 36 and end 35 also move the selection
void HoldKey(ListBox& list, int keyCode, int repeats);  // pressed, and repeated so many times before it is released
void CloseWindow(Window& window);                       // its close box
void PressHelp(Window& window);                         // F1
void Tick(Timer& timer);                                // one tick, when the timer is enabled

// --- What stands on the screen.

bool IsShown(const Window& window);
Window* WindowFromHandle(std::int32_t handle);           // null when there is none
std::vector<Control*> ControlsOf(const Window& window);  // in order of creation
Bounds BoundsOf(const Control& control);                 // in the window's client area; a label's size is 0
const Control* Focused();                     // the active window's control that has the keyboard focus, or null
WindowStyle StyleOf(const Window& window);    // as it was made
int IconOf(const Control& control);           // the number of its icon or picture, 0: none
Font FontOf(const Control& control);          // as it was made
bool HasWhiteGround(const Control& control);  // a label that has its own
std::vector<std::string> EntriesOf(const ComboBox& box);
int ResourceOf(const Picture& picture);         // the resource it came from, 0: none
std::string ContentOf(const Picture& picture);  // the file content it came from
std::uint32_t IntervalOf(const Timer& timer);   // milliseconds
int DroppedExceptions();                        // how many have left a handler since Reset
std::uint64_t SleptMilliseconds();              // since Reset; time passes only by sleeping and waiting
void RefuseWindows(bool refused = true);  // the next ones are not made: such a window is closed from the beginning
void AddMonitor(const Bounds& place);     // beside the primary one, which has 15360 x 11520 twips

}  // namespace platform::simulated
