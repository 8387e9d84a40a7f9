#include "1Base/BaseMacOS/Cocoa/BaseMacOSCocoaSystem.h"

// Or NSDebug.h does not declare the counts, which the library keeps all the same.
#undef NDEBUG

#import <AddressBook/AddressBook.h>
#import <Foundation/Foundation.h>
#import <Foundation/NSDebug.h>
#import <SystemConfiguration/SystemConfiguration.h>

#include <sys/stat.h>
#include <sys/sysctl.h>

#include <algorithm>
#include <cstring>

#pragma GCC diagnostic ignored "-Wdeprecated-declarations"

namespace {

TestSupport::CCocoaSystem* cocoa = nullptr;

NSString* stringOf(std::string const& text) {
    return [NSString stringWithUTF8String:text.c_str()];
}

std::string textOf(NSString* string) {
    return string == nil ? std::string() : std::string([string UTF8String]);
}

bool isThere(NSURL* url) {
    struct stat status;
    return lstat([[url path] UTF8String], &status) == 0;
}

void setError(NSError** error, NSString* description) {
    if (error != nullptr)
        *error =
            [NSError errorWithDomain:NSCocoaErrorDomain
                                code:1
                            userInfo:[NSDictionary dictionaryWithObject:description
                                                                 forKey:NSLocalizedDescriptionKey]];
}

// What a file with a bookmark begins with; the target's path follows.
constexpr char mark[] = "book";

} // namespace

namespace TestSupport {

CCocoaSystem::CCocoaSystem() : pool_([[NSAutoreleasePool alloc] init]) {
    cocoa = this;
}

CCocoaSystem::~CCocoaSystem() {
    cocoa = nullptr;
    [static_cast<NSAutoreleasePool*>(pool_) drain];
}

std::vector<std::string> searchPaths(unsigned long directory, unsigned long domainMask) {
    std::vector<std::string> paths;
    NSArray* const found =
        NSSearchPathForDirectoriesInDomains(static_cast<NSSearchPathDirectory>(directory),
                                            static_cast<NSSearchPathDomainMask>(domainMask), YES);
    for (NSUInteger i = 0; i < [found count]; ++i)
        paths.push_back(textOf([found objectAtIndex:i]));
    return paths;
}

std::string temporaryDirectory() {
    return textOf(NSTemporaryDirectory());
}

static void callWithPool(std::function<void()> const& call) {
    NSAutoreleasePool* const pool = [[NSAutoreleasePool alloc] init];
    call();
    [pool drain];
}

static long objectsAlive() {
    long count = 0;
    for (Class const* type = GSDebugAllocationClassList(); *type != Nil; ++type)
        count += GSDebugAllocationCount(*type);
    return count;
}

long objectsLeftBy(std::function<void()> const& call) {
    GSDebugAllocationActive(YES);
    // What is made once stays.
    callWithPool(call);
    long const before = objectsAlive();
    for (int i = 0; i < 100; ++i)
        callWithPool(call);
    long const after = objectsAlive();
    GSDebugAllocationActive(NO);
    return after - before;
}

} // namespace TestSupport

// A string of the platform is one of Cocoa's here, as it is on macOS.
void CFRelease(CFTypeRef object) {
    [(id)object release];
}

CFStringRef CFURLCopyFileSystemPath(CFURLRef anURL, CFURLPathStyle pathStyle) {
    cocoa->pathStyle = pathStyle;
    return cocoa->hasPath ? (CFStringRef)[[(NSURL*)anURL path] copy] : nullptr;
}

CFStringRef SCDynamicStoreCopyComputerName(SCDynamicStoreRef store,
                                           CFStringEncoding* nameEncoding) {
    cocoa->sawStore = store != nullptr || nameEncoding != nullptr;
    return cocoa->computerName ? (CFStringRef)[stringOf(*cocoa->computerName) copy] : nullptr;
}

// A kernel that tells a size that its value has not, and writes no byte more than that.
int sysctlbyname(char const* name, void* oldp, size_t* oldlenp, void* newp, size_t newlen) {
    cocoa->calls.emplace_back(name);
    if (cocoa->modelResult != 0 || newp != nullptr || newlen != 0)
        return -1;
    if (oldp != nullptr)
        std::memcpy(oldp, cocoa->model.data(), std::min(*oldlenp, cocoa->model.size()));
    *oldlenp = cocoa->model.size();
    return 0;
}

NSString* const kABEmailProperty = @"Email";

@implementation ABMultiValue
- (NSUInteger)count {
    return cocoa->addresses->size();
}
- (id)valueAtIndex:(NSUInteger)index {
    return stringOf(cocoa->addresses->at(index));
}
@end

@implementation ABRecord
- (id)valueForProperty:(NSString*)property {
    if (![property isEqualToString:kABEmailProperty] || !cocoa->addresses)
        return nil;
    return [[[ABMultiValue alloc] init] autorelease];
}
@end

@implementation ABPerson
@end

@implementation ABAddressBook
+ (ABAddressBook*)sharedAddressBook {
    return [[[ABAddressBook alloc] init] autorelease];
}
- (ABPerson*)me {
    return cocoa->hasCard ? [[[ABPerson alloc] init] autorelease] : nil;
}
@end

@implementation NSURL (QORNMissing)

- (NSData*)bookmarkDataWithOptions:(NSURLBookmarkCreationOptions)options
    includingResourceValuesForKeys:(NSArray*)keys
                     relativeToURL:(NSURL*)relativeURL
                             error:(NSError**)error {
    cocoa->calls.emplace_back("make");
    cocoa->creationOptions = options;
    cocoa->sawKeys = keys != nil;
    cocoa->sawBase = cocoa->sawBase || relativeURL != nil;
    if (!isThere(self)) {
        setError(error, @"the target is missing");
        return nil;
    }
    std::string const content = mark + textOf([self path]);
    return [NSData dataWithBytes:content.data() length:content.size()];
}

+ (BOOL)writeBookmarkData:(NSData*)bookmarkData
                    toURL:(NSURL*)bookmarkFileURL
                  options:(NSURLBookmarkFileCreationOptions)options
                    error:(NSError**)error {
    cocoa->calls.emplace_back("write");
    cocoa->writeOptions = options;
    if ([bookmarkData writeToFile:[bookmarkFileURL path] atomically:NO])
        return YES;
    setError(error, @"the folder is missing");
    return NO;
}

+ (NSData*)bookmarkDataWithContentsOfURL:(NSURL*)bookmarkFileURL error:(NSError**)error {
    cocoa->calls.emplace_back("read");
    NSData* const data = [NSData dataWithContentsOfFile:[bookmarkFileURL path]];
    if ([data length] >= std::strlen(mark) &&
        std::memcmp([data bytes], mark, std::strlen(mark)) == 0)
        return data;
    setError(error, @"no bookmark");
    return nil;
}

+ (NSURL*)URLByResolvingBookmarkData:(NSData*)bookmarkData
                             options:(NSURLBookmarkResolutionOptions)options
                       relativeToURL:(NSURL*)relativeURL
                 bookmarkDataIsStale:(BOOL*)isStale
                               error:(NSError**)error {
    cocoa->calls.emplace_back("resolve");
    cocoa->resolutionOptions = options;
    cocoa->sawBase = cocoa->sawBase || relativeURL != nil;
    *isStale = YES;
    std::string const content(static_cast<char const*>([bookmarkData bytes]),
                              [bookmarkData length]);
    NSURL* const url = [NSURL fileURLWithPath:stringOf(content.substr(std::strlen(mark)))];
    if (isThere(url))
        return url;
    setError(error, @"the target is missing");
    return nil;
}

- (BOOL)setResourceValue:(id)value forKey:(NSString*)key error:(NSError**)error {
    cocoa->hiddenPath = textOf([self path]);
    cocoa->hiddenKey = textOf(key);
    cocoa->hiddenValue = textOf([value description]);
    if (isThere(self))
        return YES;
    setError(error, @"the file is missing");
    return NO;
}

@end
