// Base64 as RFC 4648 has it, in its one canonical form: padded, without line ends.
#pragma once

#include <optional>
#include <string>
#include <string_view>

std::string EmBase64(std::string_view Bytes);

// Nothing for a text that EmBase64 would not have made.
std::optional<std::string> DeBase64(std::string_view Texto);
