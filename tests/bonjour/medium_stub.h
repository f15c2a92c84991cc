#pragma once

#include <cstdint>
#include <optional>
#include <string>

namespace onramp::testing_medium {

/// All that the search asks of medium and system.
struct Medium {
  std::string browsedType = "_ipp._tcp.";
  std::optional<std::int32_t> systemVersion = 0x1095;
};

Medium& medium();

}  // namespace onramp::testing_medium
