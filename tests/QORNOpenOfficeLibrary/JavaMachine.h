/// A Java machine inside the test program.
///
///     CJavaMachine machine({"-Xcheck:jni"});
///     jclass const calls = machine.defineClass("StaticCalls");
///     machine.callInt(calls, "version", "()I");   // 3
#ifndef QORN_TESTS_QORNOPENOFFICELIBRARY_JAVAMACHINE_H
#define QORN_TESTS_QORNOPENOFFICELIBRARY_JAVAMACHINE_H

#include <jni.h>

#include <string>
#include <vector>

namespace BridgeTest {

/// Starts with the first and ends with the last line of its life. A process can have one machine
/// and, once that is gone, no other. Whatever raises a Java exception ends the program, so that
/// the results need no test.
class CJavaMachine {
  public:
    /// The options are those of the command `java`.
    explicit CJavaMachine(std::vector<std::string> const& options);
    ~CJavaMachine();
    CJavaMachine(CJavaMachine const&) = delete;
    CJavaMachine& operator=(CJavaMachine const&) = delete;

    JNIEnv* env() const { return env_; }

    /// Brings in a class of the folder QORN_TEST_CLASSES. Those that it uses come first. The
    /// machine itself would have to find the folder, which it can't in every locale.
    jclass defineClass(std::string const& name);

    void registerNatives(jclass type, std::vector<JNINativeMethod> const& methods);

    jstring makeString(std::u16string const& units);
    jobjectArray makeStrings(std::vector<std::u16string> const& texts);

    /// Calls a static method that returns an int.
    template <class... TArguments>
    jint callInt(jclass type, char const* name, char const* signature, TArguments... arguments) {
        jmethodID const method = env_->GetStaticMethodID(type, name, signature);
        expectNoException();
        jint const result = env_->CallStaticIntMethod(type, method, arguments...);
        expectNoException();
        return result;
    }

  private:
    void expectNoException();

    JavaVM* machine_ = nullptr;
    JNIEnv* env_ = nullptr;
};

} // namespace BridgeTest

#endif
