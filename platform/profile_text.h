// The text of an initialisation file: sections in brackets, one key=value a line.
#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace platform {

// Brings names to the form in which two that are the same are equal.
using FoldName = std::string (*)(std::string);

// The value of the first such key in the first such section, as GetPrivateProfileStringA finds it, however long;
// nothing when there is none.
std::optional<std::string> FindProfileValue(std::string_view content, const std::string& section,
                                            const std::string& key, FoldName fold);

}  // namespace platform
