// Compares the wizard's SNMP codec with the net-snmp library. Both encode the request for the
// object ActiveIF and decode the reply. Prints the time and the number of allocations for a
// message, and the ratio of the times. With --json, prints only the times, in the form that
// bench/compare reads.

#include <net-snmp/net-snmp-config.h>
#include <net-snmp/net-snmp-includes.h>

#include <algorithm>
#include <array>
#include <cstdio>
#include <cstdlib>
#include <cstring>

#include "bench/snmp/median.h"
#include "snmp/protocol.h"
#include "tests/snmp/message.h"

namespace {

long allocations = 0;

}  // namespace

// Replaces malloc and calloc in the whole process, including net-snmp, to count the calls.
extern "C" {
// The C library's own allocation functions.
void* __libc_malloc(std::size_t size);                     // NOLINT(bugprone-reserved-identifier)
void* __libc_calloc(std::size_t count, std::size_t size);  // NOLINT(bugprone-reserved-identifier)

void* malloc(std::size_t size) {
  ++allocations;
  return __libc_malloc(size);
}
void* calloc(std::size_t count, std::size_t size) {
  ++allocations;
  return __libc_calloc(count, size);
}
}

namespace {

constexpr int kRounds = 2001;
constexpr int kMessagesPerRound = 500;

void check(bool fine, const char* what) {
  if (fine) return;
  std::fprintf(stderr, "snmp_codec_bench: %s failed, so there is nothing to compare\n", what);
  std::exit(1);
}

struct Ours : onramp::Message {
  Ours() : Message(1) {
    std::copy(onramp::kActiveIFObject.begin(), onramp::kActiveIFObject.end(), names[0].arcs);
    message.request_id = 1234;
  }

  void build() { check(onramp::snmp_encode_message(message, buffer, length) == 0, "encoding"); }

  void parse(std::span<const std::uint8_t> reply) {
    octets[0] = {1500, 1500, strings.data()};
    check(onramp::snmp_decode_message(message, reply) == 0, "decoding");
    check(varbinds[0].int_value == 2, "reading the value");
  }

  [[nodiscard]] std::span<const std::uint8_t> built() const {
    return std::span(buffer).first(length);
  }

  std::array<std::uint8_t, 1536> buffer{};
  std::uint16_t length = 0;
};

class NetSnmp {
 public:
  NetSnmp() {
    snmp_sess_init(&session_);
    session_.version = SNMP_VERSION_1;
    std::array<oid, onramp::kActiveIFObject.size()> name{};
    std::copy(onramp::kActiveIFObject.begin(), onramp::kActiveIFObject.end(), name.begin());
    request_ = snmp_pdu_create(SNMP_MSG_GET);
    request_->version = SNMP_VERSION_1;
    request_->reqid = 1234;
    request_->community = reinterpret_cast<u_char*>(strdup("corridor"));
    request_->community_len = 8;
    snmp_add_null_var(request_, name.data(), name.size());
  }
  NetSnmp(const NetSnmp&) = delete;
  NetSnmp& operator=(const NetSnmp&) = delete;
  ~NetSnmp() { snmp_free_pdu(request_); }

  void build() {
    size_t size = buffer_.size();
    offset_ = 0;
    u_char* packet = buffer_.data();
    check(snmp_build(&packet, &size, &offset_, &session_, request_) == 0, "net-snmp's building");
  }

  void parse(std::span<const std::uint8_t> reply) {
    netsnmp_pdu* const pdu = snmp_pdu_create(SNMP_MSG_RESPONSE);
    check(snmp_parse(nullptr, &session_, pdu, const_cast<u_char*>(reply.data()), reply.size()) == 0,
          "net-snmp's parsing");
    check(*pdu->variables->val.integer == 2, "net-snmp's reading of the value");
    snmp_free_pdu(pdu);
  }

  /// net-snmp fills the buffer from its end, so the request is at the end.
  [[nodiscard]] std::span<const std::uint8_t> request() const {
    return std::span(buffer_).last(offset_);
  }

 private:
  netsnmp_session session_{};
  netsnmp_pdu* request_ = nullptr;
  std::array<u_char, 1536> buffer_{};
  size_t offset_ = 0;
};

template <typename Work>
double allocationsOf(Work work) {
  const long before = allocations;
  for (int i = 0; i < kMessagesPerRound; ++i)
    work();
  return static_cast<double>(allocations - before) / kMessagesPerRound;
}

void report(const char* what, const Samples& ours, const Samples& peer, double ourAllocations,
            double peerAllocations) {
  std::printf(
      "%s  %6.1f ns [%.1f, %.1f]   net-snmp %6.1f ns [%.1f, %.1f]   %5.1f times as fast"
      "   allocations %g, net-snmp %g\n",
      what, ours.median(), ours.quantile(0.05), ours.quantile(0.95), peer.median(),
      peer.quantile(0.05), peer.quantile(0.95), peer.median() / ours.median(), ourAllocations,
      peerAllocations);
}

}  // namespace

int main(int argc, char** argv) {
  Ours request;
  Ours device;
  Ours answer;
  NetSnmp peer;
  request.build();
  peer.build();
  const auto a = request.built();
  const auto b = peer.request();
  check(std::equal(a.begin(), a.end(), b.begin(), b.end()), "building the same bytes as net-snmp");
  device.message.pdu_type = onramp::kPduResponse;
  device.varbinds[0].type = onramp::kTagInteger;
  device.varbinds[0].int_value = 2;
  device.build();
  const auto reply = device.built();

  Samples ourBuild;
  Samples peerBuild;
  Samples ourParse;
  Samples peerParse;
  for (int round = 0; round < kRounds; ++round) {
    ourBuild.measure(kMessagesPerRound, [&] { request.build(); });
    peerBuild.measure(kMessagesPerRound, [&] { peer.build(); });
    ourParse.measure(kMessagesPerRound, [&] { answer.parse(reply); });
    peerParse.measure(kMessagesPerRound, [&] { peer.parse(reply); });
  }
  if (wantsJson(argc, argv)) {
    printJson("SNMP message", "encoding", "net-snmp's library", ourBuild, peerBuild);
    printJson("SNMP message", "decoding", "net-snmp's library", ourParse, peerParse);
    return 0;
  }
  std::printf(
      "Medians [5 %% and 95 %% quantiles] of %d rounds of %d messages (request %zu bytes, reply "
      "%zu "
      "bytes)\n",
      kRounds, kMessagesPerRound, a.size(), reply.size());
  report("encode", ourBuild, peerBuild, allocationsOf([&] { request.build(); }),
         allocationsOf([&] { peer.build(); }));
  report("decode", ourParse, peerParse, allocationsOf([&] { answer.parse(reply); }),
         allocationsOf([&] { peer.parse(reply); }));
  return 0;
}
