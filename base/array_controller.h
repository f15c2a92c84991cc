#pragma once

#include <atomic>
#include <cstddef>
#include <functional>
#include <optional>
#include <string>
#include <vector>

#include "base/value.h"

namespace onramp {

/// Holds the entries of a list, their order and the selection, and updates the table that shows
/// them. All functions except arrangedCount() must be called on the main thread.
class ArrayController {
 public:
  /// Makes rearrange() sort the entries by their text under `key`, ascending, compared byte by
  /// byte. An entry without such a text sorts as if the text were empty. Without a sort key entries
  /// stay in the order in which they were added.
  void setSortKey(std::string key) { sortKey_ = std::move(key); }

  /// Appends `entries`. The next rearrange() sorts them in. If the list was empty, the first of
  /// them becomes the selected entry.
  void addObjects(std::vector<Dictionary> entries);

  /// Removes every entry equal to `entry`. If the selected entry is among them, the next entry that
  /// stays becomes selected, or the last one when no entry follows.
  void removeObject(const Dictionary& entry);

  void removeAllObjects();

  /// Sorts the entries by the sort key. Entries that compare equal keep their order. The selected
  /// entry stays selected.
  void rearrange();

  [[nodiscard]] const std::vector<Dictionary>& arrangedObjects() const { return entries_; }

  /// The number of entries. Callable from any thread.
  [[nodiscard]] std::size_t arrangedCount() const { return count_; }

  /// Selects the entry at `index`. An index past the end clears the selection.
  void setSelectionIndex(std::size_t index);

  /// Selects the first entry equal to `entry`. Clears the selection when there is none.
  void setSelectedObject(const Dictionary& entry);

  /// Selects the entry at `index` because the user wants it. The table that is bound calls this.
  void choose(std::size_t index);

  /// Whether the user has chosen an entry since the last removeAllObjects().
  [[nodiscard]] bool hasChoice() const { return hasChoice_; }

  /// The selected entry; nothing when the list is empty or the selection was cleared.
  [[nodiscard]] std::optional<std::size_t> selectionIndex() const { return selection_; }
  [[nodiscard]] std::optional<Dictionary> selectedObject() const;

  /// Sets what a table does about changes: `onChange` is called now and after every change of the
  /// entries, `onSelect` after a change of the selection alone. They replace those of an earlier
  /// call; empty functions unbind the table.
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
