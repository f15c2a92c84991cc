#include "tests/recording/network.h"

#include <algorithm>
#include <utility>

namespace onramp {

namespace recording {

namespace {

class ScriptedService final : public NetService,
                              public std::enable_shared_from_this<ScriptedService> {
 public:
  ScriptedService(std::string name, std::string type, std::string domain)
      : name_(std::move(name)), type_(std::move(type)), domain_(std::move(domain)) {}

  [[nodiscard]] std::optional<std::string> name() const override { return name_; }
  [[nodiscard]] std::optional<std::string> type() const override { return type_; }
  [[nodiscard]] std::optional<std::string> domain() const override { return domain_; }
  [[nodiscard]] std::vector<Data> addressing() const override { return addresses; }
  [[nodiscard]] std::optional<Data> txtData() const override { return txt; }

  void setClient(Client client, void* info) override {
    client_ = client;
    info_ = info;
  }
  void schedule() override { scheduled_ = true; }
  void unschedule() override { scheduled_ = false; }
  bool resolveWithTimeout(std::chrono::duration<double> timeLimit) override {
    addresses.clear();
    txt.reset();
    Network::instance().timeouts.push_back(timeLimit.count());
    Network::instance().cancelled = false;
    if (client_) {
      resolving = true;
      return true;
    }
    const auto& answers = Network::instance().answers;
    const auto answer = answers.find(name_ + '.' + type_ + domain_);
    if (answer == answers.end()) return false;
    addresses = answer->second;
    return true;
  }
  void cancel() override {
    Network::instance().cancelled = true;
    resolving = false;
  }

  void end(std::int32_t code) {
    if (!std::exchange(resolving, false) || !scheduled_) return;
    client_(shared_from_this(), {code}, info_);
  }

  bool resolving = false;
  std::vector<Data> addresses;
  std::optional<Data> txt;

 private:
  std::string name_;
  std::string type_;
  std::string domain_;
  Client client_ = nullptr;
  void* info_ = nullptr;
  bool scheduled_ = false;
};

ScriptedService& scripted(const NetServiceRef& service) {
  return static_cast<ScriptedService&>(*service);
}

class ScriptedBrowser final : public NetServiceBrowser,
                              public std::enable_shared_from_this<ScriptedBrowser> {
 public:
  ScriptedBrowser(Client client, void* info) : client_(client), info_(info) {}
  ScriptedBrowser(const ScriptedBrowser&) = delete;
  ScriptedBrowser& operator=(const ScriptedBrowser&) = delete;
  ~ScriptedBrowser() override { std::erase(Network::instance().browsers, this); }

  void schedule() override {}
  void unschedule() override {}
  bool searchForServices(const std::string& domain, const std::string& type) override {
    Network::instance().domain = domain;
    if (!Network::instance().searchesStart) return false;
    type_ = type;
    Network::instance().browsers.push_back(this);
    return true;
  }
  void invalidate() override {}
  void stopSearch() override { std::erase(Network::instance().browsers, this); }

  void tell(unsigned long flags, const NetServiceRef& service) {
    if (service->type() == type_) client_(shared_from_this(), flags, service, {0}, info_);
  }

 private:
  Client client_;
  void* info_;
  std::string type_;
};

void tellAll(unsigned long flags, const NetServiceRef& service) {
  for (NetServiceBrowser* const browser : std::vector(Network::instance().browsers)) {
    static_cast<ScriptedBrowser*>(browser)->tell(flags, service);
  }
}

}  // namespace

Network& Network::instance() {
  static Network network;
  return network;
}

NetServiceRef Network::service(const std::string& name, const std::string& type,
                               const std::string& domain) {
  return std::make_shared<ScriptedService>(name, type, domain);
}

void Network::found(const NetServiceRef& service) {
  tellAll(0, service);
}

void Network::gone(const NetServiceRef& service) {
  tellAll(kNetServiceFlagRemove, service);
}

void Network::resolves(const NetServiceRef& service, std::vector<Data> addresses, Data txt) {
  if (!isResolving(service)) return;
  fill(service, std::move(addresses), std::move(txt));
  scripted(service).end(0);
}

void Network::failsToResolve(const NetServiceRef& service) {
  scripted(service).end(kNetServiceErrorTimeout);
}

bool Network::isResolving(const NetServiceRef& service) {
  return scripted(service).resolving;
}

void Network::fill(const NetServiceRef& service, std::vector<Data> addresses,
                   std::optional<Data> txt) {
  scripted(service).addresses = std::move(addresses);
  scripted(service).txt = std::move(txt);
}

Data ipv4Address(unsigned char a, unsigned char b, unsigned char c, unsigned char d) {
  Data address(16);
  address[0] = std::byte{16};
  address[1] = std::byte{2};
  const unsigned char bytes[] = {a, b, c, d};
  std::transform(std::begin(bytes), std::end(bytes), address.begin() + 4,
                 [](unsigned char byte) { return std::byte{byte}; });
  return address;
}

Data ipv6Address() {
  Data address(28);
  address[0] = std::byte{28};
  address[1] = std::byte{30};
  address[23] = std::byte{1};
  return address;
}

Data txtData(const std::vector<std::string>& strings) {
  Data data;
  for (const std::string& string : strings) {
    data.push_back(static_cast<std::byte>(string.size()));
    std::transform(string.begin(), string.end(), std::back_inserter(data),
                   [](char c) { return static_cast<std::byte>(c); });
  }
  return data;
}

}  // namespace recording

NetServiceBrowserRef NetServiceBrowser::create(Client client, void* info) {
  return std::make_shared<recording::ScriptedBrowser>(client, info);
}

NetServiceRef NetService::create(const std::string& domain, const std::string& type,
                                 const std::string& name, std::int32_t) {
  return recording::Network::service(name, type, domain);
}

}  // namespace onramp
