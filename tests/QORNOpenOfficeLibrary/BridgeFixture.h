/// What the tests of the native methods share: a recorded call with five folders.
#ifndef QORN_TESTS_QORNOPENOFFICELIBRARY_BRIDGEFIXTURE_H
#define QORN_TESTS_QORNOPENOFFICELIBRARY_BRIDGEFIXTURE_H

#include "QORNOpenOfficeLibrary/FakeJava.h"
#include "QORNOpenOfficeLibrary/Paths.h"
#include "QORNOpenOfficeLibrary/QORNOoLibrary_if.h"
#include "QORNOpenOfficeLibrary/Recorder.h"
#include "support/ObjectCount.h"

#include <cstdint>

namespace BridgeTest {

/// Begins with an empty record, and ends with as many platform strings as it began with.
class CBridgeTest : public TestSupport::CObjectCountTest {
  protected:
    using TStrings = std::array<jstring, 5>;

    void SetUp() override {
        CObjectCountTest::SetUp();
        beginAgain();
    }

    /// From here on strings count from 1 again, and nothing fails.
    void beginAgain() {
        recorder_.reset();
        java_.reset();
    }

    TStrings makeStrings(TFolders const& folders) {
        TStrings strings{};
        for (std::size_t index = 0; index < folders.size(); ++index)
            strings[index] = java_.makeString(folders[index]);
        return strings;
    }

    /// Calls the native method.
    jint initialize(TStrings const& strings, jint flag) {
        return Java_veltra_1qorn_QORN_1OoLibrary_initializeLibrary(
            &java_, receiver_, strings[0], strings[1], strings[2], strings[3], strings[4], flag);
    }

    /// Calls it with strings that are made for this call.
    jint initialize(TFolders const& folders, jint flag = 1) {
        return initialize(makeStrings(folders), flag);
    }

    /// The texts that this test has brought into the list.
    TTexts newPaths() const { return textsFrom(before_); }

    /// No object at all: the receiver is never read.
    jobject const receiver_ = reinterpret_cast<jobject>(std::uintptr_t{1});

    CRecorder& recorder_ = CRecorder::get();
    CFakeJava java_;

  private:
    std::size_t const before_ = getPaths().size();
};

} // namespace BridgeTest

#endif
