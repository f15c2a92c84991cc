#pragma once

#include <map>
#include <string>
#include <vector>

#include "platform/net_service.h"

namespace onramp::recording {

/// A scripted network. A test says which services are found, resolved and gone, and sees what the
/// program asked for. Events reach the program at once, as if they came from the main loop.
class Network {
 public:
  static Network& instance();

  /// Returns to the initial state. Earlier browsers and services get no more events.
  void reset() { *this = Network(); }

  /// Makes a service object like those that browse events carry.
  [[nodiscard]] static NetServiceRef service(const std::string& name, const std::string& type,
                                             const std::string& domain = "local.");

  /// Tell every running browser for the service's type that the service was found or is gone.
  void found(const NetServiceRef& service);
  void gone(const NetServiceRef& service);

  /// End the service's running resolve. They do nothing when there is none.
  void resolves(const NetServiceRef& service, std::vector<Data> addresses, Data txt = {});
  void failsToResolve(const NetServiceRef& service);

  [[nodiscard]] static bool isResolving(const NetServiceRef& service);

  /// Gives the service addresses and TXT data without a resolve.
  static void fill(const NetServiceRef& service, std::vector<Data> addresses,
                   std::optional<Data> txt);

  /// The addresses that a blocking resolve finds, by "name.typedomain". A blocking resolve of any
  /// other service fails.
  std::map<std::string, std::vector<Data>> answers;

  bool searchesStart = true;
  std::string domain;                        ///< of the latest search
  std::vector<double> timeouts;              ///< of every resolve
  bool cancelled = false;                    ///< whether the latest resolve was cancelled
  std::vector<NetServiceBrowser*> browsers;  ///< the browsers that are searching
};

/// Socket addresses in the BSD layout.
[[nodiscard]] Data ipv4Address(unsigned char a, unsigned char b, unsigned char c, unsigned char d);
[[nodiscard]] Data ipv6Address();

/// TXT data that holds `strings`.
[[nodiscard]] Data txtData(const std::vector<std::string>& strings);

}  // namespace onramp::recording
