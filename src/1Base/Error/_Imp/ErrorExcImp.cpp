#include "1Base/Error/ErrorExc.h"
#include "1Base/Error/ErrorExcChains.h"
#include "1Base/Error/ErrorParameter.h"
#include "1Base/Error/_Imp/ErrorExcRegistryImp.h"

#include <exception>
#include <new>
#include <typeinfo>

namespace Error {
namespace {

// The message of a wrapper. The inner text goes in unexpanded, and the inner parameters with it.
class CExcMsg : public CMessage {
  public:
    explicit CExcMsg(CException const& exc)
        : CMessage(msgQuotedMessage, Strings::CParameterList<wchar_t>()) {
        CMessage const& inner = exc.getInfo().getMessage();
        add("__msg__", inner.getString(false));
        add("__type__", typeid(exc).name());
        add(inner.begin(), inner.end());
    }
};

// A standard library exception that a guarded block met, with the block's last line as its origin.
// The block adds no entry to the trace for itself, and the exception is not kept.
template <class TExc>
class XStdLib : public virtual XExc<TExc> {
  public:
    XStdLib(std::exception const& e, char const* file, unsigned int, unsigned int lineEnd,
            char const* func, char const* date, char const* time)
        : XExc<TExc>(file, lineEnd, func, date, time, msgStdLibException,
                     inOrder(buildNamedParameter("CStdLibExceptionWhat", e.what()),
                             buildNamedParameter("CStdLibExceptionType", typeid(e).name()))) {}

    XStdLib(XStdLib const& other) : CException(other), XExc<TExc>(other) {}
};

} // namespace

CExcRegistry* CExcImplementation::accessRegistry() {
    return Detail::exceptionRegistry();
}

CMessage CExcImplementation::buildExceptionMessage(CException const& exc) {
    return CExcMsg(exc);
}

namespace Detail {

void addStackTrace_(char const* file, unsigned int lineBegin, unsigned int lineEnd,
                    char const* func, char const* date, char const* time) {
    try {
        throw;
    } catch (CExcImplementation& exc) {
        exc.getStackInfo().add(CStackInfo(file, lineBegin, lineEnd, func, date, time));
        throw;
    } catch (std::bad_alloc const& e) {
        throw XStdLib<TExcBadAllocException>(e, file, lineBegin, lineEnd, func, date, time);
    } catch (std::exception const& e) {
        throw XStdLib<TExcStdLibException>(e, file, lineBegin, lineEnd, func, date, time);
    }
}

} // namespace Detail
} // namespace Error
