#include "platform/outlets.h"

#include <algorithm>

#include "base/array_controller.h"
#include "tests/recording/front_end.h"

namespace onramp {

namespace {

using recording::FrontEnd;
using recording::Object;

// Returns the object of a handle. For an empty handle, returns a spare object in its initial state.
Object& object(const Outlet& outlet) {
  static Object spare;
  if (outlet) return *reinterpret_cast<Object*>(outlet.native());
  return spare = Object();
}

}  // namespace

void View::setHidden(bool hidden) const {
  object(*this).hidden = hidden;
}

View View::firstSubview() const {
  const auto& inside = object(*this).subviews;
  return View(inside.empty() ? nullptr : inside.front()->native());
}

void View::addSubview(const View& inner) const {
  if (!*this || !inner) return;
  object(*this).subviews.push_back(&object(inner));
  object(inner).superview = &object(*this);
}

void View::removeFromSuperview() const {
  Object& view = object(*this);
  if (view.superview) std::erase(view.superview->subviews, &view);
  view.superview = nullptr;
}

void Control::setEnabled(bool enabled) const {
  object(*this).enabled = enabled;
}

void TextField::setStringValue(const std::string& text) const {
  object(*this).text = text;
}

void RadioMatrix::setTitle(int row, int column, const std::string& title) const {
  object(*this).cells[{row, column}] = title;
}

void RadioMatrix::selectCell(int row, int column) const {
  object(*this).selectedRow = row;
  object(*this).selectedColumn = column;
}

int RadioMatrix::selectedRow() const {
  return *this ? object(*this).selectedRow : 0;
}

void ImageView::setImage(const Image& image) const {
  object(*this).imagePath = image.path;
}

void ImageView::setImageScaling(ImageScaling scaling) const {
  object(*this).scaling = scaling;
}

void ProgressIndicator::startAnimation() const {
  object(*this).animating = true;
}

void ProgressIndicator::stopAnimation() const {
  object(*this).animating = false;
}

void TableView::bind(ArrayController& controller) const {
  object(*this).content = &controller;
}

void TableView::setAllowsColumnReordering(bool allows) const {
  object(*this).columnsCanMove = allows;
}

void TableView::setAllowsColumnSelection(bool allows) const {
  object(*this).columnsCanBeSelected = allows;
}

void TableView::setColumnEditable(std::string_view identifier, bool editable) const {
  if (!editable) object(*this).fixedColumns.emplace(identifier);
}

void TableView::setColumnHeader(std::string_view identifier, const std::string& title) const {
  object(*this).headers[std::string(identifier)] = title;
}

std::size_t PopUpButton::numberOfItems() const {
  return object(*this).items.size();
}

void PopUpButton::removeItem(std::size_t index) const {
  auto& items = object(*this).items;
  if (index < items.size()) items.erase(items.begin() + static_cast<std::ptrdiff_t>(index));
}

void PopUpButton::addItem(const std::string& title, std::function<void()> action) const {
  object(*this).items.emplace_back(title, std::move(action));
}

void Window::setShowsResizeIndicator(bool shows) const {
  object(*this).resizeIndicator = shows;
}

void Window::center() const {
  FrontEnd::instance().log.emplace_back("center");
}
void Window::makeKeyWindow() const {
  FrontEnd::instance().log.emplace_back("key");
}
void Window::orderFront() const {
  FrontEnd::instance().log.emplace_back("front");
}
void Window::makeKeyAndOrderFront() const {
  FrontEnd::instance().log.emplace_back("key and front");
}
void Window::close() const {
  FrontEnd::instance().log.emplace_back("close");
}

MenuItem Menu::itemWithTitle(const std::string& title) const {
  for (Object* const item : object(*this).subviews) {
    if (item->text == title) return MenuItem(item->native());
  }
  return {};
}

Menu MenuItem::submenu() const {
  const auto& inside = object(*this).subviews;
  return Menu(inside.empty() ? nullptr : inside.front()->native());
}

void MenuItem::setTitle(const std::string& title) const {
  object(*this).text = title;
}

}  // namespace onramp
