#include <gmock/gmock.h>

#include <QAbstractButton>
#include <QAbstractItemView>
#include <QApplication>
#include <QHeaderView>
#include <QLabel>
#include <QTreeView>
#include <cstdlib>

#include "app/OnrampOSXAppDelegate.h"
#include "pages/ChooseDeviceView.h"
#include "pages/ConnectionTypeView.h"
#include "platform/freedesktop/main_bundle.h"
#include "platform/qt/native.h"

namespace onramp {
namespace {

std::string nameOf(const QWidget& widget) {
  return widget.objectName().toStdString();
}

/// The wizard's window with the example medium's texts in one language.
class Layout : public testing::TestWithParam<const char*> {
 protected:
  void SetUp() override {
    setenv("LANG", GetParam(), 1);
    setMainBundlePath(ONRAMP_MEDIUM "/Onramp OSX.app");
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
      const bool isControl = qobject_cast<QLabel*>(widget) ||
                             qobject_cast<QAbstractButton*>(widget) ||
                             qobject_cast<QAbstractItemView*>(widget);
      const bool isPart = qobject_cast<QHeaderView*>(widget) != nullptr;
      if (isControl && !isPart && widget->isVisible()) controls.push_back(widget);
    }
    return controls;
  }

  [[nodiscard]] QRect inWindow(const QWidget& widget) const {
    return {widget.mapTo(window, QPoint()), widget.size()};
  }

  static void expectTextFits(const QWidget& widget) {
    SCOPED_TRACE(nameOf(widget));
    if (const auto* const label = qobject_cast<const QLabel*>(&widget)) {
      EXPECT_GE(label->height(), label->hasHeightForWidth() ? label->heightForWidth(label->width())
                                                            : label->sizeHint().height());
      EXPECT_GE(label->width(), label->minimumSizeHint().width());
      EXPECT_NE(label->text().toStdString(), "");
    } else if (qobject_cast<const QAbstractButton*>(&widget)) {
      EXPECT_GE(widget.width(), widget.sizeHint().width());
      EXPECT_GE(widget.height(), widget.sizeHint().height());
    } else if (const auto* const tree = qobject_cast<const QTreeView*>(&widget)) {
      for (int column = 0; column < tree->header()->count(); ++column) {
        EXPECT_GE(tree->header()->sectionSize(column), tree->header()->sectionSizeHint(column));
      }
    }
  }

  void expectEverythingFits() const {
    QApplication::processEvents();
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

  std::unique_ptr<OnrampOSXAppDelegate> delegate;
  std::unique_ptr<Interface> mainInterface;
  QWidget* window = nullptr;
};

TEST_P(Layout, NothingIsCutOffAndNothingOverlaps) {
  delegate->showModelListView();
  delegate->setModelListViewButton();
  expectEverythingFits();

  const auto connections =
      std::static_pointer_cast<ConnectionTypeView>(delegate->loadView("ConnectionTypeView"));
  ASSERT_TRUE(connections);
  delegate->replaceMainView("", connections);
  connections->setConnectionType(ConnectionType::kUSBAndEthernet);
  connections->progressON(true);
  // All the buttons that a page can show.
  delegate->setChooseDeviceViewButton();
  expectEverythingFits();

  const auto devices =
      std::static_pointer_cast<ChooseDeviceView>(delegate->loadView("ChooseDeviceView"));
  ASSERT_TRUE(devices);
  delegate->replaceMainView("", devices);
  devices->progressON(true);
  expectEverythingFits();
}

INSTANTIATE_TEST_SUITE_P(Languages, Layout,
                         testing::Values("en_US.UTF-8", "de_DE.UTF-8", "ja_JP.UTF-8", "ko_KR.UTF-8",
                                         "zh_CN.UTF-8"));

}  // namespace
}  // namespace onramp

int main(int argc, char** argv) {
  testing::InitGoogleTest(&argc, argv);
  for (const char* variable : {"LANGUAGE", "LC_ALL", "LC_MESSAGES"})
    unsetenv(variable);
  const QApplication application(argc, argv);
  return RUN_ALL_TESTS();
}
