#pragma once

#include <atomic>
#include <cstddef>
#include <functional>
#include <optional>
#include <string>
#include <vector>

#include "base/value.h"

namespace onramp {

/// Holds a list's entries, their order and the selection. A bound table shows the list, and the
/// controller reports every change to this table. All functions except arrangedCount() must be
/// called on the main thread.
class ArrayController {
 public:
  /// Makes rearrange() sort the entries by their strings under `key`. An entry that has no string
  /// under `key` sorts as if the string were empty. With an empty `key`, which is the default,
  /// rearrange() does not change the order.
  void setSortKey(std::string key) { sortKey_ = std::move(key); }

  /// Appends `entries` without sorting the list. If the list was empty, its first new entry becomes
  /// selected. Does nothing when `entries` is empty.
  void addObjects(std::vector<Dictionary> entries);

  /// Removes every entry equal to `entry`. If the selected entry is removed, the next remaining
  /// entry becomes selected; if no entry follows, the last entry becomes selected. If the list
  /// becomes empty, the selection is cleared. Does nothing when no entry is equal to `entry`.
  void removeObject(const Dictionary& entry);

  /// Removes all entries, and thereby clears the selection.
  void removeAllObjects();

  /// Sorts the entries by their strings under the key of setSortKey(), in ascending byte order.
  /// Entries with equal strings keep their order. The selected entry stays selected.
  void rearrange();

  /// The entries in the list's order.
  [[nodiscard]] const std::vector<Dictionary>& arrangedObjects() const { return entries_; }

  /// The number of entries. Callable from any thread.
  [[nodiscard]] std::size_t arrangedCount() const { return count_; }

  /// Selects the entry at `index`. An index past the end clears the selection.
  void setSelectionIndex(std::size_t index);

  /// Selects the first entry equal to `entry`. Clears the selection when no entry is equal.
  void setSelectedObject(const Dictionary& entry);

  /// choose() selects an entry as setSelectionIndex() does, and chooseObject() as
  /// setSelectedObject() does. Both also record that the user has made a selection, even when they
  /// clear the selection. The bound table calls choose().
  void choose(std::size_t index);
  void chooseObject(const Dictionary& entry);

  /// Whether the user has made a selection. The result is false at first, true after choose() and
  /// chooseObject(), and false again once the selected entry has been removed or removeAllObjects()
  /// has been called.
  [[nodiscard]] bool hasChoice() const { return hasChoice_; }

  /// Return the index of the selected entry, and the entry itself. Both return nothing when no
  /// entry is selected.
  [[nodiscard]] std::optional<std::size_t> selectionIndex() const { return selection_; }
  [[nodiscard]] std::optional<Dictionary> selectedObject() const;

  /// Binds a table to the list. Calls `onChange` at once, and from then on after every change of
  /// the entries and every call of rearrange() and removeAllObjects(). `onSelect` is called after
  /// every call of setSelectionIndex(), setSelectedObject(), choose() and chooseObject(). A later
  /// call of bind() replaces both functions. Empty functions unbind the table.
  void bind(std::function<void()> onChange, std::function<void()> onSelect);

 private:
  void entriesChanged();
  [[nodiscard]] std::size_t indexOf(const Dictionary& entry) const;

  std::vector<Dictionary> entries_;
  std::optional<std::size_t> selection_;
  bool hasChoice_ = false;
  std::atomic<std::size_t> count_ = 0;
  std::string sortKey_;
  std::function<void()> onChange_;
  std::function<void()> onSelect_;
};

}  // namespace onramp
