#include "QORNOpenOfficeLibrary/JavaMachine.h"

#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <iterator>

namespace BridgeTest {
namespace {

[[noreturn]] void fail(std::string const& message) {
    std::fprintf(stderr, "%s\n", message.c_str());
    std::abort();
}

std::vector<char> readFile(std::string const& name) {
    std::ifstream file(name, std::ios::binary);
    if (!file)
        fail("Cannot open " + name);
    return std::vector<char>(std::istreambuf_iterator<char>(file),
                             std::istreambuf_iterator<char>());
}

} // namespace

CJavaMachine::CJavaMachine(std::vector<std::string> const& options) {
    // Options from outside would be announced on the output, and could change what is tested.
    unsetenv("JAVA_TOOL_OPTIONS");
    unsetenv("_JAVA_OPTIONS");
    // What makes a short life quick.
    std::vector<std::string> texts = {"-XX:+UseSerialGC", "-XX:TieredStopAtLevel=1", "-Xmx256m"};
    texts.insert(texts.end(), options.begin(), options.end());
    std::vector<JavaVMOption> entries;
    for (std::string& text : texts)
        entries.push_back({text.data(), nullptr});

    JavaVMInitArgs arguments = {};
    arguments.version = JNI_VERSION_10;
    arguments.options = entries.data();
    arguments.nOptions = static_cast<jint>(entries.size());
    void* env = nullptr;
    if (JNI_CreateJavaVM(&machine_, &env, &arguments) != JNI_OK)
        fail("The Java machine does not start");
    env_ = static_cast<JNIEnv*>(env);
}

CJavaMachine::~CJavaMachine() {
    machine_->DestroyJavaVM();
}

jclass CJavaMachine::defineClass(std::string const& name) {
    std::vector<char> const bytes = readFile(QORN_TEST_CLASSES "/" + name + ".class");
    jclass const type =
        env_->DefineClass(name.c_str(), nullptr, reinterpret_cast<jbyte const*>(bytes.data()),
                          static_cast<jsize>(bytes.size()));
    expectNoException();
    return type;
}

void CJavaMachine::registerNatives(jclass type, std::vector<JNINativeMethod> const& methods) {
    env_->RegisterNatives(type, methods.data(), static_cast<jint>(methods.size()));
    expectNoException();
}

jstring CJavaMachine::makeString(std::u16string const& units) {
    jstring const string = env_->NewString(reinterpret_cast<jchar const*>(units.data()),
                                           static_cast<jsize>(units.size()));
    expectNoException();
    return string;
}

jobjectArray CJavaMachine::makeStrings(std::vector<std::u16string> const& texts) {
    jclass const type = env_->FindClass("java/lang/String");
    expectNoException();
    jobjectArray const strings =
        env_->NewObjectArray(static_cast<jsize>(texts.size()), type, nullptr);
    expectNoException();
    for (std::size_t index = 0; index < texts.size(); ++index) {
        env_->SetObjectArrayElement(strings, static_cast<jsize>(index), makeString(texts[index]));
        expectNoException();
    }
    return strings;
}

void CJavaMachine::expectNoException() {
    if (!env_->ExceptionCheck())
        return;
    env_->ExceptionDescribe();
    fail("Java raised an exception");
}

} // namespace BridgeTest
