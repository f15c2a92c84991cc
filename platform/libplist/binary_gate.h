#pragma once

#include <string_view>

#include "base/parse_problem.h"

namespace onramp::libplist {

/// Whether `bytes` are a binary property list that libplist can build within the limits: every
/// object that its root leads to is one of a known kind and lies inside the object area, no
/// container holds itself, and what the shared references expand to is neither too much nor too
/// deep. Nothing is built to find out. The format is the one of "bplist00": a header, objects, a
/// table of their offsets and a trailer of 32 bytes.
/// `problem` learns why bytes are refused.
[[nodiscard]] bool mayReadBinary(std::string_view bytes, ParseProblem& problem);

}  // namespace onramp::libplist
