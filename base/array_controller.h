#pragma once

#include <atomic>
#include <cstddef>
#include <functional>
#include <optional>
#include <string>
#include <vector>

#include "base/value.h"

namespace onramp {

/// Holds a list's entries, their order and the selection, and feeds the table that shows them.
/// Main thread only, but for arrangedCount().
class ArrayController {
 public:
  /// Entries are shown in ascending order of their text under `key`, compared byte by byte, from
  /// the next rearrange() on. Without a sort key they stay in the order in which they were added.
  void setSortKey(std::string key) { sortKey_ = std::move(key); }

  /// Appends entries; they take their places at the next rearrange().
  void addObjects(std::vector<Dictionary> entries);

  /// Removes every entry equal to `entry`.
  void removeObject(const Dictionary& entry);

  void removeAllObjects();

  /// Sorts the entries anew. The selected entry stays selected.
  void rearrange();

  [[nodiscard]] const std::vector<Dictionary>& arrangedObjects() const { return entries_; }

  /// The number of listed entries. Callable from any thread.
  [[nodiscard]] std::size_t arrangedCount() const { return count_; }

  /// Selects the entry at `index`; past the end, nothing is selected.
  void setSelectionIndex(std::size_t index);

  /// Selects the first entry equal to `entry`; nothing is selected when there is none.
  void setSelectedObject(const Dictionary& entry);

  /// Selects the entry at `index` because the user wants it. The table that is bound calls this.
  void choose(std::size_t index);

  /// Whether the user has chosen an entry since the last removeAllObjects().
  [[nodiscard]] bool hasChoice() const { return hasChoice_; }

  /// A list with entries always has a selected one unless it was taken away on purpose: the first
  /// entry added is selected, and when the selected one is removed its successor is.
  [[nodiscard]] std::optional<std::size_t> selectionIndex() const { return selection_; }
  [[nodiscard]] std::optional<Dictionary> selectedObject() const;

  /// `onChange` is called after every change of the entries, `onSelect` after every other change of
  /// the selection. The table that is bound sets them; there is one at the most.
  void bind(std::function<void()> onChange, std::function<void()> onSelect);

 private:
  void entriesChanged();

  std::vector<Dictionary> entries_;
  std::optional<std::size_t> selection_;
  bool hasChoice_ = false;
  std::atomic<std::size_t> count_ = 0;
  std::string sortKey_;
  std::function<void()> onChange_;
  std::function<void()> onSelect_;
};

}  // namespace onramp
