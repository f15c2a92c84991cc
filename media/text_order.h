#pragma once

#include <string>
#include <vector>

namespace onramp {

/// Sorts texts in ascending order with the case of the letters A to Z ignored; other characters
/// compare by code point. Texts that differ in case only keep their order.
void sortIgnoringCase(std::vector<std::string>& texts);

}  // namespace onramp
