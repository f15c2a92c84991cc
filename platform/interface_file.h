#pragma once

#include <memory>
#include <string>
#include <string_view>

#include "base/key_value.h"
#include "platform/outlets.h"

namespace onramp {

/// The owner of an interface file. Such a file describes windows and views. It binds titles to
/// texts of its owner, and names the action that the owner performs when the user clicks a button.
/// The owner must outlive all objects that are created from the file.
class InterfaceOwner {
 public:
  InterfaceOwner() = default;
  InterfaceOwner(const InterfaceOwner&) = delete;
  InterfaceOwner& operator=(const InterfaceOwner&) = delete;
  virtual ~InterfaceOwner() = default;

  /// Performs the action with the name `action`. Does nothing when the owner has no action of that
  /// name.
  virtual void performAction(std::string_view action) = 0;

  /// Returns the texts to which the interface file binds titles.
  [[nodiscard]] KeyValueTexts& boundTexts() { return boundTexts_; }

 private:
  KeyValueTexts boundTexts_;
};

/// Owns the objects that were created from one interface file of the application's bundle.
class Interface {
 public:
  /// Loads the interface file `name` (without its extension) for `owner`. Returns null when the
  /// bundle has no readable interface file of that name.
  [[nodiscard]] static std::unique_ptr<Interface> load(const std::string& name,
                                                       InterfaceOwner& owner);

  Interface(const Interface&) = delete;
  Interface& operator=(const Interface&) = delete;
  ~Interface();

  /// Returns the first of the file's top-level views, or an empty handle when there is none. In
  /// Qt's files, a window counts as a view.
  [[nodiscard]] View view() const;

  /// Returns the class name of the view that view() returns, such as "ModelListView". Returns an
  /// empty string when there is no view or the file gives the view no class.
  [[nodiscard]] std::string viewClass() const;

  /// Returns a handle to the object of kind Handle::kKind that the file calls `name`. Returns an
  /// empty handle when there is no such object. With Cocoa, finds no menus, no menu items, and
  /// no windows except the one called "window".
  template <typename Handle>
  [[nodiscard]] Handle outlet(std::string_view name) const {
    return Handle(find(name, Handle::kKind));
  }

 private:
  struct Tree;

  explicit Interface(std::unique_ptr<Tree> tree);
  [[nodiscard]] NativeObject* find(std::string_view name, OutletKind kind) const;

  std::unique_ptr<Tree> tree_;
};

}  // namespace onramp
