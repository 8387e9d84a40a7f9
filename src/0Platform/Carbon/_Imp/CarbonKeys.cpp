// The keys as the X server sees them. Its library is loaded where it is first needed: the system
// may have none.

#include <Carbon/Carbon.h>

#include <dlfcn.h>

#include <cstddef>
#include <cstring>

namespace {

// As the X library's headers declare them.
struct Display;
using KeySym = unsigned long;
constexpr std::size_t keyVectorSize = 32;

// The functions of Xlib(3) that are called. The library stays loaded: others may use it too.
struct XLibrary {
    XLibrary() noexcept {
        void* const library = dlopen("libX11.so.6", RTLD_LAZY | RTLD_LOCAL);
        if (library == nullptr)
            return;
        isThere = load(library, "XOpenDisplay", openDisplay) &&
                  load(library, "XCloseDisplay", closeDisplay) &&
                  load(library, "XQueryKeymap", queryKeymap) &&
                  load(library, "XkbKeycodeToKeysym", keycodeToKeysym);
    }

    template <class TFunction>
    static bool load(void* library, char const* name, TFunction& function) noexcept {
        function = reinterpret_cast<TFunction>(dlsym(library, name));
        return function != nullptr;
    }

    bool isThere = false;
    Display* (*openDisplay)(char const* name) = nullptr;
    int (*closeDisplay)(Display* display) = nullptr;
    int (*queryKeymap)(Display* display, char* keys) = nullptr;
    KeySym (*keycodeToKeysym)(Display* display, unsigned char code, unsigned group,
                              unsigned level) = nullptr;
};

// A modifier key's symbol (keysymdef.h) and its virtual key code on a Mac. The keys with the
// maker's sign are command, and one code stands for both; the key that reaches a keyboard's third
// level lies where the right option key does.
struct Modifier {
    KeySym symbol;
    unsigned keyCode;
};

constexpr Modifier modifiers[] = {
    {0xFFEB, 55}, // Super_L
    {0xFFEC, 55}, // Super_R
    {0xFFE7, 55}, // Meta_L
    {0xFFE8, 55}, // Meta_R
    {0xFFE1, 56}, // Shift_L
    {0xFFE5, 57}, // Caps_Lock
    {0xFFE6, 57}, // Shift_Lock
    {0xFFE9, 58}, // Alt_L
    {0xFFE3, 59}, // Control_L
    {0xFFE2, 60}, // Shift_R
    {0xFFEA, 61}, // Alt_R
    {0xFE03, 61}, // ISO_Level3_Shift
    {0xFF7E, 61}, // Mode_switch
    {0xFFE4, 62}, // Control_R
};

bool isSet(unsigned char const* bits, std::size_t number) {
    return (bits[number / 8] >> number % 8 & 1) != 0;
}

void press(unsigned char* keyMap, KeySym symbol) {
    for (Modifier const& modifier : modifiers) {
        if (modifier.symbol == symbol)
            keyMap[modifier.keyCode / 8] |= static_cast<unsigned char>(1U << modifier.keyCode % 8);
    }
}

// By the symbol that each key down has alone: several keys may have the same.
void readKeys(XLibrary const& library, Display* display, unsigned char* keyMap) {
    unsigned char down[keyVectorSize] = {};
    library.queryKeymap(display, reinterpret_cast<char*>(down));
    for (std::size_t code = 0; code < keyVectorSize * 8; ++code) {
        if (isSet(down, code))
            press(keyMap, library.keycodeToKeysym(display, static_cast<unsigned char>(code), 0, 0));
    }
}

} // namespace

extern "C" void GetKeys(KeyMap theKeys) {
    std::memset(theKeys, 0, sizeof(KeyMap));
    static XLibrary const library;
    Display* const display = library.isThere ? library.openDisplay(nullptr) : nullptr;
    if (display == nullptr)
        return;
    readKeys(library, display, reinterpret_cast<unsigned char*>(theKeys));
    library.closeDisplay(display);
}
