// Resolutions, and what lengths are at them.
#pragma once

#include <windows.h>

namespace platform {

inline constexpr int TwipsPerInch = 1440;
inline constexpr int UsualDpi = 96;  // 15 twips a pixel

// The whole screen's, in which all places on it are converted, whatever monitor they are on.
int DpiOfScreen();
int DpiOfWindow(HWND window);

inline int ToPixels(int twips, int dpi) { return ::MulDiv(twips, dpi, TwipsPerInch); }
inline int ToTwips(int pixels, int dpi) { return ::MulDiv(pixels, TwipsPerInch, dpi); }

// What so many pixels at UsualDpi are at another resolution.
inline int Scaled(int pixels, int dpi) { return ::MulDiv(pixels, dpi, UsualDpi); }

}  // namespace platform
