/// The native methods of this program, called by Java methods in a real Java machine.
#ifndef QORN_TESTS_QORNOPENOFFICELIBRARY_JAVABRIDGE_H
#define QORN_TESTS_QORNOPENOFFICELIBRARY_JAVABRIDGE_H

#include "QORNOpenOfficeLibrary/JavaMachine.h"
#include "QORNOpenOfficeLibrary/Paths.h"

namespace BridgeTest {

/// How Java declares the native methods.
enum EDeclaration {
    edStatic,  ///< in the class veltra_qorn.QORN_OoLibrary
    edInstance ///< in a class of the tests
};

class CJavaBridge {
  public:
    explicit CJavaBridge(std::vector<std::string> const& options = {});

    CJavaMachine& machine() { return machine_; }

    jint initialize(TFolders const& folders, jint flag = 1, EDeclaration declaration = edStatic);

    /// The same on a Java thread with a stack of 256 KiB.
    jint initializeOnSmallStack(TFolders const& folders);

    jint version(EDeclaration declaration = edStatic);
    jint start(EDeclaration declaration = edStatic);
    jint stop(EDeclaration declaration = edStatic);

  private:
    jint initialize(jclass type, char const* name, TFolders const& folders, jint flag);
    jclass callsOf(EDeclaration declaration) const;

    CJavaMachine machine_;
    jclass const library_;
    jclass const staticCalls_;
    jclass const instanceCalls_;
};

} // namespace BridgeTest

#endif
