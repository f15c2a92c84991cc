#include <cstdint>
#include <cstdlib>

#include "tools/devices/ber_tree.h"

// Makes a tree of each input, as onramp-devices does of a device's reply. The tree must be empty
// for an empty input, and end with a line feed for any other.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  const std::string tree = onramp::devices::berTree({data, size});
  if (tree.empty() != (size == 0) || (size != 0 && tree.back() != '\n')) std::abort();
  return 0;
}
