#pragma once

#include <string>

#include "platform/interface_file.h"
#include "tests/recording/front_end.h"

namespace onramp::recording {

/// The live object of that name that was loaded last, or null.
[[nodiscard]] Object* findLiveObject(const std::string& name);

/// Whom the interface file with `object` was loaded for.
[[nodiscard]] InterfaceOwner& ownerOf(const Object& object);

}  // namespace onramp::recording
