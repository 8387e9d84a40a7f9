/// Foundation on systems where GNUstep supplies it: what GNUstep lacks of the calls that are made,
/// and the platform layer's types, which on macOS come with Foundation.
#ifndef QORN_TESTS_APPLEHEADERS_FOUNDATION_H
#define QORN_TESTS_APPLEHEADERS_FOUNDATION_H

// For #include_next.
#pragma GCC system_header

#include_next <Foundation/Foundation.h>

#include <CoreFoundation/CoreFoundation.h>

typedef NSUInteger NSURLBookmarkCreationOptions;
enum : NSURLBookmarkCreationOptions { NSURLBookmarkCreationSuitableForBookmarkFile = 1UL << 10 };

typedef NSUInteger NSURLBookmarkFileCreationOptions;

@interface NSURL (QORNMissing)

- (NSData*)bookmarkDataWithOptions:(NSURLBookmarkCreationOptions)options
    includingResourceValuesForKeys:(NSArray*)keys
                     relativeToURL:(NSURL*)relativeURL
                             error:(NSError**)error;

+ (NSURL*)URLByResolvingBookmarkData:(NSData*)bookmarkData
                             options:(NSURLBookmarkResolutionOptions)options
                       relativeToURL:(NSURL*)relativeURL
                 bookmarkDataIsStale:(BOOL*)isStale
                               error:(NSError**)error;

+ (BOOL)writeBookmarkData:(NSData*)bookmarkData
                    toURL:(NSURL*)bookmarkFileURL
                  options:(NSURLBookmarkFileCreationOptions)options
                    error:(NSError**)error;

+ (NSData*)bookmarkDataWithContentsOfURL:(NSURL*)bookmarkFileURL error:(NSError**)error;

- (BOOL)setResourceValue:(id)value forKey:(NSString*)key error:(NSError**)error;

@end

extern "C" CFStringRef CFURLCopyFileSystemPath(CFURLRef anURL, CFURLPathStyle pathStyle);

#endif
