#pragma once

#include <cstddef>
#include <functional>
#include <optional>
#include <string>
#include <string_view>

namespace onramp {

class ArrayController;

/// The object to which an Outlet refers. Only the linked front end knows the object's type.
struct NativeObject;

enum class OutletKind {
  kView,
  kTextField,
  kButton,
  kRadioMatrix,
  kImageView,
  kProgressIndicator,
  kTableView,
  kPopUpButton,
  kWindow,
  kMenu,
  kMenuItem,
};

/// A handle to an object of the user interface. The handle does not own the object, and must not be
/// used once the object has been destroyed. Copies refer to the same object. The functions of an
/// empty handle do nothing, and return 0 or an empty handle. The handle of an object that the
/// interface file lacks is empty, so a page works even without some objects. Main thread only.
class Outlet {
 public:
  Outlet() = default;
  explicit Outlet(NativeObject* object) : object_(object) {}

  explicit operator bool() const { return object_ != nullptr; }
  [[nodiscard]] NativeObject* native() const { return object_; }

  friend bool operator==(const Outlet&, const Outlet&) = default;

 private:
  NativeObject* object_ = nullptr;
};

class View : public Outlet {
 public:
  static constexpr OutletKind kKind = OutletKind::kView;
  using Outlet::Outlet;

  void setHidden(bool hidden) const;

  /// Returns the first of the views directly inside this view, or an empty handle when there is
  /// none.
  [[nodiscard]] View firstSubview() const;

  /// Puts `view` inside this view so that it fills this view. Gives the keyboard focus to the first
  /// list in `view` that accepts it, or else to the first control that accepts it. The owner of
  /// `view` does not change.
  void addSubview(const View& view) const;

  /// Removes this view from the view that contains it, if there is one. The owner of this view does
  /// not change.
  void removeFromSuperview() const;
};

class Control : public View {
 public:
  using View::View;

  void setEnabled(bool enabled) const;
};

/// Static text that wraps at the view's width.
class TextField : public View {
 public:
  static constexpr OutletKind kKind = OutletKind::kTextField;
  using View::View;

  /// Shows `text` unchanged, even if it looks like markup.
  void setStringValue(const std::string& text) const;
};

/// A push button. The interface file binds the button's title to a text of the file's owner, and
/// names the action that the owner performs when the button is clicked.
class Button : public Control {
 public:
  static constexpr OutletKind kKind = OutletKind::kButton;
  using Control::Control;
};

/// Radio buttons in rows and columns. At most one of them is selected.
class RadioMatrix : public Control {
 public:
  static constexpr OutletKind kKind = OutletKind::kRadioMatrix;
  using Control::Control;

  /// Sets the title of the button at `row` and `column`, which count from 0. Does nothing when
  /// there is no button at that place.
  void setTitle(int row, int column, const std::string& title) const;
  /// Selects the button at `row` and `column`, which must exist, and deselects all others.
  void selectCell(int row, int column) const;

  /// Returns the row of the selected button, counted from 0. Returns 0 when this handle is empty.
  /// When no button is selected, the result is 0 or -1, depending on the front end.
  [[nodiscard]] int selectedRow() const;
};

/// A reference to an image file. The file is not read until the image is drawn.
struct Image {
  std::string path;

  /// Returns the image `fileName` in the resources of the application's bundle, or nothing when the
  /// file does not exist.
  [[nodiscard]] static std::optional<Image> named(const std::string& fileName);
};

enum class ImageScaling {
  kProportionallyDown,  ///< shown in the image's size, or scaled down to fit the view
  kAxesIndependently,   ///< stretched to fill the view; not drawn by Qt in dark colour schemes
};

class ImageView : public View {
 public:
  static constexpr OutletKind kKind = OutletKind::kImageView;
  using View::View;

  /// Shows `image`, or leaves the view blank when the file is missing or is not an image.
  void setImage(const Image& image) const;
  void setImageScaling(ImageScaling scaling) const;
};

/// A spinner. It shows that the program is busy, but not how much of the work is done.
class ProgressIndicator : public View {
 public:
  static constexpr OutletKind kKind = OutletKind::kProgressIndicator;
  using View::View;

  void startAnimation() const;
  void stopAnimation() const;
};

/// A list with columns. The interface file gives each column an identifier. A column shows the text
/// that each entry stores under the column's identifier.
class TableView : public Control {
 public:
  static constexpr OutletKind kKind = OutletKind::kTableView;
  using Control::Control;

  /// Shows the entries of `controller`, and keeps the selections of the table and of `controller`
  /// in sync. A double-click on an entry clicks the window's default button. May be called only
  /// once for each table. `controller` must outlive the table.
  void bind(ArrayController& controller) const;

  /// Sets whether the user may move columns.
  void setAllowsColumnReordering(bool allows) const;
  /// Sets whether a click on a header selects the column. With Qt, a click never does.
  void setAllowsColumnSelection(bool allows) const;
  /// Shows `title` above the column `identifier`. Does nothing when the table has no column with
  /// that identifier.
  void setColumnHeader(std::string_view identifier, const std::string& title) const;
  /// Sets whether the user may edit the text in the column `identifier`. Does nothing in a front
  /// end whose tables are always read-only.
  void setColumnEditable(std::string_view identifier, bool editable) const;
};

/// A button that opens a menu of commands. Item 0 of the menu is not a command; it is what the
/// button shows.
class PopUpButton : public Control {
 public:
  static constexpr OutletKind kKind = OutletKind::kPopUpButton;
  using Control::Control;

  /// Returns the number of items, including item 0.
  [[nodiscard]] std::size_t numberOfItems() const;
  /// Removes the command at `index`, which must be at least 1. Does nothing when the menu has no
  /// item at `index`.
  void removeItem(std::size_t index) const;

  /// Adds a command to the end of the menu. When the user chooses the command, `action` runs on the
  /// main thread after the menu has closed, so it may run a modal loop.
  void addItem(const std::string& title, std::function<void()> action) const;
};

class Window : public Outlet {
 public:
  static constexpr OutletKind kKind = OutletKind::kWindow;
  using Outlet::Outlet;

  /// Shows or hides the window's resize handle, if the system's windows have one. With Qt, a call
  /// with false prevents the user from resizing the window, and a call with true does nothing.
  void setShowsResizeIndicator(bool shows) const;

  /// Centres the window on its screen.
  void center() const;
  /// Makes this the window that receives what the user types.
  void makeKeyWindow() const;
  /// Shows the window, if it is hidden, and puts it in front of the application's other windows.
  void orderFront() const;
  /// Does what orderFront() and makeKeyWindow() do. With Cocoa, also puts the window in front of
  /// another application's windows if that application is active.
  void makeKeyAndOrderFront() const;

  /// Takes the window off the screen without calling ApplicationDelegate::windowShouldClose().
  void close() const;
};

class MenuItem;

class Menu : public Outlet {
 public:
  static constexpr OutletKind kKind = OutletKind::kMenu;
  using Outlet::Outlet;

  /// Returns the first item with this title, or an empty handle when there is none.
  [[nodiscard]] MenuItem itemWithTitle(const std::string& title) const;
};

class MenuItem : public Outlet {
 public:
  static constexpr OutletKind kKind = OutletKind::kMenuItem;
  using Outlet::Outlet;

  /// Returns the menu that this item opens, or an empty handle when the item opens none.
  [[nodiscard]] Menu submenu() const;
  void setTitle(const std::string& title) const;
};

}  // namespace onramp
