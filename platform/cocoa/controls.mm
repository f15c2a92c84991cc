#include <utility>

#import "platform/cocoa/action.h"
#import "platform/cocoa/content_size.h"
#import "platform/cocoa/native.h"
#import "platform/cocoa/retained.h"
#import "platform/cocoa/text.h"

namespace onramp {

using cocoa::nativeOf;
using cocoa::Retained;
using cocoa::toNSString;

void RadioMatrix::setTitle(int row, int column, const std::string& title) const {
  NSMatrix* const matrix = nativeOf<NSMatrix>(*this);
  [[matrix cellAtRow:row column:column] setTitle:toNSString(title)];
  [matrix setNeedsDisplay:YES];
  cocoa::fitWindow([matrix window]);
}

void RadioMatrix::selectCell(int row, int column) const {
  [nativeOf<NSMatrix>(*this) selectCellAtRow:row column:column];
}

int RadioMatrix::selectedRow() const {
  NSMatrix* const matrix = nativeOf<NSMatrix>(*this);
  return matrix ? static_cast<int>([matrix selectedRow]) : 0;
}

void ImageView::setImage(const Image& image) const {
  const auto picture =
      Retained<NSImage>::adopt([[NSImage alloc] initByReferencingFile:toNSString(image.path)]);
  [nativeOf<NSImageView>(*this) setImage:picture.get()];
}

void ImageView::setImageScaling(ImageScaling scaling) const {
  [nativeOf<NSImageView>(*this) setImageScaling:scaling == ImageScaling::kAxesIndependently
                                                    ? NSImageScaleAxesIndependently
                                                    : NSImageScaleProportionallyDown];
}

void ProgressIndicator::startAnimation() const {
  [nativeOf<NSProgressIndicator>(*this) startAnimation:nil];
}

void ProgressIndicator::stopAnimation() const {
  [nativeOf<NSProgressIndicator>(*this) stopAnimation:nil];
}

std::size_t PopUpButton::numberOfItems() const {
  return static_cast<std::size_t>([nativeOf<NSPopUpButton>(*this) numberOfItems]);
}

void PopUpButton::removeItem(std::size_t index) const {
  if (index >= numberOfItems()) return;
  [nativeOf<NSPopUpButton>(*this) removeItemAtIndex:static_cast<NSInteger>(index)];
}

// A menu item retains its represented object but not its target, so `target` is set as both.
void PopUpButton::addItem(const std::string& title, std::function<void()> action) const {
  NSPopUpButton* const button = nativeOf<NSPopUpButton>(*this);
  if (!button) return;
  OnrampAction* const target = [OnrampAction actionWithFunction:std::move(action)];
  const auto item =
      Retained<NSMenuItem>::adopt([[NSMenuItem alloc] initWithTitle:toNSString(title)
                                                             action:@selector(perform:)
                                                      keyEquivalent:@""]);
  [item.get() setTarget:target];
  [item.get() setRepresentedObject:target];
  [[button menu] addItem:item.get()];
}

}  // namespace onramp
