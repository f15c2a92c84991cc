#include <filesystem>

#include "platform/bundle.h"
#include "platform/outlets.h"

namespace onramp {

std::optional<Image> Image::named(const std::string& fileName) {
  const std::filesystem::path name(fileName);
  std::string extension = name.extension().string();
  if (!extension.empty()) extension.erase(0, 1);
  const auto path = Bundle::main().pathForResource(name.stem().string(), extension);
  return path ? std::optional(Image{*path}) : std::nullopt;
}

}  // namespace onramp
