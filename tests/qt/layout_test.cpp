#include <gmock/gmock.h>

#include <QAbstractButton>
#include <QAbstractItemView>
#include <QApplication>
#include <QHeaderView>
#include <QLabel>
#include <QMenu>
#include <QProgressBar>
#include <QScreen>
#include <QTextDocumentFragment>
#include <QToolButton>
#include <QTreeView>
#include <cstdlib>

#include "app/OnrampOSXAppDelegate.h"
#include "bonjour/KSDevice.h"
#include "pages/ChooseDeviceView.h"
#include "pages/ConnectionTypeView.h"
#include "platform/freedesktop/main_bundle.h"
#include "platform/qt/image_view.h"
#include "platform/qt/native.h"
#include "platform/qt/style.h"

namespace onramp {
namespace {

constexpr int kTitleBarHeight = 32;

std::string nameOf(const QWidget& widget) {
  return widget.objectName().toStdString();
}

/// Shows the wizard's window in one font size and in the process's language. Each language needs
/// its own process, because the language decides which fonts Qt loads.
class Layout : public testing::TestWithParam<int> {
 protected:
  void SetUp() override {
    QFont font = QApplication::font();
    font.setPointSize(GetParam());
    QApplication::setFont(font);
    setMainBundlePath(ONRAMP_CROWDED_MEDIUM "/Onramp OSX.app");
    delegate = std::make_unique<OnrampOSXAppDelegate>();
    mainInterface = Interface::load("MainMenu", *delegate);
    ASSERT_TRUE(mainInterface);
    delegate->setOutlets(*mainInterface);
    delegate->awakeFromNib();
    window = qt::nativeOf<QWidget>(mainInterface->view());
    window->show();
  }

  void TearDown() override {
    mainInterface.reset();
    delegate.reset();
  }

  [[nodiscard]] std::vector<QWidget*> shownControls() const {
    std::vector<QWidget*> controls;
    for (QWidget* const widget : window->findChildren<QWidget*>()) {
      const bool isControl =
          qobject_cast<QLabel*>(widget) || qobject_cast<QAbstractButton*>(widget) ||
          qobject_cast<QProgressBar*>(widget) || qobject_cast<QAbstractItemView*>(widget) ||
          (qobject_cast<qt::ImageViewWidget*>(widget) && nameOf(*widget) != "mBackGroundView");
      const bool isPart = qobject_cast<QHeaderView*>(widget) != nullptr;
      if (isControl && !isPart && widget->isVisible()) controls.push_back(widget);
    }
    return controls;
  }

  [[nodiscard]] QRect inWindow(const QWidget& widget) const {
    return {widget.mapTo(window, QPoint()), widget.size()};
  }

  // Expects that all columns are visible, and that no text but a device's name is cut off.
  static void expectColumnsFit(QTreeView& tree) {
    int width = 0;
    for (int column = 0; column < tree.header()->count(); ++column) {
      const int own = tree.header()->sectionSize(column);
      width += own;
      EXPECT_GE(own, tree.header()->sectionSizeHint(column));
      if (column == 0) continue;  // the name may be elided
      const QAbstractItemView& view = tree;
      EXPECT_GE(own, view.sizeHintForColumn(column)) << column;
    }
    EXPECT_LE(width, tree.viewport()->width());
  }

  static void expectTextFits(QWidget& widget) {
    SCOPED_TRACE(nameOf(widget));
    if (const auto* const label = qobject_cast<const QLabel*>(&widget)) {
      EXPECT_GE(label->height(), label->hasHeightForWidth() ? label->heightForWidth(label->width())
                                                            : label->sizeHint().height());
      EXPECT_GE(label->width(), label->minimumSizeHint().width());
      EXPECT_NE(label->text().toStdString(), "");
    } else if (qobject_cast<const QAbstractButton*>(&widget)) {
      EXPECT_GE(widget.width(), widget.sizeHint().width());
      EXPECT_GE(widget.height(), widget.sizeHint().height());
    } else if (auto* const tree = qobject_cast<QTreeView*>(&widget)) {
      expectColumnsFit(*tree);
    }
    if (const auto* const list = qobject_cast<const QAbstractItemView*>(&widget)) {
      EXPECT_TRUE(
          list->viewport()->rect().contains(list->visualRect(list->currentIndex()).center()));
    }
  }

  // Expects that the menu's text looks the same in a wider menu. Text that is elided at the menu's
  // normal width would look different.
  static void expectMenuFits(QMenu& menu) {
    const QSize size = menu.sizeHint();
    menu.resize(size);
    const QImage usual = menu.grab().toImage();
    menu.setMinimumWidth(2 * size.width());
    menu.resize(menu.sizeHint());
    const double pixels = usual.devicePixelRatio();
    const QRect texts(0, 0, usual.width() - static_cast<int>(pixels * size.height() / 2),
                      usual.height());
    EXPECT_EQ(usual.copy(texts), menu.grab().toImage().copy(texts));
  }

  void expectEverythingFits() const {
    // Sizes need a few rounds to settle, because wider text makes the window wider, and a wider
    // window moves the other controls.
    for (int round = 0; round < 5; ++round)
      QApplication::processEvents();
    const QSize screen = window->screen()->availableSize() - QSize(0, kTitleBarHeight);
    EXPECT_EQ(window->size(), window->size().boundedTo(screen));
    const std::vector<QWidget*> controls = shownControls();
    EXPECT_GT(controls.size(), 3U);
    for (std::size_t i = 0; i < controls.size(); ++i) {
      EXPECT_TRUE(window->rect().contains(inWindow(*controls[i]))) << nameOf(*controls[i]);
      expectTextFits(*controls[i]);
      for (std::size_t j = i + 1; j < controls.size(); ++j) {
        EXPECT_FALSE(inWindow(*controls[i]).intersects(inWindow(*controls[j])))
            << nameOf(*controls[i]) << " and " << nameOf(*controls[j]);
      }
    }
  }

  static void listDevices(ChooseDeviceView& page) {
    const std::string names[] = {"Kestrel Photo Printer beside the Window on the Second Floor 001",
                                 "会議室の複合機二階の窓際にある大型",
                                 "<b>Büro</b> 🖨️ links"};
    for (int i = 40; i > 0; --i) {
      page.setServiceToList(
          Dictionary{{KSDevice::kDisplayName, names[i % 3] + std::to_string(i)},
                     {KSDevice::kIPAddressList, Array{"192.168.100." + std::to_string(200 + i)}}});
    }
  }

  std::unique_ptr<OnrampOSXAppDelegate> delegate;
  std::unique_ptr<Interface> mainInterface;
  QWidget* window = nullptr;
};

TEST_P(Layout, ControlsFitTheirTextAndTheScreenWithoutOverlapping) {
  delegate->showModelListView();
  delegate->setModelListViewButton();
  expectEverythingFits();

  const auto connections =
      std::static_pointer_cast<ConnectionTypeView>(delegate->loadView("ConnectionTypeView"));
  ASSERT_TRUE(connections);
  delegate->replaceMainView("", connections);
  connections->setConnectionType(ConnectionType::kUSBAndEthernet);
  connections->progressON(true);
  // Shows the chooser's buttons, because no page has more buttons.
  delegate->setChooseDeviceViewButton();
  expectEverythingFits();

  const auto devices =
      std::static_pointer_cast<ChooseDeviceView>(delegate->loadView("ChooseDeviceView"));
  ASSERT_TRUE(devices);
  listDevices(*devices);
  delegate->replaceMainView("", devices);
  EXPECT_EQ(nameOf(*window->focusWidget()), "deviceListView");
  devices->progressON(true);
  expectEverythingFits();
  expectMenuFits(*window->findChild<QToolButton*>()->menu());

  const QModelIndex first = window->findChild<QTreeView*>("deviceListView")->model()->index(0, 0);
  const QString tip = first.data(Qt::ToolTipRole).toString();
  EXPECT_EQ(QTextDocumentFragment::fromHtml(tip).toPlainText(), first.data().toString())
      << "the tool tip shows a device's name literally, even if the name looks like markup";
}

INSTANTIATE_TEST_SUITE_P(Points, Layout, testing::Values(10, 18));

}  // namespace
}  // namespace onramp

int main(int argc, char** argv) {
  testing::InitGoogleTest(&argc, argv);
  for (const char* variable : {"LANGUAGE", "LC_ALL", "LC_MESSAGES"})
    unsetenv(variable);
  const QApplication application(argc, argv);
  QApplication::setStyle(std::make_unique<onramp::qt::Style>().release());
  return RUN_ALL_TESTS();
}
