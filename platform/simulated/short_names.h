// Names in 8.3 form.
#pragma once

#include <functional>
#include <string>

namespace platform::simulated {

// Whether the name itself is in 8.3 form, letter case aside.
bool IsShortName(const std::string& name);

// The 8.3 form of another name: the first for which `taken` is false.
std::string MakeShortName(const std::string& name, const std::function<bool(const std::string&)>& taken);

}  // namespace platform::simulated
