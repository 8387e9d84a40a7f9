// A shared library that says which one it is, and tells the program when it comes and goes. The
// build makes several of it; QORN_LIBRARY is the name of each.

#define TEXT_OF(name) #name
#define TEXT(name) TEXT_OF(name)
#define JOINED_OF(left, right) left##right
#define JOINED(left, right) JOINED_OF(left, right)
#define EXPORTED extern "C" __attribute__((visibility("default")))

extern "C" __attribute__((weak)) void qornModuleEvent(char const* event);

#ifdef QORN_DEPENDENCY
extern "C" int onlyInDependency();
#endif

namespace {

void tell(char const* event) {
    if (qornModuleEvent != nullptr)
        qornModuleEvent(event);
}

struct CPresence {
    CPresence() { tell("+" TEXT(QORN_LIBRARY)); }
    ~CPresence() { tell("-" TEXT(QORN_LIBRARY)); }
} const presence;

} // namespace

EXPORTED char const* libraryName() {
    return TEXT(QORN_LIBRARY);
}

EXPORTED int libraryNumber;
int libraryNumber = 42;

EXPORTED int JOINED(onlyIn, QORN_LIBRARY)() {
#ifdef QORN_DEPENDENCY
    return onlyInDependency();
#else
    return 1;
#endif
}

EXPORTED int named() __asm__("gr\xC3\xBC\xC3\x9F"
                             "en");
int named() {
    return 7;
}

// Defined nowhere: only binding at the first use lets the library load.
extern "C" void qornDefinedNowhere();

EXPORTED void callsNowhere() {
    qornDefinedNowhere();
}
