#pragma once

#include <string_view>

#include "base/parse_problem.h"

namespace onramp::libplist {

/// Whether `bytes` are a binary property list that libplist can build within the limits. Every
/// object that can be reached from the root must be of a known kind and lie inside the object area,
/// no container may contain itself, and the shared references must not expand to too much or too
/// deep. The check builds nothing. The format is "bplist00": a header, objects, a table of their
/// offsets and a trailer of 32 bytes. When bytes are refused, `problem` says why.
[[nodiscard]] bool mayReadBinary(std::string_view bytes, ParseProblem& problem);

}  // namespace onramp::libplist
