#include <algorithm>
#include <list>
#include <utility>
#include <vector>

#include "platform/interface_file.h"
#include "tests/recording/front_end.h"

namespace onramp {

using recording::FrontEnd;
using recording::Object;

// The objects of one loaded interface file, the root view first.
struct Interface::Tree {
  Tree() = default;
  Tree(const Tree&) = delete;
  Tree& operator=(const Tree&) = delete;
  ~Tree() {
    for (Object& object : objects) {
      for (Object* const inner : object.subviews)
        inner->superview = nullptr;
      if (object.superview) std::erase(object.superview->subviews, &object);
      std::erase(FrontEnd::instance().loaded, &object);
    }
  }

  Object& add(OutletKind kind, const std::string& name, InterfaceOwner& owner) {
    Object& object = objects.emplace_back();
    object.kind = kind;
    object.name = name;
    object.owner = &owner;
    FrontEnd::instance().loaded.push_back(&object);
    return object;
  }

  std::list<Object> objects;
};

namespace {

using Part = std::pair<OutletKind, const char*>;

// Returns the outlets in an interface file. A test in tests/resources compares this table with the
// interface files and with the program's code.
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
  if (object.kind == OutletKind::kButton) object.action = object.name + "Clicked";
  if (object.kind == OutletKind::kPopUpButton) {
    object.items = {{"Gear", nullptr}, {"Left over", nullptr}, {"From the file", nullptr}};
  }
  if (object.kind != OutletKind::kButton && object.kind != OutletKind::kWindow) return;
  texts.bind(object.name + "Title", [&object](const std::string& text) { object.text = text; });
}

}  // namespace

Interface::Interface(std::unique_ptr<Tree> tree) : tree_(std::move(tree)) {}

Interface::~Interface() = default;

std::unique_ptr<Interface> Interface::load(const std::string& name, InterfaceOwner& owner) {
  const std::vector<Part>& parts = partsOf(name);
  if (parts.empty() || FrontEnd::instance().missingInterfaces.contains(name)) return nullptr;
  auto tree = std::make_unique<Tree>();
  tree->add(OutletKind::kView, name, owner);
  for (const auto& [kind, outlet] : parts)
    bindAsTheFilesDo(tree->add(kind, outlet, owner), owner.boundTexts());
  return std::unique_ptr<Interface>(new Interface(std::move(tree)));
}

View Interface::view() const {
  return View(tree_->objects.front().native());
}

std::string Interface::viewClass() const {
  return tree_->objects.front().name;
}

NativeObject* Interface::find(std::string_view name, OutletKind kind) const {
  for (Object& object : tree_->objects) {
    if (object.name == name && object.kind == kind) return object.native();
  }
  return nullptr;
}

}  // namespace onramp
