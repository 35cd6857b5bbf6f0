// The order of the user's language, for many texts at once.
#pragma once

#include <cstddef>
#include <string>
#include <vector>

namespace platform {

// Where each text stands that comes first, second and so on, positions from 0, in the order of CompareStringA; texts
// that are equal there, in the order of their bytes.
std::vector<std::size_t> InOrder(const std::vector<const std::string*>& texts);

}  // namespace platform
