/// The native methods of the Java class `veltra_qorn.QORN_OoLibrary`: everything that the library
/// exports.
///
///     System.load("/opt/office/libQORNOpenOffice.jnilib");
///     QORN_OoLibrary.getLibraryVersion();                                          // 3
///     QORN_OoLibrary.initializeLibrary(home, desktop, documents, temp, work, 1);   // 0
///
/// Java may declare them `static` or not: the receiver is never read. No argument is tested, and a
/// null string is outside the contract.
///
/// A C++ exception passes through as it is: it neither becomes a Java exception nor a result. A
/// Java machine has no handler for it, so there it ends the process.
#ifndef QORN_QORNOPENOFFICELIBRARY_QORNOOLIBRARY_IF_H
#define QORN_QORNOPENOFFICELIBRARY_QORNOOLIBRARY_IF_H

#include <jni.h>

extern "C" {

/// Appends the five folders to the library's list and returns 0. Nothing tests whether a folder
/// exists, and an empty string keeps its place. A surrogate without its partner becomes "?".
/// Further calls append further five. The flag is a 32-bit integer, any value but 0 being true;
/// true and false do the same.
///
/// To be called on one thread at a time: once, on the thread that loads the library. Raises the
/// conversion failure, and then the platform strings of that call stay unreleased.
JNIEXPORT jint JNICALL Java_veltra_1qorn_QORN_1OoLibrary_initializeLibrary(
    JNIEnv* env, jobject receiver, jstring folder1, jstring folder2, jstring folder3,
    jstring folder4, jstring folder5, jint flag);

/// Always 3, before initializeLibrary too. On any thread, like the two below.
JNIEXPORT jint JNICALL Java_veltra_1qorn_QORN_1OoLibrary_getLibraryVersion(JNIEnv* env,
                                                                           jobject receiver);

/// @{
/// Do nothing and return 0, in any order and number.
JNIEXPORT jint JNICALL Java_veltra_1qorn_QORN_1OoLibrary_startSuppressingDialogs(JNIEnv* env,
                                                                                 jobject receiver);
JNIEXPORT jint JNICALL Java_veltra_1qorn_QORN_1OoLibrary_stopSuppressingDialogs(JNIEnv* env,
                                                                                jobject receiver);
/// @}
}

#endif
