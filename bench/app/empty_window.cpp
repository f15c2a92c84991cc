// Shows an empty window of the wizard's size. start_up.py compares the start-up of this
// program with the wizard's.

#include <QApplication>
#include <QMainWindow>
#include <QScreen>

int main(int argc, char** argv) {
  const QApplication application(argc, argv);
  QApplication::setStyle(QStringLiteral("Fusion"));
  QMainWindow window;
  window.setFixedSize(680, 510);
  window.move(window.screen()->geometry().center() - window.rect().center());
  window.show();
  return QApplication::exec();
}
