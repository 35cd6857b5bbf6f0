// Message boxes and the dialogs that ask for a file name.
#pragma once

#include <cstddef>
#include <cstdint>
#include <string>

namespace platform {

class Window;

enum class Buttons { Ok, YesNoCancel, RetryCancel };
enum class Icon { Critical, Question, Exclamation, Information };
enum class Answer { Ok, Cancel, Retry, Yes, No };

// Shows a modal message over the program's active window and waits for the answer. Closing it answers Cancel where
// there is such a button, else Ok.
Answer MessageBoxA(const std::string& text, const std::string& title, Buttons buttons, Icon icon);

// What the file dialogs are asked; the fields of the platform's own request that the program sets.
struct OpenFileName {
  const Window* Owner = nullptr;
  std::string Filter;            // pairs of label, NUL, patterns, NUL
  std::string File;              // first contents of the file buffer
  std::size_t FileSize = 0;      // size of the file buffer in characters, its closing NUL included
  std::string InitialDirectory;  // empty: the platform's choice
  std::string Title;
  std::uint32_t Flags = 0;
  std::string DefaultExtension;  // empty: none
};

inline constexpr std::uint32_t HideReadOnly = 4;  // OFN_HIDEREADONLY

// Shows the dialog. True: `request.File` holds the file buffer up to its first NUL. False: cancelled, or failed, for
// instance because the path does not fit the buffer, or because the buffer at first holds a name that no file can have.
// What comes back may end with all of DefaultExtension, where that names several.
bool GetOpenFileNameA(OpenFileName& request);
bool GetSaveFileNameA(OpenFileName& request);

}  // namespace platform
