// Encodes the request for ActiveIF and decodes its reply, with this codec and with net-snmp's
// library in turns, and prints times, ratios and allocations of one message.

#include <net-snmp/net-snmp-config.h>
#include <net-snmp/net-snmp-includes.h>

#include <array>
#include <cstdio>
#include <cstdlib>
#include <cstring>

#include "bench/snmp/median.h"
#include "snmp/codec.h"

namespace {

long allocations = 0;

}  // namespace

// Every allocation of the process, those inside the library included, passes through here.
extern "C" {
void* __libc_malloc(std::size_t size);
void* __libc_calloc(std::size_t count, std::size_t size);

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

std::array<std::uint16_t, 14> arcs = {1, 3, 6, 1, 4, 1, 4242, 2, 4, 4, 1240, 1, 2, 0};

void check(bool fine, const char* what) {
  if (fine) return;
  std::fprintf(stderr, "snmp_codec_bench: %s failed, so there is nothing to compare\n", what);
  std::exit(1);
}

class Ours {
 public:
  Ours() {
    snmp_message_init(message_, 1);
    binding_[0].name = &name_;
    binding_[0].octets_value = &octets_;
  }

  void build() {
    message_.pdu_type = onramp::kPduGet;
    message_.request_id = 1234;
    message_.varbind_count = 1;
    binding_[0].type = onramp::kTagNull;
    check(onramp::snmp_encode_message(message_, buffer_, length_) == 0, "encoding");
  }

  void parse(std::span<const std::uint8_t> reply) {
    octets_ = {1500, 1500, strings_.data()};
    check(onramp::snmp_decode_message(message_, reply) == 0, "decoding");
    check(binding_[0].int_value == 2, "reading the value");
  }

  [[nodiscard]] std::span<const std::uint8_t> request() const {
    return std::span(buffer_).first(length_);
  }

  /// The answer to build()'s request: ActiveIF is 2.
  [[nodiscard]] std::span<const std::uint8_t> makeReply() {
    build();
    message_.pdu_type = onramp::kPduResponse;
    message_.community = "corridor";
    binding_[0].type = onramp::kTagInteger;
    binding_[0].int_value = 2;
    check(onramp::snmp_encode_message(message_, reply_, length_) == 0, "making the reply");
    return std::span(reply_).first(length_);
  }

 private:
  std::array<std::uint8_t, 1536> buffer_{};
  std::array<std::uint8_t, 1536> reply_{};
  std::array<std::uint8_t, 1500> strings_{};
  std::uint16_t length_ = 0;
  onramp::snmp_oid name_{14, 14, arcs.data()};
  onramp::snmp_octets octets_;
  std::array<onramp::snmp_varbind, 1> binding_;
  onramp::snmp_message message_{.varbinds = binding_};
};

class NetSnmp {
 public:
  NetSnmp() {
    snmp_sess_init(&session_);
    session_.version = SNMP_VERSION_1;
    std::array<oid, arcs.size()> name{};
    std::copy(arcs.begin(), arcs.end(), name.begin());
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

  /// Built from the buffer's end towards its start.
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

int main() {
  Ours ours;
  NetSnmp peer;
  const auto reply = ours.makeReply();
  ours.build();
  peer.build();
  const auto a = ours.request();
  const auto b = peer.request();
  check(std::equal(a.begin(), a.end(), b.begin(), b.end()), "building the same bytes as net-snmp");

  Samples ourBuild;
  Samples peerBuild;
  Samples ourParse;
  Samples peerParse;
  for (int round = 0; round < kRounds; ++round) {
    ourBuild.measure(kMessagesPerRound, [&] { ours.build(); });
    peerBuild.measure(kMessagesPerRound, [&] { peer.build(); });
    ourParse.measure(kMessagesPerRound, [&] { ours.parse(reply); });
    peerParse.measure(kMessagesPerRound, [&] { peer.parse(reply); });
  }
  std::printf("Medians of %d rounds of %d messages of %zu bytes [5 %%, 95 %%]\n", kRounds,
              kMessagesPerRound, a.size());
  report("encode", ourBuild, peerBuild, allocationsOf([&] { ours.build(); }),
         allocationsOf([&] { peer.build(); }));
  report("decode", ourParse, peerParse, allocationsOf([&] { ours.parse(reply); }),
         allocationsOf([&] { peer.parse(reply); }));
  return 0;
}
