#include "platform/libplist/binary_gate.h"

#include <algorithm>
#include <vector>

#include "base/byte_reader.h"
#include "platform/property_list.h"

namespace onramp::libplist {

namespace {

constexpr std::string_view kHeader = "bplist00";
constexpr std::size_t kTrailerSize = 32;

// An object's kind is stored in the upper four bits of the object's first byte.
enum Kind : std::uint64_t {
  kSimple = 0x0,
  kInteger = 0x1,
  kReal = 0x2,
  kDate = 0x3,
  kData = 0x4,
  kASCII = 0x5,
  kUTF16 = 0x6,
  kUID = 0x8,
  kArray = 0xA,
  kSet = 0xC,
  kDictionary = 0xD,
};

// The total size of an object and of everything that it refers to. A shared object counts once for
// each reference to it.
struct Cost {
  std::uint64_t objects = 1;
  std::uint64_t bytes = 0;
  std::size_t depth = 0;

  // The sums cannot overflow, because both costs are within the limits.
  void add(const Cost& inner) {
    objects += inner.objects;
    bytes += inner.bytes;
    depth = std::max(depth, inner.depth + 1);
  }

  [[nodiscard]] bool withinLimits() const {
    return objects <= kMostPropertyListObjects && bytes <= kMostPropertyListBytes &&
           depth <= kMostPropertyListDepth;
  }
};

// Offsets, references and UIDs may take any number of bytes from 1 to 8, not only powers of two.
bool isNumberSize(std::uint64_t size) {
  return size >= 1 && size <= 8;
}

class BinaryWalk {
 public:
  BinaryWalk(std::string_view bytes, ParseProblem& problem) : bytes_(bytes), problem_(problem) {}

  bool run() {
    if (!bytes_.starts_with(kHeader)) return refuse("a binary list of an unknown version", 0);
    if (bytes_.size() < kHeader.size() + kTrailerSize) {
      return refuse("a binary list that is cut off", bytes_.size());
    }
    ByteReader trailer(bytes_.substr(bytes_.size() - kTrailerSize + 6));
    const std::uint64_t offsetSize = trailer.number(1).value_or(0);
    const std::uint64_t referenceSize = trailer.number(1).value_or(0);
    const std::uint64_t objects = trailer.number(8).value_or(0);
    const std::uint64_t root = trailer.number(8).value_or(0);
    const std::uint64_t table = trailer.number(8).value_or(0);
    if (!isNumberSize(offsetSize) || !isNumberSize(referenceSize) ||
        objects > kMostPropertyListObjects || table < kHeader.size() ||
        table > bytes_.size() - kTrailerSize) {
      return refuse("a binary list whose trailer (its last 32 bytes) is damaged or exceeds a limit",
                    bytes_.size() - kTrailerSize);
    }
    referenceSize_ = static_cast<std::size_t>(referenceSize);
    objects_ = bytes_.substr(0, static_cast<std::size_t>(table));
    ByteReader offsets(
        bytes_.substr(objects_.size(), bytes_.size() - kTrailerSize - objects_.size()));
    offsets_.reserve(static_cast<std::size_t>(objects));
    for (std::uint64_t i = 0; i < objects; ++i) {
      const auto offset = offsets.number(static_cast<std::size_t>(offsetSize));
      if (!offset)
        return refuse("a binary list whose table of offsets is cut off", objects_.size());
      offsets_.push_back(*offset);
    }
    states_.resize(offsets_.size());
    if (root >= objects) return refuse("a binary list without a root object", bytes_.size() - 16);
    return visit(static_cast<std::size_t>(root), 0);
  }

 private:
  bool refuse(const char* reason, std::uint64_t where) {
    problem_.note(reason, static_cast<std::size_t>(std::min<std::uint64_t>(where, bytes_.size())));
    return false;
  }

  enum class Progress { kUnseen, kOpen, kDone };
  struct State {
    Progress progress = Progress::kUnseen;
    Cost cost;
  };

  // Returns a reader for the bytes from the object to the table of offsets. The reader is empty if
  // the object is not before the table.
  [[nodiscard]] ByteReader objectAt(std::size_t index) const {
    const std::uint64_t offset = offsets_[index];
    return ByteReader(objects_.substr(std::min<std::uint64_t>(offset, objects_.size())));
  }

  // Computes the object's cost. Returns false when libplist must not build the object. The depth
  // limit bounds the recursion.
  bool visit(std::size_t index, std::size_t depth) {
    State& state = states_[index];
    if (state.progress == Progress::kOpen) {
      return refuse("a container that contains itself", offsets_[index]);
    }
    if (depth > kMostPropertyListDepth) {
      return refuse("containers that are nested more deeply than the limit allows",
                    offsets_[index]);
    }
    if (state.progress == Progress::kDone) return true;
    state.progress = Progress::kOpen;
    ByteReader object = objectAt(index);
    const auto marker = object.byte();
    if (!marker || !measure(*marker >> 4U, *marker & 0xFU, object, state.cost, depth)) {
      return refuse("a damaged object", offsets_[index]);
    }
    state.progress = Progress::kDone;
    return state.cost.withinLimits() || refuse("more content than the limits allow", 0);
  }

  bool measure(std::uint64_t kind, std::uint64_t low, ByteReader& object, Cost& cost,
               std::size_t depth) {
    switch (kind) {
      case kSimple:
        return low == 0x8 || low == 0x9;  // false and true; a list cannot contain null
      case kInteger:
        return low <= 4 && object.skip(std::uint64_t{1} << low);
      case kReal:
        return (low == 2 || low == 3) && object.skip(std::uint64_t{1} << low);
      case kDate:
        return low == 3 && object.skip(8);
      case kUID:
        return isNumberSize(low + 1) &&
               object.number(static_cast<std::size_t>(low) + 1).value_or(UINT64_MAX) <= UINT32_MAX;
      case kData:
      case kASCII:
        return measureBytes(count(low, object), 1, object, cost);
      case kUTF16:
        return measureUTF16(count(low, object), object, cost);
      case kArray:
      case kSet:
        return measureItems(count(low, object), object, cost, depth);
      case kDictionary:
        return measureEntries(count(low, object), object, cost, depth);
      default:
        return false;
    }
  }

  // Returns the number of items in a container, or of units in a string or data object. Returns
  // UINT64_MAX, which exceeds every limit, when this number is malformed.
  static std::uint64_t count(std::uint64_t low, ByteReader& object) {
    if (low < 0xF) return low;
    const std::uint64_t marker = object.number(1).value_or(0);
    if (marker >> 4 != kInteger || (marker & 0xF) > 3) return UINT64_MAX;
    return object.number(std::size_t{1} << (marker & 0xF)).value_or(UINT64_MAX);
  }

  static bool measureBytes(std::uint64_t units, std::uint64_t unitSize, ByteReader& object,
                           Cost& cost) {
    if (units > kMostPropertyListBytes) return false;
    cost.bytes = units * unitSize;
    return object.skip(cost.bytes);
  }

  // Refuses every UTF-16 string that contains a null character, because libplist terminates the
  // process when a key contains one.
  static bool measureUTF16(std::uint64_t units, ByteReader& object, Cost& cost) {
    ByteReader text = object;
    if (!measureBytes(units, 2, object, cost)) return false;
    for (std::uint64_t i = 0; i < units; ++i) {
      if (text.number(2) == 0U) return false;
    }
    return true;
  }

  bool measureItems(std::uint64_t items, ByteReader& object, Cost& cost, std::size_t depth) {
    if (items > kMostPropertyListObjects) return false;
    for (std::uint64_t i = 0; i < items; ++i) {
      const auto item = object.number(referenceSize_);
      if (!item || *item >= states_.size()) return false;
      const auto index = static_cast<std::size_t>(*item);
      if (!visit(index, depth + 1)) return false;
      cost.add(states_[index].cost);
      if (!cost.withinLimits()) return refuse("more content than the limits allow", 0);
    }
    return true;
  }

  bool measureEntries(std::uint64_t entries, ByteReader& object, Cost& cost, std::size_t depth) {
    ByteReader keys = object;
    for (std::uint64_t i = 0; i < std::min(entries, kMostPropertyListObjects); ++i) {
      const auto key = keys.number(referenceSize_);
      if (!key || *key >= states_.size()) return false;
      const auto marker = objectAt(static_cast<std::size_t>(*key)).byte();
      if (!marker || (*marker >> 4U != kASCII && *marker >> 4U != kUTF16)) return false;
    }
    return entries <= kMostPropertyListObjects && measureItems(2 * entries, object, cost, depth);
  }

  std::string_view bytes_;
  ParseProblem& problem_;
  std::string_view objects_;  ///< the file up to the table of offsets
  std::size_t referenceSize_ = 0;
  std::vector<std::uint64_t> offsets_;
  std::vector<State> states_;
};

}  // namespace

bool mayReadBinary(std::string_view bytes, ParseProblem& problem) {
  if (bytes.size() > kMostPropertyListBytes) {
    problem.note("more bytes than the limit allows", 0);
    return false;
  }
  return BinaryWalk(bytes, problem).run();
}

}  // namespace onramp::libplist
