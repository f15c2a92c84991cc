#include "platform/application.h"

#include <QAction>
#include <QApplication>
#include <QCommandLineParser>
#include <QMenuBar>
#include <QPointer>
#include <QRegularExpression>
#include <QStyle>
#include <cstdio>
#include <vector>

#include "platform/bundle.h"
#include "platform/qt/loops.h"
#include "platform/qt/main_window.h"
#include "platform/qt/native.h"
#include "platform/run_loop.h"
#include "platform/standin/stand_in_system.h"
#include "platform/termination.h"

namespace onramp {

namespace {

constexpr int kUsageError = 2;

QPointer<QMenuBar>& menuBar() {
  static QPointer<QMenuBar> bar;
  return bar;
}

std::vector<QPointer<QWidget>>& hiddenWindows() {
  static std::vector<QPointer<QWidget>> windows;
  return windows;
}

// Exits with a message when an option makes no sense.
void readCommandLine(const QApplication& application) {
  QCommandLineParser parser;
  parser.setApplicationDescription(
      QStringLiteral("Sets up a new device from the medium that this application lies on."));
  const QCommandLineOption version(
      QStringLiteral("system-version"),
      QStringLiteral("The system version that the wizard takes to be running."),
      QStringLiteral("X.Y.Z"));
  parser.addOption(version);
  parser.addHelpOption();
  parser.addVersionOption();
  parser.process(application);
  if (!parser.isSet(version)) return;
  static const QRegularExpression form(QStringLiteral("^\\d+(\\.\\d+){0,2}$"));
  if (!form.match(parser.value(version)).hasMatch()) {
    std::fprintf(stderr, "--system-version: \"%s\" is no version; give numbers, as in 10.15.7\n",
                 qPrintable(parser.value(version)));
    std::exit(kUsageError);
  }
  setSystemVersion(parser.value(version).toStdString());
}

// The pages lie on the medium's light picture, so the desktop's dark colours would not be read.
void setAppearance() {
  QApplication::setStyle(QStringLiteral("Fusion"));
  QApplication::setPalette(QApplication::style()->standardPalette());
}

}  // namespace

int runApplication(int argc, char** argv, const std::string& mainInterfaceName,
                   const std::function<std::unique_ptr<ApplicationDelegate>()>& makeDelegate) {
  QApplication application(argc, argv);
  setAppearance();
  QApplication::setQuitOnLastWindowClosed(false);
  QApplication::setApplicationVersion(
      QString::fromStdString(Bundle::main().infoString("CFBundleShortVersionString").value_or("")));
  readCommandLine(application);

  const std::unique_ptr<ApplicationDelegate> delegate = makeDelegate();
  const std::unique_ptr<Interface> mainInterface = Interface::load(mainInterfaceName, *delegate);
  if (!mainInterface) {
    std::fprintf(stderr, "%s: no interface file %s; copy the application anew\n",
                 Bundle::main().path().c_str(), mainInterfaceName.c_str());
    return 1;
  }
  auto* const window = qt::nativeOf<QWidget>(mainInterface->view());
  menuBar() = window->findChild<QMenuBar*>();
  qt::makeChild<qt::MainWindow>(window, *delegate);
  qt::connectStandardMenuItems(window);
  delegate->setOutlets(*mainInterface);
  delegate->awakeFromNib();

  performOnMainThread([&delegate] {
    delegate->applicationWillFinishLaunching();
    if (!isTerminating()) delegate->applicationDidFinishLaunching();
  });
  return QApplication::exec();
}

void terminateApplication() {
  qt::endAllLoops();
}

void hideApplication() {
  hiddenWindows().clear();
  for (QWidget* const window : QApplication::topLevelWidgets()) {
    if (!window->isVisible()) continue;
    hiddenWindows().emplace_back(window);
    window->hide();
  }
}

void unhideApplication() {
  for (const QPointer<QWidget>& window : hiddenWindows()) {
    if (window) window->show();
  }
  hiddenWindows().clear();
}

void activateIgnoringOtherApps() {
  for (QWidget* const window : QApplication::topLevelWidgets()) {
    if (!window->isVisible()) continue;
    window->raise();
    window->activateWindow();
  }
}

Menu mainMenu() {
  return Menu(qt::toNative(menuBar()));
}

// The window shows its menu bar itself.
void setMainMenu(const Menu&) {}

}  // namespace onramp
