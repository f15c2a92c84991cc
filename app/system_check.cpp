#include "app/OnrampOSXAppDelegate.h"
#include "base/ascii.h"
#include "media/CommonMessage.h"
#include "platform/alert.h"
#include "platform/system_version.h"

namespace onramp {

namespace {

constexpr const char* kMajor = "Major";
constexpr const char* kMinor = "Minor";
constexpr const char* kBugFix = "BugFix";
constexpr std::string_view kPlaceholder = "%@";

struct SystemVersion {
  std::int64_t major = 0;
  std::int64_t minor = 0;
  std::int64_t bugFix = 0;
};

// Components missing from the version, as in 10.9, count as 0.
SystemVersion runningVersion() {
  const std::vector<std::string> components = OnrampOSXAppDelegate::getSystemVersion();
  const auto component = [&](std::size_t index) {
    return index < components.size() ? leadingInteger(components[index]) : 0;
  };
  return {component(0), component(1), component(2)};
}

std::vector<std::string> split(std::string_view text, std::string_view separator) {
  std::vector<std::string> pieces;
  for (std::size_t at = text.find(separator); at != std::string_view::npos;
       at = text.find(separator)) {
    pieces.emplace_back(text.substr(0, at));
    text.remove_prefix(at + separator.size());
  }
  pieces.emplace_back(text);
  return pieces;
}

std::string minimumText(std::string version) {
  constexpr std::string_view kEnd = ".0";
  if (version.ends_with(kEnd)) version.resize(version.size() - kEnd.size());
  std::string text = localized(
      "INST_TXT_ALERT_OSMIN",
      "Please check the system requirements for your model and install on proper OS version.\n"
      "Please retry it after updating your system to Mac OS X %@ or greater.");
  const std::vector<std::string> pieces = split(text, kPlaceholder);
  if (pieces.size() == 2) return pieces[0] + version + pieces[1];
  if (pieces.size() == 3) return pieces[0] + version + pieces[1] + version + pieces[2];
  return text;
}

}  // namespace

std::vector<std::string> OnrampOSXAppDelegate::getSystemVersion() {
  const std::optional<std::string> version = productVersion();
  return version ? split(*version, ".") : std::vector<std::string>();
}

SystemSupport OnrampOSXAppDelegate::supportedOSMaxCheck() const {
  const SystemVersion system = runningVersion();
  const Dictionary& maximum = mKSInstallerInfo.supportSystemMax();
  const auto newerIf = [](bool newer) {
    return newer ? SystemSupport::kNewerThanMaximum : SystemSupport::kSupported;
  };
  const std::int64_t major = maximum.integerValue(kMajor);
  if (system.major != major) return newerIf(system.major > major);
  const std::int64_t minor = maximum.integerValue(kMinor);
  if (system.minor != minor) return newerIf(system.minor > minor);
  if (asciiLowercased(maximum.string(kBugFix).value_or("")) == "x") {
    return SystemSupport::kSupported;
  }
  // This bound is exclusive, unlike the other two.
  return newerIf(system.bugFix >= maximum.integerValue(kBugFix));
}

SystemSupport OnrampOSXAppDelegate::supportedOSMinCheck() const {
  const SystemVersion system = runningVersion();
  const Dictionary& minimum = mKSInstallerInfo.supportSystemMin();
  const auto olderIf = [](bool older) {
    return older ? SystemSupport::kOlderThanMinimum : SystemSupport::kSupported;
  };
  const std::int64_t major = minimum.integerValue(kMajor);
  if (system.major != major) return olderIf(system.major < major);
  const std::int64_t minor = minimum.integerValue(kMinor);
  if (system.minor != minor) return olderIf(system.minor < minor);
  return olderIf(system.bugFix < minimum.integerValue(kBugFix));
}

SystemSupport OnrampOSXAppDelegate::installationCheck() const {
  if (mKSInstallerInfo.supportSystemMax().integerValue(kMajor) != 0) {
    const SystemSupport support = supportedOSMaxCheck();
    if (support != SystemSupport::kSupported) return support;
  }
  if (mKSInstallerInfo.supportSystemMin().integerValue(kMajor) != 0) return supportedOSMinCheck();
  return SystemSupport::kSupported;
}

std::string OnrampOSXAppDelegate::supportSystemMinString() const {
  const Dictionary& minimum = mKSInstallerInfo.supportSystemMin();
  return std::to_string(minimum.integerValue(kMajor)) + "." +
         std::to_string(minimum.integerValue(kMinor)) + "." +
         std::to_string(minimum.integerValue(kBugFix));
}

void OnrampOSXAppDelegate::showSystemNotSpecifiedAlert(const Window&, SystemSupport type) const {
  std::string informativeText;
  if (type == SystemSupport::kOlderThanMinimum) {
    informativeText = minimumText(supportSystemMinString());
  } else if (type == SystemSupport::kNewerThanMaximum) {
    informativeText =
        localized("INST_TXT_ALERT_OSMAX",
                  "This software does not contain drivers for your computer operating system.\n"
                  "Please visit the Kestrel Solutions Center for the latest update information.");
  } else {
    return;
  }
  runCriticalAlert(localized("INST_TXT_ALERT_OS",
                             "This OS version is not supported.\nSoftware cannot be installed."),
                   informativeText, localized("BTN_CLOSE", "Close"));
}

}  // namespace onramp
