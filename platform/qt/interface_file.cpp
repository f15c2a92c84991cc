#include "platform/interface_file.h"

#include <QAbstractButton>
#include <QAbstractItemView>
#include <QAction>
#include <QApplication>
#include <QFile>
#include <QLabel>
#include <QMenu>
#include <QMenuBar>
#include <QPointer>
#include <QPushButton>
#include <QToolButton>
#include <QUiLoader>
#include <utility>

#include "platform/bundle.h"
#include "platform/qt/image_view.h"
#include "platform/qt/list_views.h"
#include "platform/qt/native.h"
#include "platform/qt/radio_matrix.h"
#include "platform/qt/spinner.h"

namespace onramp {

namespace {

constexpr double kHeadingScale = 1.5;
constexpr double kGearScale = 1.5;

QString textOf(std::string_view text) {
  return QString::fromUtf8(text.data(), static_cast<qsizetype>(text.size()));
}

// Creates the widgets of an interface file, including those whose classes this front end defines.
// In the file, the root widget of a page has the page's class, which is not a widget class. For any
// class that is not a widget class, creates a plain widget and stores the name of the class in the
// property kViewClass.
class Loader final : public QUiLoader {
 public:
  using QUiLoader::QUiLoader;

  /// Returns the loader that all interface files share. Without sharing, each file would take twice
  /// as long to load.
  static Loader& shared() {
    static Loader* const loader = makeWithoutPlugIns();
    return *loader;
  }

  QWidget* createWidget(const QString& className, QWidget* parent, const QString& name) override {
    QWidget* widget = nullptr;
    if (className == QLatin1String("ImageView")) {
      widget = qt::makeChild<qt::ImageViewWidget>(parent);
    } else if (className == QLatin1String("RadioMatrix")) {
      widget = qt::makeChild<qt::RadioMatrixWidget>(parent);
    } else if (className == QLatin1String("Spinner")) {
      widget = qt::makeChild<qt::Spinner>(parent);
    } else if (className == QLatin1String("QListView")) {
      widget = qt::makeChild<qt::ListWidget>(parent);
    } else if (className == QLatin1String("QTreeView")) {
      widget = qt::makeChild<qt::ColumnsWidget>(parent);
    } else if (availableWidgets().contains(className)) {
      widget = QUiLoader::createWidget(className, parent, name);
    } else {
      widget = qt::makeChild<QWidget>(parent);
      widget->setProperty(qt::kViewClass, className);
    }
    if (widget) widget->setObjectName(name);
    return widget;
  }

 private:
  // Creates the loader while Qt's list of library paths is empty. Otherwise, QUiLoader's
  // constructor would load every Designer plug-in in these paths, and these plug-ins would load
  // many Qt libraries.
  static Loader* makeWithoutPlugIns() {
    const QStringList paths = QCoreApplication::libraryPaths();
    QCoreApplication::setLibraryPaths({});
    auto* const loader = qt::makeChild<Loader>(qApp);
    QCoreApplication::setLibraryPaths(paths);
    return loader;
  }
};

void enlargeFont(QWidget& widget, double scale) {
  QFont font = widget.font();
  font.setPointSizeF(QApplication::font().pointSizeF() * scale);
  widget.setFont(font);
}

// Enlarges headings and tool buttons in proportion to the user's text size.
void enlargeFonts(QWidget& root) {
  for (QWidget* const widget : root.findChildren<QWidget*>()) {
    if (widget->property(qt::kHeading).toBool()) enlargeFont(*widget, kHeadingScale);
    if (qobject_cast<QToolButton*>(widget)) enlargeFont(*widget, kGearScale);
  }
}

// Translates the accessible names and tool tips in the interface file into the user's language.
void localize(QWidget& root, const std::string& interfaceName) {
  const auto translated = [&](const QString& text) {
    const std::string key = text.toStdString();
    return QString::fromStdString(Bundle::main().localizedString(key, key, interfaceName));
  };
  for (QWidget* const widget : root.findChildren<QWidget*>()) {
    if (!widget->accessibleName().isEmpty()) {
      widget->setAccessibleName(translated(widget->accessibleName()));
    }
    if (!widget->toolTip().isEmpty()) widget->setToolTip(translated(widget->toolTip()));
  }
}

// The property "titleBinding" of a button or window names one of the owner's texts. Makes the
// widget show this text.
void bindTitle(QWidget* widget, KeyValueTexts& texts) {
  const QString key = widget->property("titleBinding").toString();
  if (key.isEmpty()) return;
  texts.bind(key.toStdString(), [target = QPointer<QWidget>(widget)](const std::string& title) {
    if (auto* const button = qobject_cast<QAbstractButton*>(target)) {
      button->setText(qt::titleText(title));
    } else if (target) {
      target->setWindowTitle(QString::fromStdString(title));
    }
  });
}

// The property "action" of a button names one of the owner's actions. Makes a click on the button
// perform this action.
void connectAction(QWidget* widget, InterfaceOwner& owner) {
  auto* const button = qobject_cast<QAbstractButton*>(widget);
  const std::string action = widget->property("action").toString().toStdString();
  if (!button || action.empty()) return;
  QObject::connect(button, &QAbstractButton::clicked, button,
                   [&owner, action] { owner.performAction(action); });
}

bool isOfKind(const QObject* object, OutletKind kind) {
  switch (kind) {
    case OutletKind::kView:
      return object->isWidgetType();
    case OutletKind::kTextField:
      return qobject_cast<const QLabel*>(object);
    case OutletKind::kButton:
      return qobject_cast<const QPushButton*>(object);
    case OutletKind::kRadioMatrix:
      return qobject_cast<const qt::RadioMatrixWidget*>(object);
    case OutletKind::kImageView:
      return qobject_cast<const qt::ImageViewWidget*>(object);
    case OutletKind::kProgressIndicator:
      return qobject_cast<const qt::Spinner*>(object);
    case OutletKind::kTableView:
      return qobject_cast<const QAbstractItemView*>(object);
    case OutletKind::kPopUpButton:
      return qobject_cast<const QToolButton*>(object);
    case OutletKind::kWindow:
      return object->isWidgetType() && static_cast<const QWidget*>(object)->isWindow();
    case OutletKind::kMenu:
      return qobject_cast<const QMenuBar*>(object) || qobject_cast<const QMenu*>(object);
    case OutletKind::kMenuItem:
      return qobject_cast<const QAction*>(object);
  }
  return false;
}

}  // namespace

// Owns the root widget. While a page is shown, its root widget is also a child of the window. If
// the window is destroyed first, the root widget is destroyed with it, and `root` becomes null.
struct Interface::Tree {
  explicit Tree(QWidget* widget) : root(widget) {}
  Tree(const Tree&) = delete;
  Tree& operator=(const Tree&) = delete;
  ~Tree() { const std::unique_ptr<QWidget> ended(root.data()); }

  QPointer<QWidget> root;
};

Interface::Interface(std::unique_ptr<Tree> tree) : tree_(std::move(tree)) {}

Interface::~Interface() = default;

std::unique_ptr<Interface> Interface::load(const std::string& name, InterfaceOwner& owner) {
  const auto path = Bundle::main().pathForResource(name, "ui");
  QFile file(QString::fromStdString(path.value_or("")));
  if (!path || !file.open(QIODevice::ReadOnly)) return nullptr;
  auto tree = std::make_unique<Tree>(Loader::shared().load(&file));
  if (!tree->root) return nullptr;

  localize(*tree->root, name);
  enlargeFonts(*tree->root);
  QList<QWidget*> widgets = tree->root->findChildren<QWidget*>();
  widgets.prepend(tree->root);
  for (QWidget* const widget : widgets) {
    bindTitle(widget, owner.boundTexts());
    connectAction(widget, owner);
  }
  return std::unique_ptr<Interface>(new Interface(std::move(tree)));
}

View Interface::view() const {
  return View(qt::toNative(tree_->root));
}

std::string Interface::viewClass() const {
  return tree_->root ? tree_->root->property(qt::kViewClass).toString().toStdString() : "";
}

NativeObject* Interface::find(std::string_view name, OutletKind kind) const {
  if (!tree_->root) return nullptr;
  if (tree_->root->objectName() == textOf(name) && isOfKind(tree_->root, kind)) {
    return qt::toNative(tree_->root);
  }
  for (QObject* const object : tree_->root->findChildren<QObject*>(textOf(name))) {
    if (isOfKind(object, kind)) return qt::toNative(object);
  }
  return nullptr;
}

}  // namespace onramp
