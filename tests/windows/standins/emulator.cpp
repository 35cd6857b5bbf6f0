// Stands in for the emulator: leaves word of how it was started, and ends.
#include "tests/windows/standins/recording.h"

int WINAPI WinMain(HINSTANCE, HINSTANCE, LPSTR, int) {
  standins::RecordCall();
  return 0;
}
