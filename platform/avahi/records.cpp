#include "platform/avahi/records.h"

#include <algorithm>
#include <cstring>
#include <utility>

namespace onramp::avahi {

namespace {

constexpr std::uint16_t kClassInternet = 1;

std::optional<Records::Record> recordIn(sd_bus_message* message) {
  Records::Record record{};
  const char* name = nullptr;
  std::uint16_t recordClass = 0;
  std::uint16_t type = 0;
  const void* data = nullptr;
  std::size_t size = 0;
  if (sd_bus_message_read(message, "iisqq", &record.interface, &record.protocol, &name,
                          &recordClass, &type) <= 0 ||
      sd_bus_message_read_array(message, 'y', &data, &size) < 0) {
    return std::nullopt;
  }
  const auto* const bytes = static_cast<const std::byte*>(data);
  record.data.assign(bytes, bytes + size);
  return record;
}

template <typename Number>
void put(Data& data, std::size_t offset, const Number& number) {
  std::memcpy(data.data() + offset, &number, sizeof number);
}

}  // namespace

Records::Records(Daemon& daemon, const std::string& name, RecordType type,
                 std::function<void()> changed)
    : changed_(std::move(changed)),
      query_(
          daemon, "RecordBrowser",
          [name, type](sd_bus_message* call) {
            return sd_bus_message_append(call, "iisqqu", kAnyInterface, kAnyProtocol, name.c_str(),
                                         kClassInternet, static_cast<std::uint16_t>(type), 0U);
          },
          [this](Query::Event event, sd_bus_message* message) { happened(event, message); }) {}

void Records::happened(Query::Event event, sd_bus_message* message) {
  switch (event) {
    case Query::Event::kFound:
      if (auto record = recordIn(message)) records_.push_back(*std::move(record));
      break;
    case Query::Event::kGone:
      if (const auto record = recordIn(message)) std::erase(records_, *record);
      break;
    case Query::Event::kCacheExhausted:
      isCacheExhausted_ = true;
      break;
    case Query::Event::kLost:
      records_.clear();
      isCacheExhausted_ = false;
      break;
  }
  changed_();
}

std::optional<Data> socketAddress(const Records::Record& record, std::uint16_t port) {
  constexpr std::size_t kIPv4Size = 4;
  constexpr std::size_t kIPv6Size = 16;
  const bool isIPv4 = record.data.size() == kIPv4Size;
  if (!isIPv4 && record.data.size() != kIPv6Size) return std::nullopt;
  Data address(isIPv4 ? 16 : 28);
  put(address, 0, static_cast<std::uint8_t>(address.size()));
  put(address, 1, static_cast<std::uint8_t>(isIPv4 ? 2 : 30));
  put(address, 2, static_cast<std::uint8_t>(port >> 8U));
  put(address, 3, static_cast<std::uint8_t>(port & 0xffU));
  std::copy(record.data.begin(), record.data.end(), address.begin() + (isIPv4 ? 4 : 8));
  const bool isLinkLocal = !isIPv4 && record.data[0] == std::byte{0xfe} &&
                           (record.data[1] & std::byte{0xc0}) == std::byte{0x80};
  if (isLinkLocal) put(address, 24, static_cast<std::uint32_t>(record.interface));
  return address;
}

}  // namespace onramp::avahi
