#pragma once

#include <memory>
#include <optional>
#include <string>

#include "base/array_controller.h"
#include "pages/page.h"
#include "platform/outlets.h"

namespace onramp {

/// The page that lists the medium's models. Made anew each time it is shown.
class ModelListView final : public Page {
 public:
  explicit ModelListView(std::unique_ptr<Interface> interface);

  /// Name of the selected model; nothing when none is.
  [[nodiscard]] std::optional<std::string> choosedModelName() const;

  /// Selects the model of that name.
  void setChoosedModel(const std::string& name);

 private:
  void awakeFromNib();
  void addModelToList();

  // The controller comes before the table that is bound to it.
  ArrayController modelArrayController;
  TableView modelListView;
  TextField modelListTitle;
  TextField modelListDescriptionTextField;
};

}  // namespace onramp
