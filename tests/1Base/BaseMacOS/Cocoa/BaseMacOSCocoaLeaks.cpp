// What the runtime of Objective-C makes once and keeps is no leak of the program's.

extern "C" __attribute__((visibility("default"))) char const* __lsan_default_suppressions();

extern "C" char const* __lsan_default_suppressions() {
    return "leak:libobjc\n";
}
