#pragma once

#include <memory>
#include <optional>
#include <string>

#include "base/array_controller.h"
#include "pages/page.h"
#include "platform/outlets.h"

namespace onramp {

/// The page that lists the medium's models. A new one is made each time it is shown.
class ModelListView final : public Page {
 public:
  explicit ModelListView(std::unique_ptr<Interface> interface);

  /// Name of the selected model; nothing when no model is selected.
  [[nodiscard]] std::optional<std::string> choosedModelName() const;

  /// Selects the model with that name; nothing is selected when the list has none.
  void setChoosedModel(const std::string& name);

 private:
  void awakeFromNib();
  void addModelToList();

  // The table is bound to the controller, which is therefore destroyed after it.
  ArrayController modelArrayController;
  TableView modelListView;
  TextField modelListTitle;
  TextField modelListDescriptionTextField;
};

}  // namespace onramp
