#include "platform/application.h"

#include <QAction>
#include <QApplication>
#include <QCommandLineParser>
#include <QIcon>
#include <QMenuBar>
#include <QPointer>
#include <QRegularExpression>
#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <string_view>
#include <vector>

#include "base/maker.h"
#include "platform/bundle.h"
#include "platform/qt/accessibility.h"
#include "platform/qt/menus.h"
#include "platform/qt/native.h"
#include "platform/qt/style.h"
#include "platform/qt/window_events.h"
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

// Reads the options, and sets the system version if they give one. Exits after --help or --version.
// If an option is invalid, prints an error and exits.
void readCommandLine(const QStringList& arguments) {
  QCommandLineParser parser;
  parser.setApplicationDescription(
      QStringLiteral("Sets up a new device from the medium that this application is on."));
  const QCommandLineOption version(QStringLiteral("system-version"),
                                   QStringLiteral("Treat the system as this version of macOS."),
                                   QStringLiteral("X.Y.Z"));
  parser.addOption(version);
  const QCommandLineOption help = parser.addHelpOption();
  const QCommandLineOption ownVersion = parser.addVersionOption();
  if (!parser.parse(arguments)) {
    std::fprintf(stderr, "%s\n", qPrintable(parser.errorText()));
    std::exit(kUsageError);
  }
  if (parser.isSet(help)) parser.showHelp();
  static const QRegularExpression form(QStringLiteral("^\\d+(\\.\\d+){0,2}$"));
  if (parser.isSet(version) && !form.match(parser.value(version)).hasMatch()) {
    std::fprintf(stderr, "--system-version: \"%s\" is not a version; give numbers, as in 10.15.7\n",
                 qPrintable(parser.value(version)));
    std::exit(kUsageError);
  }
  if (parser.isSet(ownVersion)) {
    std::printf("%s %s\n%s\n", qPrintable(QCoreApplication::applicationName()),
                qPrintable(QCoreApplication::applicationVersion()), maker::kSettings);
    std::exit(0);
  }
  if (parser.isSet(version)) setSystemVersion(parser.value(version).toStdString());
}

bool asksForInformation(int argc, char** argv) {
  static constexpr std::string_view kOptions[] = {"-h", "--help", "--help-all", "-v", "--version"};
  return std::any_of(argv + std::min(argc, 1), argv + argc, [](std::string_view argument) {
    return std::find(std::begin(kOptions), std::end(kOptions), argument) != std::end(kOptions);
  });
}

// Handles Qt's messages while the application object is created. Qt sends a fatal message if there
// is no display, and would then abort the process. This function prints an error and exits instead.
// Drops all other messages, unless QT_DEBUG_PLUGINS is set.
void exitWithoutDisplay(QtMsgType type, const QMessageLogContext&, const QString& message) {
  if (type == QtFatalMsg) {
    std::fprintf(stderr,
                 "Onramp OSX: there is no display to show the wizard on; set DISPLAY or "
                 "WAYLAND_DISPLAY\n");
    std::_Exit(kUsageError);
  }
  static const bool isVerbose = qEnvironmentVariableIsSet("QT_DEBUG_PLUGINS");
  if (isVerbose) std::fprintf(stderr, "%s\n", qPrintable(message));
}

// Creates the application object. Exits with a message if there is no display.
std::unique_ptr<QApplication> makeApplication(int& argc, char** argv) {
  const QtMessageHandler usual = qInstallMessageHandler(exitWithoutDisplay);
  auto application = std::make_unique<QApplication>(argc, argv);
  qInstallMessageHandler(usual);
  return application;
}

void setIcon() {
  const std::string name = Bundle::main().infoString("CFBundleIconFile").value_or("");
  if (const auto path = Bundle::main().pathForResource(name, "png")) {
    QApplication::setWindowIcon(QIcon(QString::fromStdString(*path)));
  }
}

}  // namespace

int runApplication(int argc, char** argv, const std::string& mainInterfaceName,
                   const std::function<std::unique_ptr<ApplicationDelegate>()>& makeDelegate) {
  QCoreApplication::setApplicationVersion(
      QString::fromStdString(Bundle::main().infoString("CFBundleShortVersionString").value_or("")));
  if (asksForInformation(argc, argv)) {
    const QCoreApplication withoutDisplay(argc, argv);
    readCommandLine(QCoreApplication::arguments());
  }
  const std::unique_ptr<QApplication> application = makeApplication(argc, argv);
  readCommandLine(QCoreApplication::arguments());
  QApplication::setStyle(std::make_unique<qt::Style>().release());
  QApplication::setQuitOnLastWindowClosed(false);
  qt::describeControls();
  setIcon();

  const std::unique_ptr<ApplicationDelegate> delegate = makeDelegate();
  const std::unique_ptr<Interface> mainInterface = Interface::load(mainInterfaceName, *delegate);
  if (!mainInterface) {
    std::fprintf(stderr, "%s: no interface file %s; copy the application again\n",
                 Bundle::main().path().c_str(), mainInterfaceName.c_str());
    return 1;
  }
  auto* const window = qt::nativeOf<QWidget>(mainInterface->view());
  menuBar() = window->findChild<QMenuBar*>();
  qt::makeChild<qt::WindowEvents>(window, *delegate);
  qt::connectStandardMenuItems(window);
  delegate->setOutlets(*mainInterface);
  delegate->awakeFromNib();
  if (menuBar()) qt::nameMenuAfterProduct(*menuBar());

  performOnMainThread([&delegate] {
    delegate->applicationWillFinishLaunching();
    if (!isTerminating()) delegate->applicationDidFinishLaunching();
  });
  return QApplication::exec();
}

void terminateApplication() {
  beginTermination();
  QCoreApplication::exit(0);
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

// Does nothing, because the window shows its own menu bar.
void setMainMenu(const Menu&) {}

}  // namespace onramp
