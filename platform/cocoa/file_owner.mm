#import "platform/cocoa/file_owner.h"

#import "platform/cocoa/retained.h"
#import "platform/cocoa/text.h"

@implementation OnrampFileOwner

- (instancetype)initWithOwner:(onramp::InterfaceOwner&)owner {
  self = [super init];
  if (self) {
    _owner = &owner;
    _boundKeys = [[NSMutableSet alloc] init];
  }
  return self;
}

- (void)dealloc {
  [_boundKeys release];
  [super dealloc];
}

- (NSWindow*)window {
  return _window;
}

// Not retained: the interface that the window was loaded with owns it.
- (void)setWindow:(NSWindow*)window {
  _window = window;
}

// A binding begins by asking for its key's value. From then on it is notified of every change.
- (id)valueForUndefinedKey:(NSString*)key {
  const std::string name = onramp::cocoa::toStdString(key);
  if (![_boundKeys containsObject:key]) {
    [_boundKeys addObject:key];
    _owner->boundTexts().bind(
        name, [owner = onramp::cocoa::Retained<OnrampFileOwner>(self),
               boundKey = onramp::cocoa::Retained<NSString>(key)](const std::string&) {
          [owner.get() willChangeValueForKey:boundKey.get()];
          [owner.get() didChangeValueForKey:boundKey.get()];
        });
  }
  return onramp::cocoa::toNSString(_owner->boundTexts().valueForKey(name));
}

@end
