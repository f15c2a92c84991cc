#pragma once

#include <memory>
#include <string>
#include <string_view>

#include "base/key_value.h"
#include "platform/outlets.h"

namespace onramp {

/// Who an interface file is loaded for: the file binds titles to the owner's texts and sends clicks
/// to the owner's actions. The owner outlives everything loaded for it.
class InterfaceOwner {
 public:
  InterfaceOwner() = default;
  InterfaceOwner(const InterfaceOwner&) = delete;
  InterfaceOwner& operator=(const InterfaceOwner&) = delete;
  virtual ~InterfaceOwner() = default;

  /// Does what the action named in the interface file asks for; an unknown name does nothing.
  virtual void performAction(std::string_view action) = 0;

  [[nodiscard]] KeyValueTexts& boundTexts() { return boundTexts_; }

 private:
  KeyValueTexts boundTexts_;
};

/// The objects made from one interface file of the application's bundle. Owns them.
class Interface {
 public:
  /// Null when the bundle has no readable interface file of that name (given without extension).
  [[nodiscard]] static std::unique_ptr<Interface> load(const std::string& name,
                                                       InterfaceOwner& owner);

  Interface(const Interface&) = delete;
  Interface& operator=(const Interface&) = delete;
  ~Interface();

  /// The first top-level object that is a view, whatever its class; empty when none is.
  [[nodiscard]] View view() const;

  /// The class that the file gives that view, such as "ModelListView"; empty when there is no view.
  [[nodiscard]] std::string viewClass() const;

  /// The object that the file names `name`, or an empty handle when there is none of that kind.
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
