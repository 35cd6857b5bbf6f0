// The order of texts: a key for each text, so that the keys' bytes sort as the texts do.
#pragma once

#include <string>
#include <string_view>

namespace platform::simulated {

// Equal keys: texts that differ in letter case at most. Compare keys as strings of unsigned bytes.
std::string SortKey(std::string_view text);

}  // namespace platform::simulated
