#include "platform/libplist/node.h"

#include <algorithm>
#include <bit>
#include <cmath>
#include <cstdint>
#include <cstdlib>
#include <new>
#include <string>
#include <string_view>

#include "base/byte_reader.h"
#include "base/text.h"

namespace onramp::libplist {

namespace {

struct Free {
  // libplist allocates with malloc().
  // NOLINTNEXTLINE(cppcoreguidelines-no-malloc,cppcoreguidelines-owning-memory)
  void operator()(void* memory) const { std::free(memory); }
};

template <typename T>
using Owned = std::unique_ptr<T, Free>;

// libplist's functions for integers do not distinguish -1 from 2^64-1, and its functions for dates
// keep only 32 bits. A binary list keeps every bit, so integers and dates are read and written
// through a binary list of one object. (Only integers between 0 and 2^63-1 are read directly.) In a
// binary list, an 8-byte integer begins with kInteger8, a 16-byte integer with kInteger16, and a
// date with kDate8.
constexpr char kInteger8 = 0x13;
constexpr char kInteger16 = 0x14;
constexpr char kDate8 = 0x33;
constexpr std::string_view kBinaryHeader = "bplist00";

std::string bigEndian(std::uint64_t number) {
  std::string bytes;
  for (int shift = 56; shift >= 0; shift -= 8)
    bytes += static_cast<char>(number >> shift & 0xFF);
  return bytes;
}

Node nodeOfObject(const std::string& object) {
  std::string list(kBinaryHeader);
  list += object;
  const std::uint64_t offsets = list.size();
  list += static_cast<char>(kBinaryHeader.size());  // the table of offsets: one offset of one byte
  list += std::string(6, '\0') + '\1' + '\1' + bigEndian(1) + bigEndian(0) + bigEndian(offsets);
  plist_t node = nullptr;
  plist_from_bin(list.data(), static_cast<std::uint32_t>(list.size()), &node);
  return Node(node);
}

// Returns `node`. Throws std::bad_alloc if `node` is null, because libplist returns null only when
// it runs out of memory.
Node created(Node node) {
  if (!node) throw std::bad_alloc();
  return node;
}

// Converts `node` to a binary list of one object, and returns the bytes after the list's header.
// These bytes begin with the object. Returns an empty string on failure.
std::string objectOf(plist_t node) {
  char* bytes = nullptr;
  std::uint32_t size = 0;
  plist_to_bin(node, &bytes, &size);
  const Owned<char> owned(bytes);
  return bytes && size > kBinaryHeader.size()
             ? std::string(bytes + kBinaryHeader.size(), size - kBinaryHeader.size())
             : std::string();
}

Value integerOf(plist_t node) {
  std::uint64_t number = 0;
  plist_get_uint_val(node, &number);
  if (number >> 63 != 0 && objectOf(node).starts_with(kInteger16)) return number;
  return static_cast<std::int64_t>(number);
}

Value dateOf(plist_t node) {
  const std::string object = objectOf(node);
  ByteReader reader(object);
  const bool hasMarker = reader.skip(1);
  return Date{std::bit_cast<double>(hasMarker ? reader.number(8).value_or(0) : 0)};
}

Value dataOf(plist_t node) {
  std::uint64_t size = 0;
  const auto* const bytes = reinterpret_cast<const std::byte*>(plist_get_data_ptr(node, &size));
  return bytes ? Data(bytes, bytes + size) : Data();
}

Value stringOf(plist_t node) {
  std::uint64_t size = 0;
  const char* const text = plist_get_string_ptr(node, &size);
  return text ? std::string(text, static_cast<std::size_t>(size)) : std::string();
}

Value arrayOf(plist_t node) {
  Array array;
  array.reserve(plist_array_get_size(node));
  plist_array_iter iterator = nullptr;
  plist_array_new_iter(node, &iterator);
  const Owned<void> owned(iterator);
  plist_t item = nullptr;
  for (plist_array_next_item(node, iterator, &item); item;
       plist_array_next_item(node, iterator, &item)) {
    array.push_back(valueOf(item));
  }
  return array;
}

Value dictionaryOf(plist_t node) {
  std::vector<Dictionary::Pair> pairs;
  pairs.reserve(plist_dict_get_size(node));
  plist_dict_iter iterator = nullptr;
  plist_dict_new_iter(node, &iterator);
  const Owned<void> owned(iterator);
  for (;;) {
    char* key = nullptr;
    plist_t item = nullptr;
    plist_dict_next_item(node, iterator, &key, &item);
    const Owned<char> ownedKey(key);
    if (!key || !item) break;
    pairs.emplace_back(key, valueOf(item));
  }
  return Dictionary(std::move(pairs));
}

// Replaces malformed UTF-8, and characters that XML 1.0 does not allow, with the replacement
// character. Below U+0020, XML allows only tab, line feed and carriage return, even as references.
std::string writable(std::string_view text) {
  std::string result;
  result.reserve(text.size());
  while (!text.empty()) {
    const char32_t character = takeUTF8(text).value_or(kReplacementCharacter);
    const bool control =
        character < 0x20 && character != '\t' && character != '\n' && character != '\r';
    const bool noCharacter = character == 0xFFFE || character == 0xFFFF;
    appendUTF8(result, control || noCharacter ? kReplacementCharacter : character);
  }
  return result;
}

Node dateNode(Date date) {
  constexpr double kFirst = -63113904000;  // 0001-01-01 00:00:00
  constexpr double kLast = 252423993599;   // 9999-12-31 23:59:59
  const double seconds = date.secondsSinceReferenceDate;
  const double kept = std::isnan(seconds) ? 0 : std::clamp(std::floor(seconds), kFirst, kLast);
  return nodeOfObject(kDate8 + bigEndian(std::bit_cast<std::uint64_t>(kept)));
}

struct NodeMaker {
  Node operator()(bool flag) const { return Node(plist_new_bool(flag ? 1 : 0)); }
  Node operator()(std::int64_t number) const {
    return nodeOfObject(kInteger8 + bigEndian(static_cast<std::uint64_t>(number)));
  }
  Node operator()(std::uint64_t number) const {
    return nodeOfObject(kInteger16 + bigEndian(0) + bigEndian(number));
  }
  Node operator()(double number) const { return Node(plist_new_real(number)); }
  Node operator()(const std::string& text) const {
    return Node(plist_new_string(writable(text).c_str()));
  }
  Node operator()(const Data& data) const {
    return Node(plist_new_data(reinterpret_cast<const char*>(data.data()), data.size()));
  }
  Node operator()(Date date) const { return dateNode(date); }
  Node operator()(const Array& array) const {
    Node node = created(Node(plist_new_array()));
    for (const Value& item : array)
      plist_array_append_item(node.get(), nodeOf(item).release());
    return node;
  }
  Node operator()(const Dictionary& dictionary) const {
    Node node = created(Node(plist_new_dict()));
    for (const auto& [key, value] : dictionary)
      plist_dict_set_item(node.get(), writable(key).c_str(), nodeOf(value).release());
    return node;
  }
};

}  // namespace

Value valueOf(plist_t node) {
  switch (plist_get_node_type(node)) {
    case PLIST_BOOLEAN: {
      std::uint8_t flag = 0;
      plist_get_bool_val(node, &flag);
      return flag != 0;
    }
    case PLIST_UINT:
      return integerOf(node);
    case PLIST_REAL: {
      double number = 0;
      plist_get_real_val(node, &number);
      return number;
    }
    case PLIST_DATE:
      return dateOf(node);
    case PLIST_DATA:
      return dataOf(node);
    case PLIST_ARRAY:
      return arrayOf(node);
    case PLIST_DICT:
      return dictionaryOf(node);
    case PLIST_UID: {
      std::uint64_t number = 0;
      plist_get_uid_val(node, &number);
      return Dictionary{{"CF$UID", number}};
    }
    default:
      return stringOf(node);
  }
}

Node nodeOf(const Value& value) {
  return created(std::visit(NodeMaker(), value.storage()));
}

}  // namespace onramp::libplist
