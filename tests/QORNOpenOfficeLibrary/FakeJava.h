/// A Java machine as far as the bridge may see it: a function table with three entries that work.
///
///     CFakeJava java;
///     Java_veltra_1qorn_QORN_1OoLibrary_getLibraryVersion(&java, nullptr);   // 3
#ifndef QORN_TESTS_QORNOPENOFFICELIBRARY_FAKEJAVA_H
#define QORN_TESTS_QORNOPENOFFICELIBRARY_FAKEJAVA_H

#include <jni.h>

#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace BridgeTest {

/// A JNIEnv whose GetStringChars, GetStringLength and ReleaseStringChars record themselves with the
/// string's number. Any other function of the table ends the program and says which it was.
class CFakeJava : public JNIEnv_ {
  public:
    CFakeJava();
    ~CFakeJava();
    CFakeJava(CFakeJava const&) = delete;
    CFakeJava& operator=(CFakeJava const&) = delete;

    /// Forgets all strings, the units given and the length set. None may have its units out.
    void reset();

    /// A string of this machine; the first has the number 1.
    jstring makeString(std::u16string const& units);

    /// The units that GetStringChars gave out, in the order of the calls. They are gone when given
    /// back: the pointers are for comparison only.
    std::vector<jchar const*> const& unitsGiven() const { return unitsGiven_; }

    /// Makes GetStringLength answer this instead.
    void setLength(jsize length) { length_ = length; }

  private:
    struct CText;

    static jchar const* JNICALL getStringChars(JNIEnv* env, jstring string, jboolean* isCopy);
    static jsize JNICALL getStringLength(JNIEnv* env, jstring string);
    static void JNICALL releaseStringChars(JNIEnv* env, jstring string, jchar const* units);

    JNINativeInterface_ table_;
    std::vector<std::unique_ptr<CText>> strings_;
    std::vector<jchar const*> unitsGiven_;
    std::optional<jsize> length_;
};

} // namespace BridgeTest

#endif
