// Native methods that do nothing: the least that a call from Java can cost.

#include <jni.h>

extern "C" {

JNIEXPORT jint JNICALL Java_EmptyNative_plain(JNIEnv*, jclass) {
    return 0;
}

JNIEXPORT jint JNICALL Java_EmptyNative_withFolders(JNIEnv*, jclass, jstring, jstring, jstring,
                                                    jstring, jstring, jint) {
    return 0;
}
}
