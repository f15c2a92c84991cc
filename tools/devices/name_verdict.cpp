#include "tools/devices/name_verdict.h"

#include <algorithm>
#include <array>
#include <string_view>

#include "base/ascii.h"
#include "bonjour/KSDevice.h"
#include "bonjour/identity_keys.h"
#include "bonjour/model_match.h"
#include "bonjour/txt_record.h"
#include "tools/check/spelling.h"
#include "tools/devices/text.h"

namespace onramp::devices {

namespace {

// TXT keys under which devices announce their maker or model. The wizard reads only one key of each
// list; the service type decides which.
constexpr std::array<std::string_view, 9> kMakerKeys{
    "usb_MFG", "mfg", "usb_MANUFACTURER", "manufacturer", "mfr", "vendor", "make", "ty", "product"};
constexpr std::array<std::string_view, 8> kModelKeys{"usb_MDL",   "mdl", "usb_MODEL", "model", "md",
                                                     "modelName", "ty",  "product"};

// Returns `text` without spaces at its ends, and with each run of spaces reduced to one.
std::string withSingleBlanks(std::string_view text) {
  std::string out;
  for (const char c : text) {
    if (c != ' ' || (!out.empty() && out.back() != ' ')) out += c;
  }
  if (!out.empty() && out.back() == ' ') out.pop_back();
  return out;
}

std::optional<TxtRecord> parsedText(const Device& device) {
  return device.txt ? TxtRecord::parse(*device.txt) : std::nullopt;
}

std::string textUnder(const Device& device, std::string_view key) {
  const auto text = parsedText(device);
  return text ? text->value(key).value_or("") : "";
}

// Returns the first of `keys`, other than `wanted`, under which the device announces a string.
// Returns nothing when there is no such key.
std::optional<std::string_view> otherKey(const Device& device, std::string_view wanted,
                                         std::span<const std::string_view> keys) {
  for (const std::string_view key : keys) {
    if (asciiLowercased(std::string(key)) == asciiLowercased(std::string(wanted))) continue;
    if (!textUnder(device, key).empty()) return key;
  }
  return std::nullopt;
}

// Returns the verdict on a device that announces nothing under `wanted`. `keys` is kMakerKeys or
// kModelKeys, and contains `wanted`.
Verdict missingKey(const Device& device, std::string_view wanted,
                   std::span<const std::string_view> keys) {
  const std::string key(wanted);
  if (const auto other = otherKey(device, wanted, keys)) {
    return {.id = "other-key",
            .why = "announces no " + key + ", but has the name under another key, " +
                   std::string(*other) + " = " + inQuotes(textUnder(device, *other)),
            .remedy = "the firmware must also announce the name under " + key};
  }
  const bool isModel = keys.data() == kModelKeys.data();
  return {.id = isModel ? "no-model" : "no-maker",
          .why = "announces no " + key,
          .remedy = "the firmware must announce the " + std::string(isModel ? "model" : "maker") +
                    " under " + key + "; a firmware update may help"};
}

Verdict differs(const char* id, const std::string& how, const std::string& announced,
                const std::string& model) {
  return {.id = id,
          .why = inQuotes(announced) + ' ' + how + " the medium's " + inQuotes(model),
          .remedy =
              "write the model in CDInfo.plist and ModelInfo.plist exactly as the device "
              "announces it, or correct the firmware"};
}

std::string edgeBlanks(const std::string& announced) {
  return announced.find("  ") != std::string::npos ? "has two spaces in a row, unlike"
                                                   : "differs only in spaces from";
}

// Returns the medium's model whose spelling is nearest to `announced`. If none is near, returns the
// first whose last words are `model`, ignoring case. `model` is the announced model without the
// maker. Returns nothing when there is no such model either.
std::optional<std::string> nearestOf(const std::string& announced, const std::string& model,
                                     const Medium& medium) {
  auto nearest = check::Spelling(medium.models).nearest(announced);
  for (const std::string& known : medium.models) {
    if (!nearest && asciiLowercased(known).ends_with(' ' + asciiLowercased(model))) nearest = known;
  }
  return nearest;
}

}  // namespace

std::vector<std::string> ipv4AddressesOf(const Dictionary& record) {
  std::vector<std::string> texts;
  if (const Array* const addresses = record.array(KSDevice::kIPAddressList)) {
    for (const Value& address : *addresses) {
      if (const auto* text = address.as<std::string>()) texts.push_back(*text);
    }
  }
  return texts;
}

std::optional<Verdict> judgeName(const Device& device, const Medium& medium) {
  if (isOneOf(medium.models, device.record)) return std::nullopt;
  const std::string maker = device.record.string(KSDevice::kUSBManufacturer).value_or("");
  const std::string model = device.record.string(KSDevice::kUSBModel).value_or("");
  const auto keys = identityKeysOf(device.type);
  if (!keys) {
    return Verdict{
        .id = "other-type",
        .why = "announced as " + device.type +
               ", a type for which the wizard cannot read a maker or model",
        .remedy = device.type == medium.type
                      ? "write another of the device's types into the medium's BonjourNetwork"
                      : "switch on the device's " + medium.type + " service"};
  }
  if (model.empty()) return missingKey(device, keys->model, kModelKeys);
  if (maker.empty()) return missingKey(device, keys->manufacturer, kMakerKeys);

  const std::string announced = modelTextOf(device.record);
  const std::string plain = withSingleBlanks(announced);
  for (const std::string& known : medium.models) {
    const std::string plainKnown = withSingleBlanks(known);
    if (plain == plainKnown) return differs("blanks", edgeBlanks(announced), announced, known);
    if (asciiLowercased(announced) == asciiLowercased(known)) {
      return differs("capitals", "differs only in capital letters from", announced, known);
    }
    if (asciiLowercased(plain) == asciiLowercased(plainKnown)) {
      return differs("capitals", "differs in capital letters and spaces from", announced, known);
    }
    if (asciiLowercased(withSingleBlanks(model)) == asciiLowercased(plainKnown)) {
      return differs("maker-twice", "repeats the maker, unlike", announced, known);
    }
  }
  const auto nearest = nearestOf(announced, model, medium);
  return Verdict{
      .id = "not-on-medium",
      .why = inQuotes(announced) + " is not a model of this medium" +
             (nearest ? "; the nearest model is " + inQuotes(*nearest) : ""),
      .remedy = std::string("use a medium for this model, or add the model to this medium") +
                (nearest ? "; if the nearest model is the same, write it on the medium exactly as "
                           "the device announces it"
                         : "")};
}

}  // namespace onramp::devices
