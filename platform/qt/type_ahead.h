#pragma once

#include <QElapsedTimer>
#include <QString>

class QAbstractItemView;

namespace onramp::qt {

/// Selects a row of a list when the user types. A row matches if any word in its first column
/// starts with the typed text, ignoring case.
class TypeAhead {
 public:
  /// Call this when the user has typed `text`. Joins text that is typed in quick succession, and
  /// selects the first row that matches. The search starts at the current row, or at the next one
  /// if the user types the same text again after a pause. After the last row, it continues at the
  /// first row. If one letter was typed several times quickly and no row matches the joined
  /// letters, searches for the single letter from the next row on. Does nothing if no row matches.
  void type(QAbstractItemView& view, const QString& text);

 private:
  QString typed_;
  QElapsedTimer sinceLast_;
};

}  // namespace onramp::qt
