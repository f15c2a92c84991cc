#pragma once

#include <memory>
#include <string>
#include <string_view>
#include <utility>

#include "platform/interface_file.h"
#include "platform/outlets.h"

namespace onramp {

/// One page of the wizard: a view and all other objects from the view's interface file. Each kind
/// of page is a subclass. A view of an unknown class becomes a plain Page.
class Page {
 public:
  /// The page owns `interface`, which must contain a view.
  explicit Page(std::unique_ptr<Interface> interface) : interface_(std::move(interface)) {}
  Page(const Page&) = delete;
  Page& operator=(const Page&) = delete;
  virtual ~Page() = default;

  [[nodiscard]] View view() const { return interface_->view(); }

 protected:
  /// Returns the object that the interface file calls `name`, or an empty handle when no object of
  /// the handle's kind has that name.
  template <typename Handle>
  [[nodiscard]] Handle outlet(std::string_view name) const {
    return interface_->outlet<Handle>(name);
  }

  /// Destroys the view. A page that binds a list to a table must call this function in its
  /// destructor. Otherwise the list would be destroyed before the table.
  void destroyView() { interface_.reset(); }

 private:
  std::unique_ptr<Interface> interface_;
};

/// Loads the page in the interface file `name` and binds its controls to `owner`. Returns null when
/// the file is missing, cannot be read or contains no view.
[[nodiscard]] std::shared_ptr<Page> loadPage(const std::string& name, InterfaceOwner& owner);

/// Shows or hides `progress`, a spinner, and `text`, which asks the user to wait. The spinner is
/// animated only while it is shown.
void showWaiting(const ProgressIndicator& progress, const TextField& text, bool on);

}  // namespace onramp
