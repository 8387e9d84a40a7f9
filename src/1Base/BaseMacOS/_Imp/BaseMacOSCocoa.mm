// Cocoa, SystemConfiguration and AddressBook.
//
// Compiled without automatic reference counting. What Cocoa hands back autoreleased lives in the
// pool of the calling thread, which the host provides.

#include "1Base/BaseMacOS/_Imp/BaseMacOSNative.h"

#include "1Base/BaseMacOS/BaseMacOS.h"

#import <AddressBook/AddressBook.h>
#import <Foundation/Foundation.h>
#import <SystemConfiguration/SystemConfiguration.h>

#include <sys/sysctl.h>

#include <cstddef>
#include <vector>

namespace MacOS {
namespace {

NSString* stringOf(std::string const& text) {
    return [NSString stringWithUTF8String:text.c_str()];
}

NSURL* urlOf(std::string const& path) {
    return [NSURL fileURLWithPath:stringOf(path)];
}

// Empty for nil.
std::string textOf(NSString* string) {
    char const* const text = [string UTF8String];
    return text == nullptr ? std::string() : std::string(text);
}

// Takes over the string, which may be null.
std::string takeText(CFStringRef string) {
    if (string == nullptr)
        return std::string();
    std::string const text = textOf((NSString*)string);
    CFRelease(string);
    return text;
}

struct CFolder {
    NSSearchPathDirectory directory;
    char const* suffix;
};

CFolder folderOf(int type) {
    switch (type) {
    case sftPreferences:
        return {NSLibraryDirectory, "/Preferences"};
    case sftSharedUserData:
        return {NSUserDirectory, "/Shared"};
    case sftDesktop:
        return {NSDesktopDirectory, ""};
    case sftLibrary:
        return {NSLibraryDirectory, ""};
    case sftPrograms:
        return {NSApplicationDirectory, ""};
    case sftFonts:
        return {NSLibraryDirectory, "/Fonts"};
    case sftApplicationSupport:
        return {NSApplicationSupportDirectory, ""};
    default:
        return {NSDocumentDirectory, ""};
    }
}

NSSearchPathDomainMask maskOf(int domain) {
    switch (domain) {
    case sfdUser:
        return NSUserDomainMask;
    case sfdSystem:
        return NSSystemDomainMask;
    default:
        return NSLocalDomainMask;
    }
}

} // namespace

namespace Native {

std::string addingPercentEscapes(std::string const& text) {
    NSMutableCharacterSet* const allowed =
        [[[NSCharacterSet URLQueryAllowedCharacterSet] mutableCopy] autorelease];
    // They stand in a query, but in a value of it they would end it.
    [allowed removeCharactersInString:@"!*'();:@&=+$,/?%#[]"];
    return textOf([stringOf(text) stringByAddingPercentEncodingWithAllowedCharacters:allowed]);
}

std::string getUserName(bool login) {
    return textOf(login ? NSUserName() : NSFullUserName());
}

std::string getMachineName() {
    return takeText(SCDynamicStoreCopyComputerName(nullptr, nullptr));
}

std::string getModelIdentifier() {
    char const* const name = "hw.model";
    std::size_t size = 0;
    sysctlbyname(name, nullptr, &size, nullptr, 0);
    if (size == 0)
        return std::string();
    std::vector<char> buffer(size + 1);
    sysctlbyname(name, buffer.data(), &size, nullptr, 0);
    return std::string(buffer.data());
}

// AddressBook is deprecated in favour of Contacts.
#pragma GCC diagnostic push
#pragma GCC diagnostic ignored "-Wdeprecated-declarations"
std::string getUserEmailAddress() {
    ABPerson* const me = [[ABAddressBook sharedAddressBook] me];
    ABMultiValue* const addresses = [me valueForProperty:kABEmailProperty];
    return [addresses count] > 0 ? textOf([addresses valueAtIndex:0]) : std::string();
}
#pragma GCC diagnostic pop

bool usesMetricSystem() {
    return [[[NSLocale currentLocale] objectForKey:NSLocaleUsesMetricSystem] boolValue];
}

bool setHiddenAttribute(std::string const& path, bool hidden) {
    return [urlOf(path) setResourceValue:[NSNumber numberWithBool:hidden]
                                  forKey:NSURLIsHiddenKey
                                   error:nullptr];
}

bool createBookmarkFile(std::string const& source, std::string const& bookmark) {
    NSData* const data =
        [urlOf(source) bookmarkDataWithOptions:NSURLBookmarkCreationSuitableForBookmarkFile
                includingResourceValuesForKeys:nil
                                 relativeToURL:nil
                                         error:nullptr];
    if (data != nil) {
        NSError* error = nil;
        if (![NSURL writeBookmarkData:data
                                toURL:urlOf(bookmark)
                              options:NSURLBookmarkCreationSuitableForBookmarkFile
                                error:&error]) {
            NSLog(@"error is %@", [error localizedDescription]);
            return false;
        }
    }
    // Reading it shows that the system can; what comes of it does not matter.
    std::string ignored;
    resolveBookmarkFile(bookmark, ignored);
    return data != nil;
}

bool resolveBookmarkFile(std::string const& bookmark, std::string& result) {
    NSData* const data = [NSURL bookmarkDataWithContentsOfURL:urlOf(bookmark) error:nullptr];
    if (data == nil)
        return false;
    BOOL isStale = NO; // a file that was moved is found all the same
    NSURL* const url = [NSURL URLByResolvingBookmarkData:data
                                                 options:NSURLBookmarkResolutionWithoutUI
                                           relativeToURL:nil
                                     bookmarkDataIsStale:&isStale
                                                   error:nullptr];
    if (url == nil)
        return false;
    result = takeText(CFURLCopyFileSystemPath((CFURLRef)url, kCFURLPOSIXPathStyle));
    return true;
}

bool getSpecialFolder(int folder, int domain, std::string& path) {
    if (folder == sftTemporaryItems) {
        path = textOf(NSTemporaryDirectory());
        return true;
    }
    CFolder const known = folderOf(folder);
    NSArray* const folders =
        NSSearchPathForDirectoriesInDomains(known.directory, maskOf(domain), YES);
    if ([folders count] == 0)
        return false;
    path = textOf([folders objectAtIndex:0]) + known.suffix;
    return true;
}

} // namespace Native
} // namespace MacOS
