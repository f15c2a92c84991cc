#pragma once

#include <memory>
#include <string>

#include "platform/interface_file.h"

namespace onramp {

/// What the window shows at a time: a view and everything loaded with it. Which page it is, its
/// class says; a view of a class that this program does not know is a plain Page.
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

 private:
  std::unique_ptr<Interface> interface_;
};

/// The page made from the interface file `name`; null when the file is missing or holds no view.
[[nodiscard]] std::shared_ptr<Page> loadPage(const std::string& name, InterfaceOwner& owner);

}  // namespace onramp
