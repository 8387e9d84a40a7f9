// Alone in its file, so that the call is a real one in every build and a breakpoint is met.

#include "1Base/Error/ErrorAssert.h"

namespace Error {

void invokeDebugger() {}

} // namespace Error
