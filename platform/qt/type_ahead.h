#pragma once

#include <QElapsedTimer>
#include <QString>

class QAbstractItemView;

namespace onramp::qt {

/// Finds a row of a list by what the user types. A row matches if any word of its text starts with
/// the typed text, ignoring case.
class TypeAhead {
 public:
  /// Call this when the user has typed `text`. Selects the first matching row, starting at the
  /// current row. If the user types the same letter again, selects the next match.
  void type(QAbstractItemView& view, const QString& text);

 private:
  QString typed_;
  QElapsedTimer sinceLast_;
};

}  // namespace onramp::qt
