// Keys that are really pressed, on a display of the test's own.

#include <Carbon/Carbon.h>

#include "1Base/BaseMacOS/BaseMacOS.h"
#include "support/FileRoot.h"
#include "support/ServerProgram.h"

#include <dlfcn.h>
#include <gtest/gtest.h>

#include <cstdint>
#include <cstring>
#include <set>
#include <string>

namespace {

using TCodes = std::set<unsigned>;

TCodes keysDown() {
    KeyMap keys;
    std::memset(keys, 0xFF, sizeof keys);
    GetKeys(keys);
    auto const* const bytes = reinterpret_cast<unsigned char const*>(keys);
    TCodes codes;
    for (unsigned code = 0; code < 128; ++code)
        if ((bytes[code / 8] >> (code % 8) & 1) != 0)
            codes.insert(code);
    return codes;
}

// Presses keys through the X server's test extension, whose library is loaded here.
class CKeyboard {
  public:
    CKeyboard() {
        void* const x11 = dlopen("libX11.so.6", RTLD_NOW);
        void* const test = dlopen("libXtst.so.6", RTLD_NOW);
        if (x11 == nullptr || test == nullptr)
            return;
        closeDisplay_ = load<int(void*)>(x11, "XCloseDisplay");
        sync_ = load<int(void*, int)>(x11, "XSync");
        codeOf_ = load<unsigned char(void*, unsigned long)>(x11, "XKeysymToKeycode");
        fakeKey_ = load<int(void*, unsigned, int, unsigned long)>(test, "XTestFakeKeyEvent");
        display_ = load<void*(char const*)>(x11, "XOpenDisplay")(nullptr);
    }
    ~CKeyboard() {
        if (isThere())
            closeDisplay_(display_);
    }

    CKeyboard(CKeyboard const&) = delete;
    CKeyboard& operator=(CKeyboard const&) = delete;

    bool isThere() const { return display_ != nullptr; }

    void press(unsigned long symbol) { move(symbol, true); }
    void release(unsigned long symbol) { move(symbol, false); }

  private:
    template <class TFunction>
    static TFunction* load(void* library, char const* name) {
        return reinterpret_cast<TFunction*>(dlsym(library, name));
    }

    void move(unsigned long symbol, bool down) {
        unsigned char const code = codeOf_(display_, symbol);
        ASSERT_NE(code, 0) << "no key has the symbol " << symbol;
        ASSERT_NE(fakeKey_(display_, code, down ? 1 : 0, 0), 0);
        sync_(display_, 0);
    }

    void* display_ = nullptr;
    int (*closeDisplay_)(void*) = nullptr;
    int (*sync_)(void*, int) = nullptr;
    unsigned char (*codeOf_)(void*, unsigned long) = nullptr;
    int (*fakeKey_)(void*, unsigned, int, unsigned long) = nullptr;
};

// The symbols of keysymdef.h.
constexpr unsigned long shiftLeft = 0xFFE1;
constexpr unsigned long shiftRight = 0xFFE2;
constexpr unsigned long controlLeft = 0xFFE3;
constexpr unsigned long controlRight = 0xFFE4;
constexpr unsigned long capsLock = 0xFFE5;
constexpr unsigned long altLeft = 0xFFE9;
constexpr unsigned long altRight = 0xFFEA;
constexpr unsigned long superLeft = 0xFFEB;
constexpr unsigned long superRight = 0xFFEC;
constexpr unsigned long level3Shift = 0xFE03;

class CCarbonKeysTest : public testing::Test {
  protected:
    // A resetting server would lose the layout with its last client.
    CCarbonKeysTest()
        : server_({"Xvfb", "-displayfd", "{}", "-nolisten", "tcp", "-noreset", "-screen", "0",
                   "64x64x24"}) {
        environment_.set("DISPLAY", ":" + server_.line());
        environment_.unset("XAUTHORITY");
    }

    TestSupport::CServerProgram server_;
    TestSupport::CEnvironment environment_;
};

#define SKIP_WITHOUT_KEYBOARD(keyboard)                                                            \
    if (!server_.isRunning())                                                                      \
        GTEST_SKIP() << server_.reason();                                                          \
    if (!(keyboard).isThere())                                                                     \
    GTEST_SKIP() << "libXtst can't be loaded, or the display not be opened"

TEST_F(CCarbonKeysTest, EachModifierKeyHasItsCode) {
    CKeyboard keyboard;
    SKIP_WITHOUT_KEYBOARD(keyboard);
    struct CRow {
        unsigned long symbol;
        unsigned code;
    };
    EXPECT_EQ(keysDown(), TCodes());
    for (CRow const& row : {CRow{superLeft, 55}, CRow{superRight, 55}, CRow{shiftLeft, 56},
                            CRow{capsLock, 57}, CRow{altLeft, 58}, CRow{controlLeft, 59},
                            CRow{shiftRight, 60}, CRow{altRight, 61}, CRow{controlRight, 62}}) {
        keyboard.press(row.symbol);
        EXPECT_EQ(keysDown(), TCodes{row.code}) << row.symbol;
        keyboard.release(row.symbol);
        EXPECT_EQ(keysDown(), TCodes()) << row.symbol;
    }
}

TEST_F(CCarbonKeysTest, TheKeyOfTheThirdLevelIsTheRightOptionKey) {
    CKeyboard keyboard;
    SKIP_WITHOUT_KEYBOARD(keyboard);
    keyboard.press(level3Shift);
    EXPECT_EQ(keysDown(), TCodes{61});
}

TEST_F(CCarbonKeysTest, SeveralKeysAreSeenTogether) {
    CKeyboard keyboard;
    SKIP_WITHOUT_KEYBOARD(keyboard);
    for (unsigned long const symbol : {shiftLeft, shiftRight, controlLeft, altLeft, superLeft})
        keyboard.press(symbol);
    EXPECT_EQ(keysDown(), (TCodes{55, 56, 58, 59, 60}));
    keyboard.release(shiftLeft);
    EXPECT_EQ(keysDown(), (TCodes{55, 58, 59, 60}));
}

TEST_F(CCarbonKeysTest, OtherKeysAreNoModifiers) {
    CKeyboard keyboard;
    SKIP_WITHOUT_KEYBOARD(keyboard);
    keyboard.press('a');
    keyboard.press('1');
    EXPECT_EQ(keysDown(), TCodes());
    keyboard.press(shiftLeft);
    EXPECT_EQ(keysDown(), TCodes{56});
}

TEST_F(CCarbonKeysTest, ModifiersAreReadFromTheDisplay) {
    CKeyboard keyboard;
    SKIP_WITHOUT_KEYBOARD(keyboard);
    EXPECT_FALSE(MacOS::isShiftPressed());
    keyboard.press(shiftRight);
    EXPECT_TRUE(MacOS::isShiftPressed());
    keyboard.press(controlLeft);
    EXPECT_TRUE(MacOS::isControlPressed());
    EXPECT_FALSE(MacOS::isOptionPressed());
    keyboard.press(altLeft);
    EXPECT_TRUE(MacOS::isOptionPressed());
    EXPECT_FALSE(MacOS::isCmdPressed());
    keyboard.press(superRight);
    EXPECT_TRUE(MacOS::isCmdPressed());
    EXPECT_FALSE(MacOS::isAlphaLockPressed());
    keyboard.press(capsLock);
    EXPECT_TRUE(MacOS::isAlphaLockPressed());
    keyboard.release(shiftRight);
    EXPECT_FALSE(MacOS::isShiftPressed());
}

TEST_F(CCarbonKeysTest, WithoutADisplayNothingIsPressed) {
    environment_.unset("DISPLAY");
    EXPECT_EQ(keysDown(), TCodes());
    environment_.set("DISPLAY", "");
    EXPECT_EQ(keysDown(), TCodes());
    environment_.set("DISPLAY", ":98765");
    EXPECT_EQ(keysDown(), TCodes());
    environment_.set("DISPLAY", "no display");
    EXPECT_EQ(keysDown(), TCodes());
}

} // namespace
