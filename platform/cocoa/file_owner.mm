#import "platform/cocoa/file_owner.h"

#import "platform/cocoa/content_size.h"
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

// Does not retain the window, because the Interface that loaded the file owns the window.
- (void)setWindow:(NSWindow*)window {
  _window = window;
}

// A binding calls this function to get the text for its key. After the first call for a key, this
// object reports every change to that text. Each binding to the key then calls this function again.
- (id)valueForUndefinedKey:(NSString*)key {
  const std::string name = onramp::cocoa::toStdString(key);
  if (![_boundKeys containsObject:key]) {
    [_boundKeys addObject:key];
    _owner->boundTexts().bind(
        name, [owner = onramp::cocoa::Retained<OnrampFileOwner>(self),
               boundKey = onramp::cocoa::Retained<NSString>(key)](const std::string&) {
          [owner.get() willChangeValueForKey:boundKey.get()];
          [owner.get() didChangeValueForKey:boundKey.get()];
          onramp::cocoa::fitWindow([owner.get() window]);
        });
  }
  return onramp::cocoa::toNSString(_owner->boundTexts().valueForKey(name));
}

@end
