#pragma once

#include <functional>
#include <map>
#include <string>
#include <vector>

#include "platform/net_service.h"

namespace onramp::recording {

/// A network without a wire: a test says what is found, what resolves and what is gone, and sees
/// what the program asked for. Events reach the program at once, as from the main loop.
class Network {
 public:
  static Network& instance();

  /// Back to the beginning; browsers and services of before are on no network any more.
  void reset();

  /// A service object like those that browse events carry.
  [[nodiscard]] static NetServiceRef service(const std::string& name, const std::string& type,
                                             const std::string& domain = "local.");

  /// Tells every running browser of the service's type.
  void found(const NetServiceRef& service);
  void gone(const NetServiceRef& service);

  /// Ends the service's running resolve; nothing happens when none runs.
  void resolves(const NetServiceRef& service, std::vector<Data> addresses, Data txt = {});
  void failsToResolve(const NetServiceRef& service);

  [[nodiscard]] static bool isResolving(const NetServiceRef& service);

  /// Gives the service addresses and TXT data without a resolve.
  static void fill(const NetServiceRef& service, std::vector<Data> addresses,
                   std::optional<Data> txt);

  /// What a blocking resolve of "name.typedomain" finds; it fails for all others.
  std::map<std::string, std::vector<Data>> answers;

  bool searchesStart = true;
  std::vector<std::string> log;  ///< every call of the seam, in order, such as "browser schedule"
  std::vector<double> timeouts;  ///< of every resolve
  std::vector<NetServiceBrowser*> browsers;  ///< those that search
};

/// A socket address in the BSD layout.
[[nodiscard]] Data ipv4Address(unsigned char a, unsigned char b, unsigned char c, unsigned char d);
[[nodiscard]] Data ipv6Address();

/// TXT data with one string for each of `strings`.
[[nodiscard]] Data txtData(const std::vector<std::string>& strings);

}  // namespace onramp::recording
