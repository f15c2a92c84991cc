#pragma once

#include <string_view>

#include "base/parse_problem.h"

namespace onramp::libplist {

/// Returns whether `bytes` are a binary property list that libplist can read within the limits in
/// platform/property_list.h. The format is "bplist00": a header, objects, a table of their offsets
/// and a trailer of 32 bytes. Every object that can be reached from the root must be of a known
/// kind and lie before the table. Keys must be strings, and no UTF-16 string may contain a null
/// character. No container may contain itself. For the limits, a shared object counts once for
/// each reference to it. The check itself builds no objects. If it returns false, it stores the
/// place and the reason in `problem`.
[[nodiscard]] bool mayReadBinary(std::string_view bytes, ParseProblem& problem);

}  // namespace onramp::libplist
