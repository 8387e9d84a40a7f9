/// The card of the user in the address book. Deprecated, as in the framework.
#ifndef QORN_TESTS_APPLEHEADERS_ADDRESSBOOK_H
#define QORN_TESTS_APPLEHEADERS_ADDRESSBOOK_H

// These declarations use one another without a warning.
#pragma GCC system_header

#import <Foundation/Foundation.h>

#define QORN_DEPRECATED_CARD __attribute__((deprecated("use Contacts")))

QORN_DEPRECATED_CARD
@interface ABMultiValue : NSObject
- (NSUInteger)count;
- (id)valueAtIndex:(NSUInteger)index;
@end

QORN_DEPRECATED_CARD
@interface ABRecord : NSObject
- (id)valueForProperty:(NSString*)property;
@end

QORN_DEPRECATED_CARD
@interface ABPerson : ABRecord
@end

QORN_DEPRECATED_CARD
@interface ABAddressBook : NSObject
+ (ABAddressBook*)sharedAddressBook;
- (ABPerson*)me;
@end

extern "C" NSString* const kABEmailProperty QORN_DEPRECATED_CARD;

#endif
