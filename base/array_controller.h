#pragma once

#include <atomic>
#include <cstddef>
#include <functional>
#include <optional>
#include <string>
#include <vector>

#include "base/value.h"

namespace onramp {

/// Holds the entries of a list, their order and the selection. A table that is bound to the
/// controller shows the list and is notified of every change. All functions except arrangedCount()
/// must be called on the main thread.
class ArrayController {
 public:
  /// Makes rearrange() sort the entries by the string that each has under `key`. An entry without a
  /// string under `key` is sorted as if the string were empty. With an empty `key`, which is the
  /// default, rearrange() does not change the order.
  void setSortKey(std::string key) { sortKey_ = std::move(key); }

  /// Appends `entries` without sorting the list. If the list was empty, selects the first of them.
  /// Does nothing when `entries` is empty.
  void addObjects(std::vector<Dictionary> entries);

  /// Removes every entry equal to `entry`. If the selected entry is removed, selects the next
  /// remaining entry, or the last one if none follows. If the list becomes empty, clears the
  /// selection. Does nothing when no entry is equal to `entry`.
  void removeObject(const Dictionary& entry);

  /// Removes all entries and clears the selection.
  void removeAllObjects();

  /// Sorts the entries by the bytes of their strings under the sort key, in ascending order.
  /// Entries with equal strings keep their order. The selected entry stays selected.
  void rearrange();

  /// The entries in the list's order.
  [[nodiscard]] const std::vector<Dictionary>& arrangedObjects() const { return entries_; }

  /// The number of entries. Callable from any thread.
  [[nodiscard]] std::size_t arrangedCount() const { return count_; }

  /// Selects the entry at `index`. An index past the end clears the selection.
  void setSelectionIndex(std::size_t index);

  /// Selects the first entry equal to `entry`. Clears the selection when there is none.
  void setSelectedObject(const Dictionary& entry);

  /// choose() selects like setSelectionIndex(), and chooseObject() like setSelectedObject(). Both
  /// also record that the user made a choice, even if the choice clears the selection. The bound
  /// table calls choose().
  void choose(std::size_t index);
  void chooseObject(const Dictionary& entry);

  /// Whether the user has made a choice. choose() and chooseObject() make this true. It becomes
  /// false again when the selected entry is removed or removeAllObjects() is called.
  [[nodiscard]] bool hasChoice() const { return hasChoice_; }

  /// These functions return the selected entry's index and the entry itself, or nothing when no
  /// entry is selected.
  [[nodiscard]] std::optional<std::size_t> selectionIndex() const { return selection_; }
  [[nodiscard]] std::optional<Dictionary> selectedObject() const;

  /// Binds a table to the list. Calls `onChange` at once, then after every change to the entries
  /// and after every call to rearrange() and removeAllObjects(). Calls `onSelect` after every call
  /// to setSelectionIndex(), setSelectedObject(), choose() and chooseObject(). A later call to
  /// bind() replaces both functions. Empty functions unbind the table.
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
