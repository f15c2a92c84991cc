#pragma once

#include <QElapsedTimer>
#include <QString>

class QAbstractItemView;

namespace onramp::qt {

/// Finds a list's row by what the user types: the start of any word of its text, whatever the case.
class TypeAhead {
 public:
  /// Selects the next row that matches, the current one included, when `text` was typed. The same
  /// letter typed again leads to the next match.
  void type(QAbstractItemView& view, const QString& text);

 private:
  QString typed_;
  QElapsedTimer sinceLast_;
};

}  // namespace onramp::qt
