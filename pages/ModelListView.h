#pragma once

#include <memory>
#include <optional>
#include <string>

#include "base/array_controller.h"
#include "pages/page.h"
#include "platform/outlets.h"

namespace onramp {

/// The page that lists the medium's models. A new page object is created each time the page is
/// shown.
class ModelListView final : public Page {
 public:
  explicit ModelListView(std::unique_ptr<Interface> interface);
  ModelListView(const ModelListView&) = delete;
  ModelListView& operator=(const ModelListView&) = delete;
  ~ModelListView() override { destroyView(); }

  /// Returns the name of the selected model, or nothing when no model is selected.
  [[nodiscard]] std::optional<std::string> choosedModelName() const;

  /// Selects the model called `name`, or clears the selection when the list has no model of that
  /// name.
  void setChoosedModel(const std::string& name);

 private:
  void awakeFromNib();
  void addModelToList();

  ArrayController modelArrayController;
  TableView modelListView;
  TextField modelListTitle;
  TextField modelListDescriptionTextField;
};

}  // namespace onramp
