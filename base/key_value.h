#pragma once

#include <functional>
#include <map>
#include <string>
#include <string_view>
#include <vector>

namespace onramp {

/// A table that maps keys to texts. An interface file binds controls to keys; a bound control shows
/// the text for its key. All functions must be called on the main thread.
class KeyValueTexts {
 public:
  using Setter = std::function<void(const std::string&)>;

  /// Stores `text` under `key` and passes it to every setter bound to the key.
  void setValueForKey(const std::string& text, std::string_view key);

  /// Returns the text for `key`, or an empty string if no text has been set.
  [[nodiscard]] std::string valueForKey(std::string_view key) const;

  /// Calls `setter` now if `key` has a text, and again whenever a text is set for the key. The
  /// setter stays bound as long as this object lives, and must not call bind().
  void bind(std::string_view key, Setter setter);

 private:
  std::map<std::string, std::string, std::less<>> texts_;
  std::map<std::string, std::vector<Setter>, std::less<>> setters_;
};

}  // namespace onramp
