#include "1Base/BaseMacOS/BaseMacOS.h"

#include <Carbon/Carbon.h>

namespace MacOS {
namespace {

// The modifiers' bits follow one another as their key codes do, from command at 55 on.
enum EModifier : unsigned short {
    emoCommand = 256,
    emoShift = 512,
    emoAlphaLock = 1024,
    emoOption = 2048,
    emoControl = 4096,
    emoRightShift = 8192,
    emoRightOption = 16384,
    emoRightControl = 32768
};

constexpr unsigned firstKeyCode = 55;
constexpr unsigned lastKeyCode = 62;

unsigned short getModifiers() {
    KeyMap keys;
    GetKeys(keys);
    auto const* const bytes = reinterpret_cast<unsigned char const*>(keys);
    unsigned modifiers = 0;
    for (unsigned code = firstKeyCode; code <= lastKeyCode; ++code)
        if ((bytes[code / 8] >> code % 8 & 1) != 0)
            modifiers |= unsigned{emoCommand} << (code - firstKeyCode);
    return static_cast<unsigned short>(modifiers);
}

bool isPressed(unsigned modifiers) {
    return (getModifiers() & modifiers) != 0;
}

} // namespace

bool isShiftPressed() {
    return isPressed(emoShift | emoRightShift);
}

bool isControlPressed() {
    return isPressed(emoControl | emoRightControl);
}

bool isOptionPressed() {
    return isPressed(emoOption | emoRightOption);
}

bool isCmdPressed() {
    return isPressed(emoCommand);
}

bool isAlphaLockPressed() {
    return isPressed(emoAlphaLock);
}

} // namespace MacOS
