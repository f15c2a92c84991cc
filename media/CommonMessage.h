#pragma once

#include <optional>
#include <string>

namespace onramp {

/// The texts that the user sees, from the message bundle on the medium.
class CommonMessage {
 public:
  CommonMessage() = delete;

  [[nodiscard]] static std::string convertRelativePathToFullPath(
      const std::optional<std::string>& relativePath);

  /// The text of `key` in the user's language; `value` when the medium has no message bundle or the
  /// table (the default one when `table` is null) lacks the key. The bundle is opened anew every
  /// time.
  [[nodiscard]] static std::string localizedStringForKey(const std::string& key,
                                                         const std::string& value,
                                                         const std::optional<std::string>& table);
};

/// The text of `key`, which stands for itself when the medium has no text for it.
[[nodiscard]] std::string localized(const std::string& key);

/// The text of `key`, or `fallback` when the medium has no text for it.
[[nodiscard]] std::string localized(const std::string& key, const std::string& fallback);

}  // namespace onramp
