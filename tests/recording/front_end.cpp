#include "tests/recording/front_end.h"

#include <algorithm>
#include <cstdio>
#include <cstdlib>

#include "base/array_controller.h"
#include "platform/run_loop.h"
#include "platform/workspace.h"
#include "tests/recording/loop.h"

namespace onramp::recording {

FrontEnd& FrontEnd::instance() {
  static FrontEnd frontEnd;
  return frontEnd;
}

void FrontEnd::reset() {
  mainInterface_.reset();
  const std::vector<Object*> others = std::move(loaded);  // objects of pages that still exist
  *this = FrontEnd();
  loaded = others;
  resetLoop();

  Object& bar = addMenuObject(OutletKind::kMenu, "");
  Object& item = addMenuObject(OutletKind::kMenuItem, "Onramp OSX");
  Object& menu = addMenuObject(OutletKind::kMenu, "");
  bar.subviews = {&item};
  item.subviews = {&menu};
  for (const char* title : {"About", "Hide", "Hide Others", "Show All", "Quit"})
    menu.subviews.push_back(&addMenuObject(OutletKind::kMenuItem, title));
}

Object& FrontEnd::addMenuObject(OutletKind kind, const std::string& text) {
  menus_.emplace_back();
  menus_.back().kind = kind;
  menus_.back().text = text;
  return menus_.back();
}

Object* FrontEnd::menuBar() {
  return menus_.empty() ? nullptr : &menus_.front();
}

void FrontEnd::schedule(double seconds, std::function<void()> action) {
  delays.push_back(seconds);
  timers_.push_back({now_ + seconds, std::move(action)});
}

void FrontEnd::open(const std::string& target) {
  opened.push_back(target);
  if (duringOpening) duringOpening();
}

void FrontEnd::launch(ApplicationDelegate& delegate) {
  mainInterface_ = Interface::load("MainMenu", delegate);
  if (!mainInterface_) return;
  delegate.setOutlets(*mainInterface_);
  delegate.awakeFromNib();
  delegate.applicationWillFinishLaunching();
  if (!terminated) delegate.applicationDidFinishLaunching();
}

Object& FrontEnd::object(const std::string& name) {
  const auto found = std::find_if(loaded.rbegin(), loaded.rend(),
                                  [&](const Object* each) { return each->name == name; });
  if (found == loaded.rend()) {
    std::fprintf(stderr, "no object named %s\n", name.c_str());
    std::abort();
  }
  return **found;
}

void FrontEnd::click(const std::string& buttonName) {
  const Object& button = object(buttonName);
  if (button.hidden || !button.enabled) return;
  button.owner->performAction(button.action);
}

void FrontEnd::runTimers() {
  while (!timers_.empty() && !terminated) {
    const auto next =
        std::min_element(timers_.begin(), timers_.end(),
                         [](const Timer& a, const Timer& b) { return a.due < b.due; });
    const Timer timer = std::move(*next);
    timers_.erase(next);
    now_ = timer.due;
    timer.action();
  }
}

}  // namespace onramp::recording

namespace onramp {

using recording::FrontEnd;

void scheduleTimer(std::chrono::milliseconds delay, std::function<void()> action) {
  FrontEnd::instance().schedule(std::chrono::duration<double>(delay).count(), std::move(action));
}

void terminateApplication() {
  FrontEnd::instance().log.emplace_back("terminate");
  FrontEnd::instance().terminated = true;
  recording::endLoop();
}

void hideApplication() {
  FrontEnd::instance().log.emplace_back("hide");
}
void unhideApplication() {
  FrontEnd::instance().log.emplace_back("unhide");
}
void activateIgnoringOtherApps() {
  FrontEnd::instance().log.emplace_back("activate");
}

bool openFile(const std::string& path) {
  FrontEnd::instance().open(path);
  return true;
}

bool openURL(const std::string& url) {
  FrontEnd::instance().open(url);
  return true;
}

Menu mainMenu() {
  recording::Object* const bar = FrontEnd::instance().menuBar();
  return Menu(bar ? bar->native() : nullptr);
}

void setMainMenu(const Menu&) {}

void runCriticalAlert(const std::string& messageText, const std::string& informativeText,
                      const std::string& buttonTitle) {
  FrontEnd::instance().log.emplace_back("alert");
  FrontEnd::instance().alerts.push_back({messageText, informativeText, buttonTitle});
}

void beginAlertSheet(const AlertSheet& sheet, const Window&, std::function<void(int)> didEnd) {
  FrontEnd::instance().log.emplace_back("sheet");
  FrontEnd::instance().sheets.emplace_back(sheet, std::move(didEnd));
}

}  // namespace onramp
