// Read by the sanitizers' runtimes at start, however the program is started. A program may define
// further options of its own, which then win. Where the runtime is a shared library it finds only
// what is visible.

#ifndef QORN_TEST_ASAN_OPTIONS
#    define QORN_TEST_ASAN_OPTIONS ""
#endif

extern "C" {
__attribute__((visibility("default"))) char const* __asan_default_options();
__attribute__((visibility("default"))) char const* __ubsan_default_options();
}

extern "C" char const* __asan_default_options() {
    return "detect_stack_use_after_return=1:strict_string_checks=1:" QORN_TEST_ASAN_OPTIONS;
}

extern "C" char const* __ubsan_default_options() {
    return "print_stacktrace=1:halt_on_error=1";
}
