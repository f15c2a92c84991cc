#include "app/OnrampOSXAppDelegate.h"
#include "media/CommonMessage.h"
#include "platform/alert.h"
#include "platform/system_version.h"

namespace onramp {

namespace {

constexpr const char* kMajor = "Major";
constexpr const char* kMinor = "Minor";
constexpr const char* kBugFix = "BugFix";
constexpr std::string_view kPlaceholder = "%@";

SystemVersion runningVersion() {
  return systemVersion(OnrampOSXAppDelegate::getSystemVersion());
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
  return isNewerThan(mKSInstallerInfo.supportSystemMax(), runningVersion())
             ? SystemSupport::kNewerThanMaximum
             : SystemSupport::kSupported;
}

SystemSupport OnrampOSXAppDelegate::supportedOSMinCheck() const {
  return isOlderThan(mKSInstallerInfo.supportSystemMin(), runningVersion())
             ? SystemSupport::kOlderThanMinimum
             : SystemSupport::kSupported;
}

SystemSupport OnrampOSXAppDelegate::installationCheck() const {
  return systemSupport(runningVersion(), mKSInstallerInfo.supportSystemMin(),
                       mKSInstallerInfo.supportSystemMax());
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
