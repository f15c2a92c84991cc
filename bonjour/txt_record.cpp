#include "bonjour/txt_record.h"

#include <algorithm>

#include "bonjour/byte_cursor.h"
#include "media/text_order.h"

namespace onramp {

std::optional<TxtRecord> TxtRecord::parse(std::span<const std::byte> data) {
  TxtRecord record;
  ByteCursor cursor(data);
  while (!cursor.atEnd()) {
    const auto length = cursor.byte();
    const auto bytes = cursor.bytes(*length);
    if (!bytes) return std::nullopt;
    const std::string text(reinterpret_cast<const char*>(bytes->data()), bytes->size());
    const std::size_t equals = text.find('=');
    Attribute attribute{text.substr(0, equals), std::nullopt};
    if (equals != std::string::npos) attribute.value = text.substr(equals + 1);
    if (!attribute.key.empty()) record.attributes_.push_back(std::move(attribute));
  }
  return record;
}

std::optional<std::string> TxtRecord::value(std::string_view key) const {
  const std::string wanted = lowercased(std::string(key));
  const auto found = std::find_if(attributes_.begin(), attributes_.end(),
                                  [&](const Attribute& a) { return lowercased(a.key) == wanted; });
  return found == attributes_.end() ? std::nullopt : found->value;
}

}  // namespace onramp
