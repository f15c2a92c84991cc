#include "platform/qt/accessibility.h"

#include <QAccessibleWidget>
#include <QLabel>
#include <memory>

#include "platform/qt/native.h"
#include "platform/qt/radio_matrix.h"

namespace onramp::qt {

namespace {

class Group final : public QAccessibleWidget {
 public:
  explicit Group(RadioMatrixWidget* matrix) : QAccessibleWidget(matrix, QAccessible::Grouping) {}
};

class Heading final : public QAccessibleWidget {
 public:
  explicit Heading(QLabel* label) : QAccessibleWidget(label, QAccessible::Heading) {}

  [[nodiscard]] QString text(QAccessible::Text kind) const override {
    if (kind != QAccessible::Name) return QAccessibleWidget::text(kind);
    return static_cast<const QLabel*>(widget())->text();
  }
};

// Qt takes ownership of the returned object.
QAccessibleInterface* interfaceOf(const QString&, QObject* object) {
  if (auto* const matrix = qobject_cast<RadioMatrixWidget*>(object)) {
    return std::make_unique<Group>(matrix).release();
  }
  auto* const label = qobject_cast<QLabel*>(object);
  if (!label || !label->property(kHeading).toBool()) return nullptr;
  return std::make_unique<Heading>(label).release();
}

}  // namespace

void describeControls() {
  QAccessible::installFactory(interfaceOf);
}

}  // namespace onramp::qt
