// What a program has that is started on a console: its command line and its standard streams.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace platform {

struct Argument {
  std::string Utf8;
  std::optional<std::string> Ansi;  // nothing when the code page lacks one of its characters
};

// What stands on the command line behind the program's own name, as the system takes it apart.
std::vector<Argument> CommandLineArguments();

enum class Stream { Output, Error };

// Whether the stream goes to a console, and not to a file or to another program.
bool IsConsole(Stream stream);

// Writes a text that is in UTF-8 and whose lines end with CR LF. A console shows it whatever code page it has;
// elsewhere its bytes are written as they are. False when not all of it could be written; a stream that is not there
// takes all.
bool WriteStream(Stream stream, std::string_view utf8);

// Milliseconds since the machine was started.
std::uint64_t GetTickCount64();

}  // namespace platform
