#include <filesystem>
#include <system_error>

#include "app/OnrampOSXAppDelegate.h"
#include "bonjour/KSDevice.h"
#include "media/KSOROSXCD.h"
#include "media/medium.h"
#include "platform/bundle.h"
#include "platform/folders.h"
#include "platform/lowercase.h"
#include "platform/property_list.h"
#include "platform/user_locale.h"

namespace onramp {

namespace {

namespace fs = std::filesystem;

constexpr const char* kModel = "Model";
constexpr const char* kInterface = "Interface";

// Returns a file name such as "com.vendor.kind.plist".
std::string fileName(const std::string& vendor, const std::string& kind) {
  return "com." + lowercaseString(vendor) + "." + kind + ".plist";
}

// Makes `folder` writable for every user, because other users and the installer must be able to
// replace the files in it. Does nothing if the path is longer than PATH_MAX allows on macOS.
void openToEveryone(const std::string& folder) {
  constexpr std::size_t kPathBufferSize = 1024;  // bytes, including the terminating zero
  if (folder.size() >= kPathBufferSize) return;
  std::error_code ignored;
  fs::permissions(folder, fs::perms::all, ignored);
}

void setDefault(Dictionary& options, const char* key) {
  if (!options.find(key)) options = options.with(key, false);
}

// Returns the entry for the user's country in the application's SupportedKOL.plist. Returns false
// when the medium does not offer the online service or the country has no entry.
Value onlineServiceOption(const Dictionary& options) {
  const Value* const offered = options.find("PKG_KestrelOnline");
  if (!offered || offered->boolean() == false) return false;
  const auto path = Bundle::main().pathForResource("SupportedKOL", "plist");
  const auto resource = path ? loadDictionary(*path) : std::nullopt;
  const auto countries = resource ? resource->dictionary("Country") : std::nullopt;
  const Value* const entry = countries ? countries->find(localeCountryCode()) : nullptr;
  return entry ? *entry : Value(false);
}

bool fontSetOption(const Dictionary& options) {
  if (!options.find("PKG_FontSet")) return false;
  const std::string language = localeLanguageCode();
  return language == "ja" || language == "ko" || language == "zh";
}

// In medium and device records, an empty string means that the value is unknown.
std::optional<std::string> knownText(const Dictionary& record, std::string_view key) {
  std::optional<std::string> text = record.string(key);
  return text && !text->empty() ? text : std::nullopt;
}

std::optional<std::string> firstAddress(const Dictionary& device) {
  const Array* const addresses = device.array(KSDevice::kIPAddressList);
  if (!addresses || addresses->empty()) return std::nullopt;
  const auto* const address = addresses->front().as<std::string>();
  return address ? std::optional(*address) : std::nullopt;
}

}  // namespace

std::string OnrampOSXAppDelegate::setVenderName() {
  return medium::vendorName(medium::loadResourceDictionary());
}

std::string OnrampOSXAppDelegate::InstallPKGInfoURL() {
  const std::string vendor = setVenderName();
  const std::string folder = applicationSupportFolder(FolderDomain::kLocal) + "/" + vendor + "/";
  std::error_code ignored;
  if (!fs::exists(folder, ignored)) {
    fs::create_directories(folder, ignored);
    openToEveryone(folder);
  }
  return folder + fileName(vendor, "installpkginfo");
}

std::string OnrampOSXAppDelegate::instmodelPlistURL() {
  const std::string vendor = setVenderName();
  const std::string folder = applicationSupportFolder(FolderDomain::kUser) + "/" + vendor + "/";
  std::error_code ignored;
  fs::create_directories(folder, ignored);
  return folder + fileName(vendor, "instmodel");
}

void OnrampOSXAppDelegate::copyCDInfo() {
  const auto info = medium::loadNamedDictionary(medium::loadResourceDictionary(), medium::kCDInfo);
  Dictionary options = info ? info->dictionary("InstallPKG").value_or(Dictionary()) : Dictionary();
  setDefault(options, "PKG_WebLink");
  options = options.with("PKG_KestrelOnline", onlineServiceOption(options));
  setDefault(options, "PKG_RemoteTool");
  setDefault(options, "PKG_LabelTool");
  options = options.with("PKG_FontSet", fontSetOption(options));
  writeDictionaryAtomically(options, InstallPKGInfoURL());
}

Dictionary OnrampOSXAppDelegate::instmodelPlistNotWiFi(const std::string& model) {
  return Dictionary{{kModel, model}, {kInterface, "Default"}};
}

Dictionary OnrampOSXAppDelegate::instmodelPlistWiFi(const std::optional<std::string>& model,
                                                    const std::optional<Dictionary>& property) {
  const auto type = knownText(KSOROSXCD::initWithCDInfo(), KSOROSXCD::kBonjourServiceType);
  if (property) {
    const auto name = knownText(*property, KSDevice::kDisplayName);
    const auto address = firstAddress(*property);
    if (name && type && address) {
      const Dictionary bonjour{{"name", *name}, {"type", *type}, {"domain", "local."}};
      const Dictionary network{{"Bonjour", bonjour}, {"IP address", *address}};
      return Dictionary{{kModel, property->string(KSDevice::kModelName).value_or("")},
                        {kInterface, "WiFi"},
                        {"Network", network}};
    }
  }
  return instmodelPlistNotWiFi(model.value_or(""));
}

}  // namespace onramp
