// COM, which the window thread alone uses.
#pragma once

#include <windows.h>

namespace platform {

// Makes COM ready for the thread, once; objects then live to the thread's end. False when it cannot be.
bool PrepareCom();

// A new object of a class of this process, which belongs to the caller; null when Windows has none.
void* CreateObject(REFCLSID classId, REFIID interfaceId);

}  // namespace platform
