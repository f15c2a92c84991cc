#include "bonjour/utf8.h"

#include <algorithm>
#include <cstddef>

namespace onramp {

namespace {

struct Lead {
  std::size_t followers;
  // What the first follower may be; all others are 0x80 to 0xbf.
  unsigned char low;
  unsigned char high;
};

constexpr Lead kNoLead{0, 1, 0};

constexpr Lead leadOf(unsigned char byte) {
  if (byte < 0x80) return {0, 0, 0};
  if (byte < 0xc2) return kNoLead;
  if (byte < 0xe0) return {1, 0x80, 0xbf};
  if (byte == 0xe0) return {2, 0xa0, 0xbf};
  if (byte == 0xed) return {2, 0x80, 0x9f};
  if (byte < 0xf0) return {2, 0x80, 0xbf};
  if (byte == 0xf0) return {3, 0x90, 0xbf};
  if (byte < 0xf4) return {3, 0x80, 0xbf};
  if (byte == 0xf4) return {3, 0x80, 0x8f};
  return kNoLead;
}

bool isFollower(char byte) {
  return (static_cast<unsigned char>(byte) & 0xc0U) == 0x80U;
}

}  // namespace

bool isUtf8(std::string_view text) {
  while (!text.empty()) {
    const Lead lead = leadOf(static_cast<unsigned char>(text.front()));
    text.remove_prefix(1);
    if (lead.low > lead.high || lead.followers > text.size()) return false;
    if (lead.followers == 0) continue;
    const auto first = static_cast<unsigned char>(text.front());
    if (first < lead.low || first > lead.high) return false;
    const std::string_view others = text.substr(1, lead.followers - 1);
    if (!std::all_of(others.begin(), others.end(), isFollower)) return false;
    text.remove_prefix(lead.followers);
  }
  return true;
}

}  // namespace onramp
