// Java's own checks of the use of JNI: they have nothing to say of the native methods.

#include "QORNOpenOfficeLibrary/JavaBridge.h"
#include "QORNOpenOfficeLibrary/OutputCapture.h"
#include "support/ObjectCount.h"

namespace {

using BridgeTest::edInstance;
using BridgeTest::edStatic;
using BridgeTest::TTexts;

using CQORNOoLibraryCheckJniTest = TestSupport::CObjectCountTest;

TEST_F(CQORNOoLibraryCheckJniTest, TheNativeMethodsDrawNoWarning) {
    BridgeTest::COutputCapture const output;
    {
        BridgeTest::CJavaBridge bridge({"-Xcheck:jni"});
        for (auto const declaration : {edStatic, edInstance}) {
            EXPECT_EQ(bridge.version(declaration), 3);
            EXPECT_EQ(bridge.start(declaration), 0);
            EXPECT_EQ(bridge.stop(declaration), 0);
            EXPECT_EQ(bridge.initialize({u"", u"/caf\u00E9", u"/\U0001F600", u"\xD83D", u"/tmp"}, 1,
                                        declaration),
                      0);
        }
        EXPECT_EQ(bridge.initializeOnSmallStack({}), 0);
        EXPECT_EQ(output.text(), "");

        // Proof that the checks are on and would be seen here: a result that nobody looked at.
        JNIEnv* const env = bridge.machine().env();
        jclass const type = env->FindClass("java/lang/Thread");
        jmethodID const method = env->GetStaticMethodID(type, "activeCount", "()I");
        env->CallStaticIntMethod(type, method);
        env->CallStaticIntMethod(type, method);
        env->ExceptionCheck();
    }
    EXPECT_NE(output.text().find("WARNING in native method"), std::string::npos) << output.text();
    EXPECT_EQ(BridgeTest::textsFrom(0),
              (TTexts{L"", L"/caf\u00E9", L"/\U0001F600", L"?", L"/tmp", //
                      L"", L"/caf\u00E9", L"/\U0001F600", L"?", L"/tmp", //
                      L"", L"", L"", L"", L""}));
}

} // namespace
