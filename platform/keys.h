// The keys that the program knows, by Windows' numbers for them.
#pragma once

namespace platform {

inline constexpr int KeyEnter = 13;
inline constexpr int KeyEnd = 35;
inline constexpr int KeyHome = 36;
inline constexpr int KeyUp = 38;
inline constexpr int KeyDown = 40;
inline constexpr int KeyDelete = 46;

}  // namespace platform
