#include "platform/outlets.h"

#include <algorithm>

#include "base/array_controller.h"
#include "tests/recording/front_end.h"

namespace onramp {

namespace {

using recording::FrontEnd;
using recording::Object;

Object* object(const Outlet& outlet) {
  return reinterpret_cast<Object*>(outlet.native());
}

}  // namespace

void View::setHidden(bool hidden) const {
  if (Object* const view = object(*this)) view->hidden = hidden;
}

View View::firstSubview() const {
  const Object* const view = object(*this);
  return View(view && !view->subviews.empty() ? view->subviews.front()->native() : nullptr);
}

void View::addSubview(const View& inner) const {
  Object* const view = object(*this);
  if (!view || !inner) return;
  view->subviews.push_back(object(inner));
  object(inner)->superview = view;
}

void View::removeFromSuperview() const {
  Object* const view = object(*this);
  if (!view || !view->superview) return;
  std::erase(view->superview->subviews, view);
  view->superview = nullptr;
}

void Control::setEnabled(bool enabled) const {
  if (Object* const control = object(*this)) control->enabled = enabled;
}

void TextField::setStringValue(const std::string& text) const {
  if (Object* const field = object(*this)) field->text = text;
}

void RadioMatrix::setTitle(int row, int column, const std::string& title) const {
  if (Object* const matrix = object(*this)) matrix->cells[{row, column}] = title;
}

void RadioMatrix::selectCell(int row, int column) const {
  Object* const matrix = object(*this);
  if (!matrix) return;
  matrix->selectedRow = row;
  matrix->selectedColumn = column;
}

int RadioMatrix::selectedRow() const {
  const Object* const matrix = object(*this);
  return matrix ? matrix->selectedRow : 0;
}

void ImageView::setImage(const Image& image) const {
  if (Object* const view = object(*this)) view->imagePath = image.path;
}

void ImageView::setImageScaling(ImageScaling scaling) const {
  if (Object* const view = object(*this)) view->scaling = scaling;
}

void ProgressIndicator::startAnimation() const {
  if (Object* const spinner = object(*this)) spinner->animating = true;
}

void ProgressIndicator::stopAnimation() const {
  if (Object* const spinner = object(*this)) spinner->animating = false;
}

void TableView::bind(ArrayController& controller) const {
  if (Object* const table = object(*this)) table->content = &controller;
}

void TableView::setAllowsColumnReordering(bool allows) const {
  if (Object* const table = object(*this)) table->columnsCanMove = allows;
}

void TableView::setAllowsColumnSelection(bool allows) const {
  if (Object* const table = object(*this)) table->columnsCanBeSelected = allows;
}

void TableView::setColumnEditable(std::string_view identifier, bool editable) const {
  Object* const table = object(*this);
  if (table && !editable) table->fixedColumns.emplace(identifier);
}

void TableView::setColumnHeader(std::string_view identifier, const std::string& title) const {
  if (Object* const table = object(*this)) table->headers[std::string(identifier)] = title;
}

std::size_t PopUpButton::numberOfItems() const {
  const Object* const popUp = object(*this);
  return popUp ? popUp->items.size() : 0;
}

void PopUpButton::removeItem(std::size_t index) const {
  Object* const popUp = object(*this);
  if (popUp && index < popUp->items.size()) {
    popUp->items.erase(popUp->items.begin() + static_cast<std::ptrdiff_t>(index));
  }
}

void PopUpButton::addItem(const std::string& title, std::function<void()> action) const {
  if (Object* const popUp = object(*this)) popUp->items.emplace_back(title, std::move(action));
}

void Window::setShowsResizeIndicator(bool shows) const {
  if (Object* const window = object(*this)) window->resizeIndicator = shows;
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
  if (const Object* const menu = object(*this)) {
    for (Object* const item : menu->subviews) {
      if (item->text == title) return MenuItem(item->native());
    }
  }
  return {};
}

Menu MenuItem::submenu() const {
  const Object* const item = object(*this);
  return Menu(item && !item->subviews.empty() ? item->subviews.front()->native() : nullptr);
}

void MenuItem::setTitle(const std::string& title) const {
  if (Object* const item = object(*this)) item->text = title;
}

}  // namespace onramp
