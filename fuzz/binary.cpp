// Binary property lists. The seeds and the dictionary keep the inputs to the format; the reader
// itself finds out which one it has before it.
#include <cstdint>

#include "fuzz/property_list_checks.hpp"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  fuzz::checkReading({reinterpret_cast<const char*>(data), size});
  return 0;
}
