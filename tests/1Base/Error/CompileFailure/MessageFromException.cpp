// An exception becomes a message only where that is written down: were it silent, an exception
// without an output operator of its own would render through a message of itself, without end.

#include "1Base/Error/ErrorException.h"
#include "1Base/Error/ErrorMessage.h"

Error::CMessage messageOf(Error::CException const& exc) {
#ifdef QORN_WRONG_USE
    return exc;
#else
    return Error::CMessage(exc);
#endif
}
