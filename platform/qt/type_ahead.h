#pragma once

#include <QElapsedTimer>
#include <QString>

class QAbstractItemView;

namespace onramp::qt {

/// Finds a row of a list by what the user types. A row matches if any word in its first column
/// starts with the typed text, ignoring case.
class TypeAhead {
 public:
  /// Call this when the user has typed `text`. Texts that are typed in quick succession are joined.
  /// Selects the first matching row from the current row on; after the last row, the search
  /// continues at the first one. If the user types the same text again after a pause, the search
  /// starts at the row after the current one. If the user types one letter several times quickly
  /// and no row matches the joined letters, searches for the single letter from the row after the
  /// current one. Does nothing when no row matches.
  void type(QAbstractItemView& view, const QString& text);

 private:
  QString typed_;
  QElapsedTimer sinceLast_;
};

}  // namespace onramp::qt
