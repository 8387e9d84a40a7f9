// What GNUstep and its runtime make once and keep is no leak of the program's. What calls leave
// behind is counted by a test.

extern "C" __attribute__((visibility("default"))) char const* __lsan_default_suppressions();

extern "C" char const* __lsan_default_suppressions() {
    return "leak:libobjc\nleak:libgnustep-base\n";
}
