#include "snmp/get_set.h"

#include <algorithm>
#include <array>
#include <vector>

#include "snmp/transport.h"

namespace onramp {

namespace {

constexpr std::size_t kStringStride = 16;

// Holds the strings of a request, at most kReplySize bytes in all, and later those of its reply,
// again at most kReplySize bytes. The destructor clears the bindings' pointers to this storage.
class string_storage {
 public:
  explicit string_storage(std::span<snmp_varbind> bindings)
      : bindings_(bindings), octets_(bindings.size()) {}
  string_storage(const string_storage&) = delete;
  string_storage& operator=(const string_storage&) = delete;
  ~string_storage() {
    for (std::size_t i = 0; i < bindings_.size(); ++i) {
      if (bindings_[i].octets_value == &octets_[i]) bindings_[i].octets_value = nullptr;
    }
  }

  /// Makes binding `i` point to the kReplySize bytes that start at `offset`, which must be at most
  /// kReplySize. The storage is twice that size, so a reply's strings fit at any `offset`.
  snmp_octets& give(std::size_t i, std::size_t offset) {
    octets_[i] = {kReplySize, kReplySize, bytes_.data() + offset};
    bindings_[i].octets_value = &octets_[i];
    return octets_[i];
  }

 private:
  std::span<snmp_varbind> bindings_;
  std::vector<snmp_octets> octets_;
  std::array<std::uint8_t, std::size_t{2} * kReplySize> bytes_{};
};

bool is_string(std::uint64_t type) {
  return type == kTagOctetString || type == kTagIpAddress || type == kTagOpaque;
}

snmp_status copy_string(const snmp_octets* value, snmp_octets* target) {
  const std::uint16_t length = value ? value->length : std::uint16_t{0};
  if (!target || target->capacity < length) return SNMP_ERR_CODEC;
  if (length != 0) std::copy_n(value->bytes, length, target->bytes);
  target->length = length;
  if (length < target->capacity) target->bytes[length] = 0;
  return SNMP_OK;
}

snmp_status copy_results(const snmp_message& message, std::span<snmp_result_slot> results) {
  for (const snmp_varbind& binding : message.varbinds.first(message.varbind_count)) {
    if (binding.index >= results.size()) return SNMP_ERR_CODEC;
    snmp_result_slot& slot = results[binding.index];
    if (binding.type != slot.type) return SNMP_ERR_CODEC;
    if (binding.type != kTagOctetString) {
      slot.int_value = binding.int_value;
    } else if (copy_string(binding.octets_value, slot.octets)) {
      return SNMP_ERR_CODEC;
    }
  }
  return SNMP_OK;
}

snmp_status exchange(snmp_message& message, std::span<snmp_result_slot> results,
                     const char* address, std::uint32_t mode) {
  message.request_id = static_cast<std::uint64_t>(snmp_request_counter_ext++);
  if (const snmp_status status = snmp_exchange(message, address, mode)) return status;
  if (message.error_status != 0) return static_cast<snmp_status>(message.error_status);
  return copy_results(message, results);
}

// Sets the type of every binding from its slot and copies every string to `strings`. The string of
// binding i starts at offset 16 * i, or at a higher multiple of 16 when earlier strings reach
// beyond that offset.
snmp_status take_slots(std::span<snmp_varbind> bindings, std::span<const snmp_result_slot> results,
                       string_storage& strings) {
  std::size_t used = 0;
  for (std::size_t i = 0; i < bindings.size(); ++i) {
    snmp_varbind& binding = bindings[i];
    if (binding.index >= results.size()) return SNMP_ERR_CODEC;
    const snmp_result_slot& slot = results[binding.index];
    binding.type = slot.type;
    if (!is_string(slot.type)) continue;
    const snmp_octets* const source =
        slot.type == kTagOctetString ? slot.octets : binding.octets_value;
    const std::size_t start = std::max(i * kStringStride, used);
    if (!source || start + source->length > kReplySize) return SNMP_ERR_CODEC;
    snmp_octets& octets = strings.give(i, start);
    std::copy_n(source->bytes, source->length, octets.bytes);
    octets.length = source->length;
    used = start + (octets.length + kStringStride - 1) / kStringStride * kStringStride;
  }
  return SNMP_OK;
}

}  // namespace

snmp_status snmp_get(snmp_message& message, std::span<snmp_result_slot> results,
                     const char* address, std::uint32_t mode) {
  if (results.size() > message.varbinds.size()) return SNMP_ERR_CODEC;
  if (message.pdu_type != kPduGetNext) message.pdu_type = kPduGet;
  const auto bindings = message.varbinds.first(results.size());
  string_storage strings(bindings);
  for (std::size_t i = 0; i < bindings.size(); ++i) {
    strings.give(i, 0);
    bindings[i].int_value = 0;
  }
  return exchange(message, results, address, mode);
}

snmp_status snmp_set(snmp_message& message, std::span<snmp_result_slot> results,
                     const char* address, std::uint32_t mode) {
  if (message.varbind_count > message.varbinds.size()) return SNMP_ERR_CODEC;
  message.pdu_type = kPduSet;
  const auto bindings = message.varbinds.first(message.varbind_count);
  string_storage strings(bindings);
  if (take_slots(bindings, results, strings)) return SNMP_ERR_CODEC;
  return exchange(message, results, address, mode);
}

}  // namespace onramp
