// Parses each input as a TXT record. Then makes a record in which an attribute's value is the
// input, cut to 250 bytes. Parses the record and expects the same value.

#include <cstdint>
#include <cstdlib>
#include <span>

#include "base/text.h"
#include "bonjour/txt_record.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  const auto bytes = std::as_bytes(std::span(data, size));
  if (const auto record = onramp::TxtRecord::parse(bytes)) {
    for (const char* key : {"usb_MFG", "mdl", "note", "pdl"}) {
      const auto value = record->value(key);
      if (value && value->size() + std::string_view(key).size() + 1 > 255) std::abort();
      if (value) static_cast<void>(onramp::isUTF8(*value));
    }
  }

  const std::size_t fits = size < 250 ? size : 250;
  std::vector<std::byte> written{std::byte(fits + 4), std::byte{'k'}, std::byte{'e'},
                                 std::byte{'y'}, std::byte{'='}};
  written.insert(written.end(), bytes.begin(), bytes.begin() + static_cast<std::ptrdiff_t>(fits));
  const auto record = onramp::TxtRecord::parse(written);
  const std::string text(reinterpret_cast<const char*>(data), fits);
  if (!record || record->value("KEY") != text) std::abort();
  return 0;
}
