// An argument of another type.

#import <AddressBook/AddressBook.h>
#import <Foundation/Foundation.h>
#import <SystemConfiguration/SystemConfiguration.h>

#ifdef QORN_WRONG_USE
#    define NSURLIsHiddenKey 1
#endif

#include "1Base/BaseMacOS/_Imp/BaseMacOSCocoa.mm"
