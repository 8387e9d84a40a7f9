// A message that its receiver does not understand.

#import <AddressBook/AddressBook.h>
#import <Foundation/Foundation.h>
#import <SystemConfiguration/SystemConfiguration.h>

#ifdef QORN_WRONG_USE
#    define mutableCopy mutableCopyy
#endif

#include "1Base/BaseMacOS/_Imp/BaseMacOSCocoa.mm"
