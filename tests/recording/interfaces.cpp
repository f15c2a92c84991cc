#include "tests/recording/interfaces.h"

#include <algorithm>
#include <cstdlib>
#include <utility>
#include <vector>

namespace onramp {

namespace recording {

namespace {

// The objects of one loaded interface file, the root view first. A list of all loaded ones lets
// tests find objects by name.
class LoadedInterface {
 public:
  LoadedInterface(std::string className, InterfaceOwner& loadedFor)
      : viewClass(std::move(className)), owner(loadedFor) {
    live().push_back(this);
  }
  LoadedInterface(const LoadedInterface&) = delete;
  LoadedInterface& operator=(const LoadedInterface&) = delete;
  ~LoadedInterface() {
    std::erase(live(), this);
    for (const auto& object : objects) {
      for (Object* const inner : object->subviews)
        inner->superview = nullptr;
      if (object->superview) std::erase(object->superview->subviews, object.get());
    }
  }

  static std::vector<LoadedInterface*>& live() {
    static std::vector<LoadedInterface*> interfaces;
    return interfaces;
  }

  Object& add(OutletKind kind, const std::string& name) {
    objects.push_back(std::make_unique<Object>());
    objects.back()->kind = kind;
    objects.back()->name = name;
    return *objects.back();
  }

  std::string viewClass;
  InterfaceOwner& owner;
  std::vector<std::unique_ptr<Object>> objects;
};

}  // namespace

Object* findLiveObject(const std::string& name) {
  auto& interfaces = LoadedInterface::live();
  for (auto loaded = interfaces.rbegin(); loaded != interfaces.rend(); ++loaded) {
    for (const auto& object : (*loaded)->objects) {
      if (object->name == name) return object.get();
    }
  }
  return nullptr;
}

InterfaceOwner& ownerOf(const Object& object) {
  for (LoadedInterface* const loaded : LoadedInterface::live()) {
    for (const auto& candidate : loaded->objects) {
      if (candidate.get() == &object) return loaded->owner;
    }
  }
  std::abort();
}

}  // namespace recording

using recording::Object;

struct Interface::Tree {
  Tree(const std::string& name, InterfaceOwner& owner) : loaded{name, owner} {}
  recording::LoadedInterface loaded;
};

namespace {

struct Part {
  OutletKind kind;
  const char* name;
};

// The outlets in the interface files. A test holds them against the files and the program.
const std::vector<Part>& partsOf(const std::string& interfaceName) {
  using enum OutletKind;
  static std::map<std::string, std::vector<Part>> parts = {
      {"MainMenu",
       {{kWindow, "window"},
        {kView, "mainView"},
        {kImageView, "mBackGroundView"},
        {kButton, "leftMostButton"},
        {kButton, "leftButton"},
        {kButton, "rightButton"},
        {kButton, "rightMostButton"}}},
      {"ModelListView",
       {{kTableView, "modelListView"},
        {kTextField, "modelListTitle"},
        {kTextField, "modelListDescriptionTextField"}}},
      {"ConnectionTypeView",
       {{kTextField, "connectionTypeTitle"},
        {kTextField, "connectionDescriptionTextField"},
        {kRadioMatrix, "connectionTypeRadioButton"},
        {kImageView, "connectionTypeImage1"},
        {kImageView, "connectionTypeImage2"},
        {kTextField, "progressTxtField"},
        {kProgressIndicator, "progress"}}},
      {"ChooseDeviceView",
       {{kTableView, "deviceListView"},
        {kTextField, "deviceListTitle"},
        {kPopUpButton, "deviceListPopupButton"},
        {kTextField, "progressTxtField"},
        {kProgressIndicator, "progress"}}}};
  return parts[interfaceName];
}

void bindAsTheFilesDo(Object& object, KeyValueTexts& texts) {
  if (object.kind == OutletKind::kWindow) object.titleBinding = "windowTitle";
  if (object.kind == OutletKind::kButton) {
    object.titleBinding = object.name + "Title";
    object.action = object.name + "Clicked";
  }
  if (object.kind == OutletKind::kPopUpButton) {
    object.items = {{"Gear", nullptr}, {"Left over", nullptr}, {"From the file", nullptr}};
  }
  if (object.titleBinding.empty()) return;
  texts.bind(object.titleBinding, [&object](const std::string& text) { object.text = text; });
}

}  // namespace

Interface::Interface(std::unique_ptr<Tree> tree) : tree_(std::move(tree)) {}

Interface::~Interface() = default;

std::unique_ptr<Interface> Interface::load(const std::string& name, InterfaceOwner& owner) {
  const std::vector<Part>& parts = partsOf(name);
  if (parts.empty() || recording::FrontEnd::instance().missingInterfaces.contains(name)) {
    return nullptr;
  }
  auto tree = std::make_unique<Tree>(name, owner);
  tree->loaded.add(OutletKind::kView, name);
  for (const Part& part : parts) {
    bindAsTheFilesDo(tree->loaded.add(part.kind, part.name), owner.boundTexts());
  }
  return std::unique_ptr<Interface>(new Interface(std::move(tree)));
}

View Interface::view() const {
  return View(tree_->loaded.objects.front()->native());
}

std::string Interface::viewClass() const {
  return tree_->loaded.viewClass;
}

NativeObject* Interface::find(std::string_view name, OutletKind kind) const {
  for (const auto& object : tree_->loaded.objects) {
    if (object->name == name && object->kind == kind) return object->native();
  }
  return nullptr;
}

}  // namespace onramp
