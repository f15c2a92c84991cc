#include "tools/devices/ber_tree.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdio>
#include <string_view>
#include <vector>

#include "base/byte_reader.h"
#include "snmp/ber_reader.h"
#include "snmp/records.h"
#include "tools/devices/exchange.h"
#include "tools/devices/text.h"

namespace onramp::devices {

namespace {

using Bytes = std::span<const std::uint8_t>;

constexpr std::uint8_t kConstructed = 0x20;
constexpr std::uint8_t kContextClass = 0x80;
constexpr std::size_t kDeepest = 16;
constexpr std::size_t kMostArcs = 128;
constexpr std::size_t kBytesPerLine = 16;

// The names of an SNMP message's elements and of its PDU's elements, in order (RFC 1157 section 4).
// The empty name is for the PDU, which pduName() names.
constexpr std::array<std::string_view, 3> kMessageFields{"version", "community", ""};
constexpr std::array<std::string_view, 4> kPduFields{"request", "error status", "error index",
                                                     "bindings"};

std::string_view pduName(std::uint8_t tag) {
  constexpr std::array<std::string_view, 5> kNames{"get request", "get-next request",
                                                   "get response", "set request", "trap"};
  const std::size_t number = tag & 0x1FU;
  return number < kNames.size() ? kNames[number] : "unknown PDU";
}

std::string tagName(std::uint8_t tag) {
  switch (tag) {
    case kTagBoolean:
      return "BOOLEAN";
    case kTagInteger:
      return "INTEGER";
    case kTagOctetString:
      return "OCTET STRING";
    case kTagNull:
      return "NULL";
    case kTagObjectIdentifier:
      return "OBJECT IDENTIFIER";
    case kTagSequence:
      return "SEQUENCE";
    case kTagIpAddress:
      return "IpAddress";
    case kTagCounter:
      return "Counter";
    case kTagGauge:
      return "Gauge";
    case kTagTimeTicks:
      return "TimeTicks";
    case kTagOpaque:
      return "Opaque";
    default:
      break;
  }
  if ((tag & kContextClass) != 0) return "[" + std::to_string(tag & 0x1FU) + "]";
  return "tag " + hexText(std::array{tag});
}

std::string integerText(Bytes content) {
  ByteReader in(content);
  std::int64_t value = 0;
  if (ber_get_int(in, value, static_cast<std::uint16_t>(content.size()))) return hexText(content);
  return std::to_string(content.size() < 3 ? value : static_cast<std::int32_t>(value));
}

std::string identifierText(Bytes content) {
  std::array<std::uint16_t, kMostArcs> arcs{};
  snmp_oid oid{kMostArcs, kMostArcs, arcs.data()};
  ByteReader in(content);
  if (ber_get_oid(in, &oid, static_cast<std::uint16_t>(content.size()))) return hexText(content);
  std::string text;
  for (std::size_t i = 0; i < oid.count; ++i)
    text += (i == 0 ? "" : ".") + std::to_string(arcs[i]);
  return text;
}

std::string contentText(std::uint8_t tag, Bytes content) {
  switch (tag) {
    case kTagBoolean:
    case kTagInteger:
    case kTagCounter:
    case kTagGauge:
    case kTagTimeTicks:
      return integerText(content);
    case kTagObjectIdentifier:
      return identifierText(content);
    case kTagOctetString:
      return inQuotes({reinterpret_cast<const char*>(content.data()), content.size()});
    default:
      return hexText(content);
  }
}

// An element's position: its depth, its index among its parent's elements, and whether its parent
// is a PDU.
struct Where {
  std::size_t depth = 0;
  std::size_t place = 0;
  bool inPdu = false;
};

std::string fieldName(const Where& where, std::uint8_t tag, Bytes content) {
  if (where.depth == 1 && where.place < kMessageFields.size()) {
    if (where.place + 1 == kMessageFields.size()) return std::string(pduName(tag));
    return std::string(kMessageFields[where.place]);
  }
  if (!where.inPdu || where.depth != 2 || where.place >= kPduFields.size()) return "";
  std::string name(kPduFields[where.place]);
  if (where.place == 1 && content.size() == 1) name += ", " + errorStatusName(content[0]);
  return name;
}

void describe(Bytes bytes, Where where, std::string& out) {
  ByteReader in(bytes);
  for (; in.remaining() != 0; ++where.place) {
    const std::string indent(2 * where.depth, ' ');
    const Bytes rest = bytes.last(in.remaining());
    std::uint8_t tag = 0;
    std::uint16_t length = 0;
    if (ber_get_tag(in, tag) || ber_get_length(in, length) || length > in.remaining()) {
      out += indent + "no element: " + hexText(rest) + '\n';
      return;
    }
    const Bytes content = bytes.last(in.remaining()).first(length);
    if (!in.take(length)) return;
    const bool hasElements = (tag & kConstructed) != 0 && where.depth < kDeepest;
    std::string line = indent + tagName(tag);
    if (hasElements) {
      line += ", " + std::to_string(content.size()) + " bytes";
    } else if (!content.empty()) {
      line += ' ' + contentText(tag, content);
    }
    const std::string name = fieldName(where, tag, content);
    if (!name.empty()) line.append("  (").append(name).append(")");
    out.append(line).append("\n");
    if (hasElements) describe(content, {where.depth + 1, 0, (tag & kContextClass) != 0}, out);
  }
}

}  // namespace

std::string berTree(Bytes bytes) {
  std::string out;
  describe(bytes, {}, out);
  return out;
}

std::string hexText(Bytes bytes) {
  constexpr std::string_view kDigits = "0123456789abcdef";
  std::string out;
  for (const std::uint8_t byte : bytes) {
    out += kDigits[byte >> 4U];
    out += kDigits[byte & 0xFU];
  }
  return out;
}

std::string hexDump(Bytes bytes) {
  std::string out;
  for (std::size_t at = 0; at < bytes.size(); at += kBytesPerLine) {
    const Bytes line = bytes.subspan(at, std::min(kBytesPerLine, bytes.size() - at));
    std::array<char, 20> offset{};
    std::snprintf(offset.data(), offset.size(), "%04zx ", at);
    out += offset.data();
    for (std::size_t i = 0; i < kBytesPerLine; ++i)
      out += i < line.size() ? ' ' + hexText(line.subspan(i, 1)) : "   ";
    out += "  ";
    for (const std::uint8_t byte : line)
      out += byte >= 0x20 && byte < 0x7f ? static_cast<char>(byte) : '.';
    out += '\n';
  }
  return out;
}

}  // namespace onramp::devices
