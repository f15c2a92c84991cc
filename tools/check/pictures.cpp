#include <png.h>

#include <algorithm>
#include <array>
#include <filesystem>
#include <string_view>
#include <system_error>
#include <vector>

#include "platform/posix/file.h"
#include "tools/check/checks.h"

namespace onramp::check {

namespace {

struct Picture {
  const char* name;
  std::uint32_t width;
  std::uint32_t height;
  const char* effect;
};

constexpr std::array kConnectionPictures{
    Picture{"wirelessLan.png", 192, 192, "no picture beside the wireless network"},
    Picture{"usb.png", 192, 192, "no picture beside USB"},
    Picture{"wiredLan.png", 192, 192, "no picture beside USB and the wired network"},
};
constexpr Picture kBackground{"Background.png", 680, 480, "a window without a background picture"};
constexpr Picture kDenseBackground{"Background@2x.png", 1360, 960,
                                   "a blurred background on screens with two pixels per point"};

// The size of a picture in pixels, and the reason why the picture cannot be shown.
struct Decoded {
  std::uint32_t width = 0;
  std::uint32_t height = 0;
  std::string problem{};  ///< empty for an intact picture
};

// A PNG picture that libpng reads from memory. `bytes` must outlive the object.
class Image {
 public:
  explicit Image(const std::string& bytes) {
    image_.version = PNG_IMAGE_VERSION;
    png_image_begin_read_from_memory(&image_, bytes.data(), bytes.size());
  }
  Image(const Image&) = delete;
  Image& operator=(const Image&) = delete;
  ~Image() { png_image_free(&image_); }

  Decoded decode() {
    constexpr std::uint64_t kMostPixels = std::uint64_t{1} << 24;
    Decoded decoded{.width = image_.width, .height = image_.height};
    const bool large = std::uint64_t{image_.width} * image_.height > kMostPixels;
    if (image_.warning_or_error <= 1 && large)
      decoded.problem = "more pixels than any page has room for";
    if (image_.warning_or_error <= 1 && !large) {
      image_.format = PNG_FORMAT_RGBA;
      std::vector<png_byte> pixels(PNG_IMAGE_SIZE(image_));
      png_image_finish_read(&image_, nullptr, pixels.data(), 0, nullptr);
    }
    if (image_.warning_or_error > 1) decoded.problem = static_cast<const char*>(image_.message);
    return decoded;
  }

 private:
  png_image image_ = {};
};

void checkPicture(const MediumFiles& files, const std::string& folder, const Picture& picture) {
  constexpr std::size_t kMostBytes = std::size_t{32} << 20;
  const std::string path = folder + "/" + picture.name;
  Finding finding{.place = {.file = path}, .effect = picture.effect};
  if (!files.exists(path, {finding.place, "the picture", picture.effect})) return;
  const std::string size =
      std::to_string(picture.width) + " × " + std::to_string(picture.height) + " pixels";
  const auto bytes = posix::readFile(files.fullPath(path), kMostBytes);
  const Decoded decoded =
      bytes ? Image(*bytes).decode() : Decoded{.problem = "the file cannot be read"};
  if (!decoded.problem.empty()) {
    finding.id = "picture-unreadable";
    finding.found = "not an intact PNG picture (" + decoded.problem + ")";
    finding.expected = "a PNG picture of " + size;
    finding.remedy = "save the picture again as PNG";
  } else if (decoded.width != picture.width || decoded.height != picture.height) {
    finding.id = "picture-size";
    finding.severity = Severity::kWarning;
    finding.found = "a picture of " + std::to_string(decoded.width) + " × " +
                    std::to_string(decoded.height) + " pixels";
    finding.expected = size;
    finding.effect = "the picture is scaled and looks blurred or distorted";
    finding.remedy = "save the picture at that size";
  }
  if (!finding.id.empty()) files.report().findings.push_back(std::move(finding));
}

}  // namespace

void checkPictures(const MediumFiles& files) {
  for (const Picture& picture : kConnectionPictures)
    checkPicture(files, "MacResources/Images", picture);
  const std::string& application = files.report().application;
  if (application.empty()) return;
  const std::string resources = application + "/Contents/Resources";
  checkPicture(files, resources, kBackground);
  const std::vector<std::string> names = files.names(resources);
  if (std::binary_search(names.begin(), names.end(), kDenseBackground.name)) {
    checkPicture(files, resources, kDenseBackground);
    return;
  }
  files.report().findings.push_back({.id = "picture-not-dense",
                                     .severity = Severity::kWarning,
                                     .place = {.file = resources},
                                     .found = "no " + quoted(kDenseBackground.name),
                                     .expected = "a background of 1360 × 960 pixels",
                                     .effect = kDenseBackground.effect,
                                     .remedy = "add the picture"});
}

}  // namespace onramp::check
