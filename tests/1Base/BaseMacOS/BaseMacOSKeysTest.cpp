// The modifier keys, read from key maps that the test makes up.

#include "1Base/BaseMacOS/BaseMacOS.h"

#include <Carbon/Carbon.h>

#include <gtest/gtest.h>

#include <cstring>
#include <set>
#include <string>
#include <vector>

namespace {

std::vector<unsigned char> keyMap(16, 0);

// The key map with these key codes down.
void press(std::set<unsigned> const& codes) {
    keyMap.assign(16, 0);
    for (unsigned const code : codes)
        keyMap[code / 8] |= static_cast<unsigned char>(1U << (code % 8));
}

// What is pressed, by a letter each: command, shift, alpha lock, option, control.
std::string pressed() {
    std::string letters;
    if (MacOS::isCmdPressed())
        letters += 'm';
    if (MacOS::isShiftPressed())
        letters += 's';
    if (MacOS::isAlphaLockPressed())
        letters += 'a';
    if (MacOS::isOptionPressed())
        letters += 'o';
    if (MacOS::isControlPressed())
        letters += 'c';
    return letters;
}

std::string pressedWith(std::set<unsigned> const& codes) {
    press(codes);
    return pressed();
}

TEST(CBaseMacOSKeysTest, EachKeyCodeIsItsModifier) {
    std::vector<std::string> const expected = {"m", "s", "a", "o", "c", "s", "o", "c"};
    for (unsigned code = 0; code < 128; ++code)
        EXPECT_EQ(pressedWith({code}), code >= 55 && code <= 62 ? expected[code - 55] : "") << code;
}

TEST(CBaseMacOSKeysTest, KeysAreReadByTheirBytes) {
    keyMap.assign(16, 0);
    keyMap[6] = 0x80;
    EXPECT_EQ(pressed(), "m");
    keyMap[6] = 0;
    keyMap[7] = 0x42;
    EXPECT_EQ(pressed(), "ac");
}

TEST(CBaseMacOSKeysTest, EitherSidesKeyCounts) {
    EXPECT_EQ(pressedWith({56, 60}), "s");
    EXPECT_EQ(pressedWith({58, 62}), "oc");
    EXPECT_EQ(pressedWith({59, 61}), "oc");
}

TEST(CBaseMacOSKeysTest, KeysAreReadTogetherAndApart) {
    EXPECT_EQ(pressedWith({}), "");
    EXPECT_EQ(pressedWith({55, 56, 57, 58, 59, 60, 61, 62}), "msaoc");
    EXPECT_EQ(pressedWith({54, 63, 47, 71}), "");
    std::set<unsigned> others;
    for (unsigned code = 0; code < 128; ++code)
        if (code < 55 || code > 62)
            others.insert(code);
    EXPECT_EQ(pressedWith(others), "");
}

TEST(CBaseMacOSKeysTest, KeysAreReadAtEachCall) {
    press({57});
    EXPECT_TRUE(MacOS::isAlphaLockPressed());
    press({});
    EXPECT_FALSE(MacOS::isAlphaLockPressed());
}

} // namespace

extern "C" void __wrap_GetKeys(KeyMap theKeys) {
    std::memcpy(theKeys, keyMap.data(), sizeof(KeyMap));
}
