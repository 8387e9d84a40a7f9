#include "1Base/Error/ErrorAssert.h"

#include "1Base/Error/ErrorExcChains.h"
#include "1Base/Error/ErrorLogging.h"

namespace Error {
namespace {

class CAssertionMsg : public CMessage {
  public:
    CAssertionMsg(char const* file, unsigned int line, char const* func, char const* date,
                  char const* time, char const* expr)
        : CMessage(msgAssertionFailed, Strings::CParameterList<wchar_t>()) {
        add("expr", expr);
        add("line", line);
        add("file", file);
        add("func", func);
        add("date", date);
        add("time", time);
    }
};

void doThrowAssertionFailedExc(char const* file, unsigned int line, char const* func,
                               char const* date, char const* time, bool doThrow, char const* expr,
                               Strings::CParameterList<wchar_t> const& params) {
    CAssertionMsg const message(file, line, func, date, time, expr);
    TLoggerErrorAssert::log<TTgtLogger, TSevFatal>(file, line, func, date, time,
                                                   message.getString(true).c_str(), params);
    if (!doThrow)
        return;
    invokeDebugger();
    // The report has filled the message's placeholders already: a detailed rendering lists them.
    throw XExc<TExcErrorAssert>(file, line, func, date, time, message, params);
}

} // namespace

namespace Detail {

void throwAssertionFailedExc_(char const* file, unsigned int line, char const* func,
                              char const* date, char const* time, bool doThrow, char const* expr,
                              CAssertDummy) {
    doThrowAssertionFailedExc(file, line, func, date, time, doThrow, expr,
                              Strings::CParameterList<wchar_t>());
}

void throwAssertionFailedExc_(char const* file, unsigned int line, char const* func,
                              char const* date, char const* time, bool doThrow, char const* expr,
                              Strings::CParameterList<wchar_t> const& params) {
    doThrowAssertionFailedExc(file, line, func, date, time, doThrow, expr, params);
}

} // namespace Detail
} // namespace Error
