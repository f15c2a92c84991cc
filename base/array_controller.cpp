#include "base/array_controller.h"

#include <algorithm>
#include <numeric>
#include <utility>

namespace onramp {

namespace {

// Returns a view, so that sorting thousands of entries copies no strings.
std::string_view sortText(const Dictionary& entry, const std::string& key) {
  const Value* const value = entry.find(key);
  const auto* const text = value ? value->as<std::string>() : nullptr;
  return text ? std::string_view(*text) : std::string_view();
}

}  // namespace

void ArrayController::addObjects(std::vector<Dictionary> entries) {
  if (entries.empty()) return;
  if (entries_.empty()) selection_ = 0;
  entries_.insert(entries_.end(), std::make_move_iterator(entries.begin()),
                  std::make_move_iterator(entries.end()));
  entriesChanged();
}

void ArrayController::removeObject(const Dictionary& entry) {
  std::size_t kept = 0;
  std::optional<std::size_t> selection;
  for (std::size_t i = 0; i < entries_.size(); ++i) {
    if (selection_ == i) selection = kept;  // if entry i is removed, the next one moves to `kept`
    if (entries_[i] == entry) {
      if (selection_ == i) hasChoice_ = false;
      continue;
    }
    if (kept != i) entries_[kept] = std::move(entries_[i]);
    ++kept;
  }
  if (kept == entries_.size()) return;
  entries_.resize(kept);
  if (selection == kept) selection = kept > 0 ? std::optional(kept - 1) : std::nullopt;
  selection_ = selection;
  entriesChanged();
}

void ArrayController::removeAllObjects() {
  entries_.clear();
  selection_.reset();
  hasChoice_ = false;
  entriesChanged();
}

void ArrayController::rearrange() {
  if (!sortKey_.empty()) {
    std::vector<std::size_t> order(entries_.size());
    std::iota(order.begin(), order.end(), std::size_t{0});
    std::stable_sort(order.begin(), order.end(), [&](std::size_t a, std::size_t b) {
      return sortText(entries_[a], sortKey_) < sortText(entries_[b], sortKey_);
    });
    std::vector<Dictionary> sorted;
    sorted.reserve(entries_.size());
    std::optional<std::size_t> selection;
    for (const std::size_t from : order) {
      if (selection_ == from) selection = sorted.size();
      sorted.push_back(std::move(entries_[from]));
    }
    entries_ = std::move(sorted);
    selection_ = selection;
  }
  entriesChanged();
}

void ArrayController::setSelectionIndex(std::size_t index) {
  selection_ = index < entries_.size() ? std::optional(index) : std::nullopt;
  if (onSelect_) onSelect_();
}

void ArrayController::choose(std::size_t index) {
  hasChoice_ = true;
  setSelectionIndex(index);
}

void ArrayController::chooseObject(const Dictionary& entry) {
  choose(indexOf(entry));
}

void ArrayController::setSelectedObject(const Dictionary& entry) {
  setSelectionIndex(indexOf(entry));
}

// Returns the index of the first entry equal to `entry`, or the number of entries if there is none.
std::size_t ArrayController::indexOf(const Dictionary& entry) const {
  const auto found = std::find(entries_.begin(), entries_.end(), entry);
  return static_cast<std::size_t>(found - entries_.begin());
}

std::optional<Dictionary> ArrayController::selectedObject() const {
  return selection_ ? std::optional(entries_[*selection_]) : std::nullopt;
}

void ArrayController::bind(std::function<void()> onChange, std::function<void()> onSelect) {
  onChange_ = std::move(onChange);
  onSelect_ = std::move(onSelect);
  if (onChange_) onChange_();
}

void ArrayController::entriesChanged() {
  count_ = entries_.size();
  if (onChange_) onChange_();
}

}  // namespace onramp
