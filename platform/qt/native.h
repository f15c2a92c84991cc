#pragma once

#include <QObject>
#include <QString>
#include <memory>
#include <string>
#include <utility>

#include "platform/outlets.h"

namespace onramp::qt {

// Properties by which interface files say more than Qt's own ones can.
inline constexpr const char* kViewClass = "viewClass";          ///< text, set on a page's root
inline constexpr const char* kHeading = "heading";              ///< of a label: it is a title
inline constexpr const char* kSpokenColumns = "spokenColumns";  ///< texts: what names a list's row

/// The object that `outlet` stands for, if it is there and of that class; else null.
template <typename Class>
[[nodiscard]] Class* nativeOf(const Outlet& outlet) {
  return qobject_cast<Class*>(reinterpret_cast<QObject*>(outlet.native()));
}

[[nodiscard]] inline NativeObject* toNative(QObject* object) {
  return reinterpret_cast<NativeObject*>(object);
}

/// A new object that `parent` owns and deletes.
template <typename Class, typename Parent, typename... Arguments>
Class* makeChild(Parent* parent, Arguments&&... arguments) {
  return std::make_unique<Class>(std::forward<Arguments>(arguments)..., parent).release();
}

/// `text` as the title of a button or menu item, where a lone "&" would mark the next letter.
[[nodiscard]] inline QString titleText(const std::string& text) {
  return QString::fromStdString(text).replace(QLatin1Char('&'), QLatin1String("&&"));
}

}  // namespace onramp::qt
