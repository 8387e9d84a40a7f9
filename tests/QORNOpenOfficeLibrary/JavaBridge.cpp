#include "QORNOpenOfficeLibrary/JavaBridge.h"

#include "QORNOpenOfficeLibrary/QORNOoLibrary_if.h"

namespace BridgeTest {
namespace {

JNINativeMethod makeMethod(char const* name, char const* signature, void* function) {
    return {const_cast<char*>(name), const_cast<char*>(signature), function};
}

// Java refuses a method that the class declares otherwise.
std::vector<JNINativeMethod> nativeMethods() {
    return {
        makeMethod("initializeLibrary",
                   "(Ljava/lang/String;Ljava/lang/String;Ljava/lang/String;Ljava/lang/String;"
                   "Ljava/lang/String;I)I",
                   reinterpret_cast<void*>(Java_veltra_1qorn_QORN_1OoLibrary_initializeLibrary)),
        makeMethod("getLibraryVersion", "()I",
                   reinterpret_cast<void*>(Java_veltra_1qorn_QORN_1OoLibrary_getLibraryVersion)),
        makeMethod(
            "startSuppressingDialogs", "()I",
            reinterpret_cast<void*>(Java_veltra_1qorn_QORN_1OoLibrary_startSuppressingDialogs)),
        makeMethod(
            "stopSuppressingDialogs", "()I",
            reinterpret_cast<void*>(Java_veltra_1qorn_QORN_1OoLibrary_stopSuppressingDialogs))};
}

} // namespace

CJavaBridge::CJavaBridge(std::vector<std::string> const& options)
    : machine_(options),
      library_(machine_.defineClass("veltra_qorn/QORN_OoLibrary")),
      staticCalls_(machine_.defineClass("StaticCalls")),
      instanceCalls_(machine_.defineClass("InstanceCalls")) {
    machine_.registerNatives(library_, nativeMethods());
    machine_.registerNatives(instanceCalls_, nativeMethods());
}

jint CJavaBridge::initialize(TFolders const& folders, jint flag, EDeclaration declaration) {
    return initialize(callsOf(declaration), "initialize", folders, flag);
}

jint CJavaBridge::initializeOnSmallStack(TFolders const& folders) {
    return initialize(staticCalls_, "initializeOnSmallStack", folders, 1);
}

jint CJavaBridge::version(EDeclaration declaration) {
    return machine_.callInt(callsOf(declaration), "version", "()I");
}

jint CJavaBridge::start(EDeclaration declaration) {
    return machine_.callInt(callsOf(declaration), "start", "()I");
}

jint CJavaBridge::stop(EDeclaration declaration) {
    return machine_.callInt(callsOf(declaration), "stop", "()I");
}

jint CJavaBridge::initialize(jclass type, char const* name, TFolders const& folders, jint flag) {
    // A thread that never returns to Java keeps its references until it gives them back itself.
    machine_.env()->PushLocalFrame(16);
    jobjectArray const strings = machine_.makeStrings({folders.begin(), folders.end()});
    jint const result = machine_.callInt(type, name, "([Ljava/lang/String;I)I", strings, flag);
    machine_.env()->PopLocalFrame(nullptr);
    return result;
}

jclass CJavaBridge::callsOf(EDeclaration declaration) const {
    return declaration == edStatic ? staticCalls_ : instanceCalls_;
}

} // namespace BridgeTest
