#include "tools/check/shown_texts.h"

#include <algorithm>
#include <array>
#include <cmath>

#include "base/text.h"

namespace onramp::check {

namespace {

constexpr double kTitleSize = 17 * 1.06;  // 17 points, plus 6 % because the letters are bold
constexpr double kPage = 616;
constexpr double kButton = 84;
constexpr double kHeader = 11;

constexpr std::array kTexts{
    ShownText{.key = "APP_MENU_ABOUT", .where = "application menu", .hasFallback = true},
    ShownText{.key = "APP_MENU_HIDE", .where = "application menu", .hasFallback = true},
    ShownText{.key = "APP_MENU_HIDEOHTERS", .where = "application menu", .hasFallback = true},
    ShownText{.key = "APP_MENU_QUIT", .where = "application menu", .hasFallback = true},
    ShownText{.key = "APP_MENU_SHOWALL", .where = "application menu", .hasFallback = true},
    ShownText{.key = "BTN_BACK", .where = "button", .width = kButton},
    ShownText{.key = "BTN_CANCEL", .where = "button", .width = kButton},
    ShownText{.key = "BTN_CLOSE", .where = "button of an alert", .hasFallback = true},
    ShownText{.key = "BTN_NEXT", .where = "button", .width = kButton},
    ShownText{.key = "BTN_OK", .where = "button of an alert", .hasFallback = true},
    ShownText{.key = "BTN_WEB", .where = "button of an alert", .hasFallback = true},
    ShownText{.key = "INST_TXT_ALERT_CONFIRM_DEVICENOTFOUND_WIFI",
              .where = "sheet when no device is found",
              .hasFallback = true},
    ShownText{.key = "INST_TXT_ALERT_DEVICENOTFOUND",
              .where = "sheet when no device is found",
              .hasFallback = true},
    ShownText{
        .key = "INST_TXT_ALERT_OS", .where = "alert on an unsupported system", .hasFallback = true},
    ShownText{.key = "INST_TXT_ALERT_OSMAX",
              .where = "alert on a system that is too new",
              .hasFallback = true},
    ShownText{.key = "INST_TXT_ALERT_OSMIN",
              .where = "alert on a system that is too old",
              .mostPlaceholders = 2,
              .hasFallback = true},
    ShownText{.key = "INST_TXT_ALERT_WIFI_DEVICENOTFOUND",
              .where = "sheet when no device is found",
              .hasFallback = true},
    ShownText{
        .key = "INST_TXT_CONNECTION", .where = "header of a column", .width = 128, .size = kHeader},
    ShownText{.key = "INST_TXT_CONNECTIONTYPE",
              .where = "title of the connection page",
              .width = kPage,
              .size = kTitleSize},
    ShownText{.key = "INST_TXT_CONNECTIONTYPE_DESC",
              .where = "explanation on the connection page",
              .width = kPage,
              .lines = 2},
    ShownText{.key = "INST_TXT_CONNECTION_NETWORK",
              .where = "column of the device list",
              .width = 134,
              .hasFallback = true},
    ShownText{
        .key = "INST_TXT_DEVICE", .where = "header of a column", .width = 308, .size = kHeader},
    ShownText{.key = "INST_TXT_DEVLIST",
              .where = "title of the device list",
              .width = 546,
              .size = kTitleSize,
              .lines = 2},
    ShownText{.key = "INST_TXT_ETHERNET", .where = "name of a connection", .width = 450},
    ShownText{
        .key = "INST_TXT_IPADDRESS", .where = "header of a column", .width = 130, .size = kHeader},
    ShownText{.key = "INST_TXT_MODEL",
              .where = "title of the model list",
              .width = kPage,
              .size = kTitleSize},
    ShownText{.key = "INST_TXT_MODEL_DESC",
              .where = "explanation above the model list",
              .width = kPage,
              .lines = 2},
    ShownText{.key = "INST_TXT_REFRESH", .where = "device list's menu"},
    ShownText{.key = "INST_TXT_USB", .where = "name of a connection", .width = 450},
    ShownText{.key = "INST_TXT_WIFI", .where = "name of a connection", .width = 450},
    ShownText{.key = "INST_WAIT", .where = "beside the spinner during a search", .width = 588},
};

struct Range {
  char32_t first;
  char32_t last;
};

// Ranges of characters that are mostly as wide as they are high.
constexpr std::array kSquare{
    Range{0x1100, 0x115F}, Range{0x2E80, 0xA4CF},   Range{0xAC00, 0xD7A3},
    Range{0xF900, 0xFAFF}, Range{0xFE30, 0xFE4F},   Range{0xFF00, 0xFF60},
    Range{0xFFE0, 0xFFE6}, Range{0x1F300, 0x1FAFF}, Range{0x20000, 0x3FFFD}};

// Returns the estimated width of a character, as a fraction of the font size.
double relativeWidth(char32_t character) {
  constexpr std::string_view kNarrow = " !'(),.:;I[]fijlrt|";
  constexpr std::string_view kWide = "%@MWmw";
  if (character < 0x80) {
    const char c = static_cast<char>(character);
    if (kNarrow.find(c) != std::string_view::npos) return 0.3;
    if (kWide.find(c) != std::string_view::npos) return 0.85;
    return c >= 'A' && c <= 'Z' ? 0.66 : 0.55;
  }
  if (character >= 0x300 && character <= 0x36F) return 0;  // an accent on the preceding letter
  const bool square = std::any_of(kSquare.begin(), kSquare.end(), [&](const Range& range) {
    return character >= range.first && character <= range.last;
  });
  return square ? 1 : 0.58;
}

}  // namespace

std::span<const ShownText> shownTexts() {
  return kTexts;
}

double estimatedWidth(std::string_view text, double size) {
  double width = 0;
  while (!text.empty())
    width += size * relativeWidth(takeUTF8(text).value_or(kReplacementCharacter));
  return width;
}

int estimatedLines(std::string_view text, double size, double width) {
  int lines = 0;
  for (;;) {
    const std::size_t end = std::min(text.find('\n'), text.size());
    const double wide = estimatedWidth(text.substr(0, end), size);
    lines += std::max(1, static_cast<int>(std::ceil(std::min(wide / width, 1000.0))));
    if (end == text.size()) return lines;
    text.remove_prefix(end + 1);
  }
}

}  // namespace onramp::check
