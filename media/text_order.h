#pragma once

#include <string>
#include <vector>

namespace onramp {

/// Sorts `texts` in ascending order of their code points, ignoring the case of the letters A to Z.
/// Strings that differ only in the case of these letters keep their order.
void sortIgnoringCase(std::vector<std::string>& texts);

}  // namespace onramp
