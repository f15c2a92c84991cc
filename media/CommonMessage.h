#pragma once

#include <optional>
#include <string>

namespace onramp {

/// Access to the wizard's texts in the message bundle on the medium.
namespace CommonMessage {

/// Returns medium::fullPath(relativePath).
[[nodiscard]] std::string convertRelativePathToFullPath(
    const std::optional<std::string>& relativePath);

/// Returns the text for `key` in the user's language, or `value` when the medium has no text for
/// `key`. If `table` is not given, looks in the message bundle's default table. Every call opens
/// the bundle again.
[[nodiscard]] std::string localizedStringForKey(const std::string& key, const std::string& value,
                                                const std::optional<std::string>& table);

}  // namespace CommonMessage

/// Returns the text for `key`, or the key itself when the medium has no text for it.
[[nodiscard]] std::string localized(const std::string& key);

/// Returns the text for `key`, or `fallback` when the medium has no text for it.
[[nodiscard]] std::string localized(const std::string& key, const std::string& fallback);

}  // namespace onramp
