#include "bonjour/txt_record.h"

#include <algorithm>

#include "base/ascii.h"
#include "base/byte_reader.h"

namespace onramp {

std::optional<TxtRecord> TxtRecord::parse(std::span<const std::byte> data) {
  TxtRecord record;
  ByteReader reader(data);
  while (const auto length = reader.byte()) {
    const auto text = reader.text(*length);
    if (!text) return std::nullopt;
    const std::size_t equals = text->find('=');
    Attribute attribute{std::string(text->substr(0, equals)), std::nullopt};
    if (equals != std::string_view::npos) attribute.value = text->substr(equals + 1);
    if (!attribute.key.empty()) record.attributes_.push_back(std::move(attribute));
  }
  return record;
}

std::optional<std::string> TxtRecord::value(std::string_view key) const {
  const std::string wanted = asciiLowercased(std::string(key));
  const auto found = std::find_if(attributes_.begin(), attributes_.end(), [&](const Attribute& a) {
    return asciiLowercased(a.key) == wanted;
  });
  return found == attributes_.end() ? std::nullopt : found->value;
}

}  // namespace onramp
