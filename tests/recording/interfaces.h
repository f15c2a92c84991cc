#pragma once

#include <string>

#include "platform/interface_file.h"
#include "tests/recording/front_end.h"

namespace onramp::recording {

/// The most recently loaded object with that name, or null.
[[nodiscard]] Object* findLiveObject(const std::string& name);

/// The owner that the interface file with `object` was loaded for.
[[nodiscard]] InterfaceOwner& ownerOf(const Object& object);

}  // namespace onramp::recording
