#include "pages/ModelListView.h"

#include <utility>
#include <vector>

#include "media/CommonMessage.h"
#include "media/KSOROSXCD.h"

namespace onramp {

namespace {

constexpr const char* kModel = "model";

}  // namespace

ModelListView::ModelListView(std::unique_ptr<Interface> interface)
    : Page(std::move(interface)),
      modelListView(outlet<TableView>("modelListView")),
      modelListTitle(outlet<TextField>("modelListTitle")),
      modelListDescriptionTextField(outlet<TextField>("modelListDescriptionTextField")) {
  awakeFromNib();
}

void ModelListView::awakeFromNib() {
  modelListTitle.setStringValue(localized("INST_TXT_MODEL"));
  modelListDescriptionTextField.setStringValue(localized("INST_TXT_MODEL_DESC"));
  modelArrayController.setSortKey(kModel);
  addModelToList();
  modelArrayController.rearrange();
  modelArrayController.setSelectionIndex(0);
  modelListView.bind(modelArrayController);
}

void ModelListView::addModelToList() {
  std::vector<Dictionary> entries;
  for (std::string& model : containedModels(KSOROSXCD::initWithCDInfo())) {
    entries.push_back(Dictionary{{kModel, std::move(model)}});
  }
  modelArrayController.addObjects(std::move(entries));
}

std::optional<std::string> ModelListView::choosedModelName() const {
  const std::optional<Dictionary> entry = modelArrayController.selectedObject();
  return entry ? entry->string(kModel) : std::nullopt;
}

void ModelListView::setChoosedModel(const std::string& name) {
  modelArrayController.setSelectedObject(Dictionary{{kModel, name}});
}

}  // namespace onramp
