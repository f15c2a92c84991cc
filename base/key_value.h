#pragma once

#include <functional>
#include <map>
#include <string>
#include <string_view>
#include <vector>

namespace onramp {

/// Texts under keys, each shown wherever an interface file binds its key. Main thread only.
class KeyValueTexts {
 public:
  using Setter = std::function<void(const std::string&)>;

  /// Stores the text and hands it to everything bound to the key.
  void setValueForKey(const std::string& text, std::string_view key);

  /// The text under `key`; empty when none was set.
  [[nodiscard]] std::string valueForKey(std::string_view key) const;

  /// Calls `setter` with the key's text now, if it has one, and with every later one.
  void bind(std::string_view key, Setter setter);

 private:
  std::map<std::string, std::string, std::less<>> texts_;
  std::map<std::string, std::vector<Setter>, std::less<>> setters_;
};

}  // namespace onramp
