#pragma once

#include <map>
#include <string>
#include <vector>

#include "platform/net_service.h"

namespace onramp::recording {

/// A scripted network. A test reports services as found, resolved and gone, and sees what the
/// program asked for. The program gets each event at once, as if the main loop had delivered it.
class Network {
 public:
  static Network& instance();

  /// Restores the initial state. Earlier browsers get no more events.
  void reset() { *this = Network(); }

  /// Creates a service like those that a browser passes to its client.
  [[nodiscard]] static NetServiceRef service(const std::string& name, const std::string& type,
                                             const std::string& domain = "local.");

  /// These functions tell every running browser for the service's type that the service was found
  /// or is gone.
  void found(const NetServiceRef& service);
  void gone(const NetServiceRef& service);

  /// These functions end the service's running resolve: resolves() with `addresses` and `txt`
  /// as its results, and failsToResolve() with kNetServiceErrorTimeout. Both do nothing when
  /// no resolve is running.
  void resolves(const NetServiceRef& service, std::vector<Data> addresses, Data txt = {});
  void failsToResolve(const NetServiceRef& service);

  [[nodiscard]] static bool isResolving(const NetServiceRef& service);

  /// Sets the service's addresses and TXT data without a resolve.
  static void fill(const NetServiceRef& service, std::vector<Data> addresses,
                   std::optional<Data> txt);

  /// The addresses that a resolve without a client finds. A key is a service's full name, such as
  /// "Office._ipp._tcp.local.". For any other service, a resolve without a client fails.
  std::map<std::string, std::vector<Data>> answers;

  bool searchesStart = true;                 ///< when false, no search can be started
  std::string domain;                        ///< the domain of the latest search
  std::vector<double> timeouts;              ///< the time limit of every resolve, in seconds
  bool cancelled = false;                    ///< cancel() was called after the latest resolve began
  std::vector<NetServiceBrowser*> browsers;  ///< the browsers that are searching
};

/// These functions return a socket address in the layout that NetService::addressing() describes.
/// ipv6Address() returns the loopback address, ::1.
[[nodiscard]] Data ipv4Address(unsigned char a, unsigned char b, unsigned char c, unsigned char d);
[[nodiscard]] Data ipv6Address();

/// Returns the data of a TXT record that holds `strings`.
[[nodiscard]] Data txtData(const std::vector<std::string>& strings);

}  // namespace onramp::recording
