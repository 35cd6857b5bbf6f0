// What libFuzzer calls with one input after the other.
#include "tests/fuzz/target.h"

#include <cstdint>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* bytes, std::size_t length) {
  Test({reinterpret_cast<const char*>(bytes), length});
  return 0;
}
