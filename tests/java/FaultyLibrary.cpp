// A library with the right face and one fault inside, QORN_FAULT, which the tests of the real one
// must notice.

#include <jni.h>

#include <cstddef>
#include <thread>

namespace {

enum EFault { efResult, efCall, efMemory, efRace };

constexpr EFault fault = QORN_FAULT;

void callWhileAnExceptionIsPending(JNIEnv* env) {
    env->FindClass("there/is/no/such/Class");
    env->GetVersion();
    env->ExceptionClear();
}

char readBehindTheEnd() {
    std::size_t volatile const size = 4;
    char const* const bytes = new char[size]();
    char const read = bytes[size];
    delete[] bytes;
    return read;
}

int countInTwoThreads() {
    int count = 0;
    std::thread other([&count] { ++count; });
    ++count;
    other.join();
    return count;
}

} // namespace

extern "C" {

JNIEXPORT jint JNICALL Java_veltra_1qorn_QORN_1OoLibrary_initializeLibrary(JNIEnv*, jobject,
                                                                           jstring, jstring,
                                                                           jstring, jstring,
                                                                           jstring, jint) {
    return 0;
}

JNIEXPORT jint JNICALL Java_veltra_1qorn_QORN_1OoLibrary_getLibraryVersion(JNIEnv*, jobject) {
    return fault == efResult ? 4 : 3;
}

JNIEXPORT jint JNICALL Java_veltra_1qorn_QORN_1OoLibrary_startSuppressingDialogs(JNIEnv* env,
                                                                                 jobject) {
    switch (fault) {
    case efResult:
        return 0;
    case efCall:
        callWhileAnExceptionIsPending(env);
        return 0;
    case efMemory:
        return readBehindTheEnd();
    case efRace:
        return countInTwoThreads() - 2;
    }
}

JNIEXPORT jint JNICALL Java_veltra_1qorn_QORN_1OoLibrary_stopSuppressingDialogs(JNIEnv*, jobject) {
    return 0;
}
}
