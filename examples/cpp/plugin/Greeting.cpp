// A plug-in: a shared library with one function, whose name is the agreement with its host.

#include <cstdio>

extern "C" __attribute__((visibility("default"))) void greet(char const* name, char* text,
                                                             unsigned long size) {
    std::snprintf(text, size, "Hello, %s!", name);
}
