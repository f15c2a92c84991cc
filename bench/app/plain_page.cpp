// Shows a page like the wizard's first page, written in plain Qt. start_up.py compares the start-up
// of this program with the wizard's.

#include <QApplication>
#include <QLabel>
#include <QListWidget>
#include <QMainWindow>
#include <QMenuBar>
#include <QPushButton>
#include <QScreen>
#include <QVBoxLayout>
#include <memory>
#include <utility>

namespace {

constexpr int kModels = 100;

// Creates an object that its Qt parent deletes.
template <typename Child, typename... Arguments>
Child* make(Arguments&&... arguments) {
  return std::make_unique<Child>(std::forward<Arguments>(arguments)...).release();
}

}  // namespace

int main(int argc, char** argv) {
  const QApplication application(argc, argv);
  QApplication::setStyle(QStringLiteral("Fusion"));
  QMainWindow window;
  window.menuBar()->addMenu(QStringLiteral("Menu"))->addAction(QStringLiteral("Quit"));

  auto* const page = make<QWidget>(&window);
  auto* const rows = make<QVBoxLayout>(page);
  auto* const title = make<QLabel>(QStringLiteral("Select Your Model"));
  QFont font = title->font();
  font.setPointSizeF(font.pointSizeF() * 1.5);
  font.setBold(true);
  title->setFont(font);
  rows->addWidget(title);
  rows->addWidget(make<QLabel>(QStringLiteral("Select the model that you want to set up.")));
  auto* const list = make<QListWidget>();
  for (int i = 0; i < kModels; ++i) {
    list->addItem(QStringLiteral("Kestrel Model %1").arg(i, 5, 10, QLatin1Char('0')));
  }
  list->setCurrentRow(0);
  rows->addWidget(list);
  auto* const buttons = make<QHBoxLayout>();
  for (const char* const text : {"Cancel", "Next"}) {
    buttons->addWidget(make<QPushButton>(QLatin1String(text)));
  }
  rows->addLayout(buttons);
  window.setCentralWidget(page);

  window.setFixedSize(680, 510);
  window.move(window.screen()->geometry().center() - window.rect().center());
  window.show();
  return QApplication::exec();
}
