#include "platform/qt/type_ahead.h"

#include <QAbstractItemView>
#include <QApplication>
#include <algorithm>

namespace onramp::qt {

namespace {

bool hasWordThatStarts(const QString& text, const QString& start) {
  for (qsizetype at = 0; at < text.size(); ++at) {
    at = text.indexOf(start, at, Qt::CaseInsensitive);
    if (at < 0) return false;
    if (at == 0 || !text.at(at - 1).isLetterOrNumber()) return true;
  }
  return false;
}

// Returns the first row, starting at row `from`, in which a word starts with `start`. After the
// last row, continues at row 0. Returns -1 if no row matches.
int rowFrom(int from, const QAbstractItemModel& model, const QString& start) {
  const int count = model.rowCount();
  for (int step = 0; step < count; ++step) {
    const int row = (from + step) % count;
    if (hasWordThatStarts(model.index(row, 0).data().toString(), start)) return row;
  }
  return -1;
}

}  // namespace

void TypeAhead::type(QAbstractItemView& view, const QString& text) {
  if (text.isEmpty()) return;
  const bool continues =
      sinceLast_.isValid() && sinceLast_.elapsed() < QApplication::keyboardInputInterval();
  sinceLast_.start();
  const bool isAgain = !continues && typed_ == text;
  typed_ = continues ? typed_ + text : text;

  const QAbstractItemModel& model = *view.model();
  const int current = std::max(view.currentIndex().row(), 0);
  int row = rowFrom(isAgain ? current + 1 : current, model, typed_);
  const bool isOneLetter = typed_.count(typed_.front(), Qt::CaseInsensitive) == typed_.size();
  if (row < 0 && isOneLetter) row = rowFrom(current + 1, model, typed_.left(1));
  if (row >= 0) view.setCurrentIndex(model.index(row, 0));
}

}  // namespace onramp::qt
