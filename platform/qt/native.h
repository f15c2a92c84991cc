#pragma once

#include <QObject>
#include <QString>
#include <memory>
#include <string>
#include <utility>

#include "platform/outlets.h"

namespace onramp::qt {

// The names of some properties that this front end adds to Qt's widgets.
inline constexpr const char* kViewClass = "viewClass";  ///< string: the page class of a root widget
inline constexpr const char* kHeading = "heading";      ///< true for a label that is a heading
inline constexpr const char* kSpokenColumns = "spokenColumns";  ///< strings: see ListModel

/// Returns the object behind `outlet` if it is of class `Class`, or null otherwise.
template <typename Class>
[[nodiscard]] Class* nativeOf(const Outlet& outlet) {
  return qobject_cast<Class*>(reinterpret_cast<QObject*>(outlet.native()));
}

/// Returns `object`, which may be null, in the form in which an Outlet stores it.
[[nodiscard]] inline NativeObject* toNative(QObject* object) {
  return reinterpret_cast<NativeObject*>(object);
}

/// Creates an object that `parent` owns and deletes.
template <typename Class, typename Parent, typename... Arguments>
Class* makeChild(Parent* parent, Arguments&&... arguments) {
  return std::make_unique<Class>(std::forward<Arguments>(arguments)..., parent).release();
}

/// Converts `text` to the title of a button or menu item. Doubles each "&", because Qt would hide a
/// single "&" and underline the next letter.
[[nodiscard]] inline QString titleText(const std::string& text) {
  return QString::fromStdString(text).replace(QLatin1Char('&'), QLatin1String("&&"));
}

}  // namespace onramp::qt
