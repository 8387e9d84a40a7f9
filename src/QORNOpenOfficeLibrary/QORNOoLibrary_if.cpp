// From Java strings to platform strings, and nothing more. There is no handler and no clean-up on
// purpose: an exception passes, and then the platform strings of that call stay unreleased.

#include "QORNOpenOfficeLibrary/QORNOoLibrary_if.h"
#include "QORNOpenOfficeLibrary/QORNOoLibrary.h"

#include <CoreFoundation/CoreFoundation.h>

namespace {

// The characters go back to Java before the next string is touched.
CFStringRef createString(JNIEnv* env, jstring text) {
    jchar const* const units = env->GetStringChars(text, nullptr);
    jsize const length = env->GetStringLength(text);
    CFStringRef const ref = CFStringCreateWithCharacters(kCFAllocatorDefault, units, length);
    env->ReleaseStringChars(text, units);
    return ref;
}

} // namespace

JNIEXPORT jint JNICALL Java_veltra_1qorn_QORN_1OoLibrary_initializeLibrary(
    JNIEnv* env, jobject, jstring folder1, jstring folder2, jstring folder3, jstring folder4,
    jstring folder5, jint flag) {
    CFStringRef const ref1 = createString(env, folder1);
    CFStringRef const ref2 = createString(env, folder2);
    CFStringRef const ref3 = createString(env, folder3);
    CFStringRef const ref4 = createString(env, folder4);
    CFStringRef const ref5 = createString(env, folder5);
    initializeLibraryImplMacOS(ref1, ref2, ref3, ref4, ref5, flag != 0);
    CFRelease(ref1);
    CFRelease(ref2);
    CFRelease(ref3);
    CFRelease(ref4);
    CFRelease(ref5);
    return 0;
}

JNIEXPORT jint JNICALL Java_veltra_1qorn_QORN_1OoLibrary_getLibraryVersion(JNIEnv*, jobject) {
    return 3;
}

JNIEXPORT jint JNICALL Java_veltra_1qorn_QORN_1OoLibrary_startSuppressingDialogs(JNIEnv*, jobject) {
    return startSuppressingDialogsImpl();
}

JNIEXPORT jint JNICALL Java_veltra_1qorn_QORN_1OoLibrary_stopSuppressingDialogs(JNIEnv*, jobject) {
    return 0;
}
