// Loads a plug-in by the bundle that it comes in and by its library file, and shows what is said of
// a symbol and of a library that are not there. The build lays the bundle out in EXAMPLE_BUNDLE:
//
//     Greeting.bundle/Contents/Info.plist
//     Greeting.bundle/Contents/Linux/Greeting   (on macOS: MacOS)
//
// Prints:
//     bundle: Hello, Ada!
//     file:   Hello, Ada!
//     symbol farewell was not found
//     dynamic link library /nowhere/plugin.so  was not found

#include "1Base/Error/Error.h"
#include "2System/Modules/Modules.h"

#include <iostream>
#include <string>

namespace {

std::string greet(Modules::CDyLib const& plugin, char const* name) {
    using TGreet = void (*)(char const* name, char* text, unsigned long size);
    // A symbol is good as long as its library lives.
    auto const function = reinterpret_cast<TGreet>(plugin.getSymbol(L"greet"));
    char text[32];
    function(name, text, sizeof(text));
    return text;
}

} // namespace

int main() {
    // The flags have no effect.
    Modules::CDyLib const plugin(std::string(EXAMPLE_BUNDLE), 0);
    std::cout << "bundle: " << greet(plugin, "Ada") << '\n';
    std::cout << "file:   " << greet(Modules::CDyLib(std::string(EXAMPLE_LIBRARY), 0), "Ada")
              << '\n';

    try {
        plugin.getSymbol(L"farewell");
    } catch (Modules::TExcSymbolNotFound const& exc) {
        std::cout << exc.getInfo().getMessage() << '\n';
    }
    try {
        Modules::CDyLib const missing(L"/nowhere/plugin.so", 0);
    } catch (Modules::TExcDyLib const& exc) { // one level above: anything about libraries
        std::cout << exc.getInfo().getMessage() << '\n';
    }
}
