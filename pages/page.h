#pragma once

#include <memory>
#include <string>
#include <string_view>
#include <utility>

#include "platform/interface_file.h"
#include "platform/outlets.h"

namespace onramp {

/// One page of the wizard: a view and all other objects from the view's interface file. Each kind
/// of page is a subclass; a view of an unknown class becomes a plain Page.
class Page {
 public:
  explicit Page(std::unique_ptr<Interface> interface) : interface_(std::move(interface)) {}
  Page(const Page&) = delete;
  Page& operator=(const Page&) = delete;
  virtual ~Page() = default;

  [[nodiscard]] View view() const { return interface_->view(); }

 protected:
  template <typename Handle>
  [[nodiscard]] Handle outlet(std::string_view name) const {
    return interface_->outlet<Handle>(name);
  }

  /// Destroys the view. A page whose members are bound to the view must call this function in its
  /// destructor, because the members are destroyed before the base class.
  void destroyView() { interface_.reset(); }

 private:
  std::unique_ptr<Interface> interface_;
};

/// Loads the page in the interface file `name` and binds its controls to `owner`. Returns null when
/// the file is missing or unreadable, or holds no view.
[[nodiscard]] std::shared_ptr<Page> loadPage(const std::string& name, InterfaceOwner& owner);

/// Shows or hides a page's waiting state: a turning spinner and the text beside it.
void showWaiting(const ProgressIndicator& progress, const TextField& text, bool on);

}  // namespace onramp
