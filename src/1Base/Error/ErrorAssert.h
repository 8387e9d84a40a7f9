/// Assertions that stay on in every build.
///
///     std::string const& text = *ERROR_ASSERT(find(key));   // hands the tested value back
///
/// A failed one is reported at SevFatal and raised as an exception of the chain ErrorAssert, whose
/// severity is SevError like every exception's.
#ifndef QORN_1BASE_ERRORASSERT_H
#define QORN_1BASE_ERRORASSERT_H

#include "1Base/Strings/StringsParameter.h"
#include "1Base/Strings/StringsParameterList.h"

namespace Error {

/// Runs just before an assertion raises: a place for a breakpoint.
void invokeDebugger();

namespace Detail {

/// Stands for the absence of further parameters.
struct CAssertDummy {};

/// Reports the failed assertion; raises it where `doThrow` is true.
void throwAssertionFailedExc_(char const* file, unsigned int line, char const* func,
                              char const* date, char const* time, bool doThrow, char const* expr,
                              CAssertDummy);
void throwAssertionFailedExc_(char const* file, unsigned int line, char const* func,
                              char const* date, char const* time, bool doThrow, char const* expr,
                              Strings::CParameterList<wchar_t> const& params);

template <class T>
void throwAssertionFailedExc_(char const* file, unsigned int line, char const* func,
                              char const* date, char const* time, bool doThrow, char const* expr,
                              Strings::CStaticNamedParameter<T> const& param) {
    throwAssertionFailedExc_(file, line, func, date, time, doThrow, expr,
                             Strings::CParameterList<wchar_t>(param));
}

/// What a failure does, by two flags: nothing for <false, false>, a report for <false, true>, a
/// report and the exception where the first is true.
template <bool doThrow, bool doReport>
class CAsserter_ {
  public:
    /// Returns `value`, a bool or a pointer. Where it tests true nothing is built. TParams is
    /// CAssertDummy, one named parameter, or a parameter list; `expr` the tested expression's text.
    template <class TValue, class TParams>
    static TValue do_assert(char const* file, unsigned int line, char const* func, char const* date,
                            char const* time, TValue value, char const* expr,
                            TParams const& params) {
        if (!value)
            throwAssertionFailedExc_(file, line, func, date, time, doThrow, expr, params);
        return value;
    }
};

template <>
class CAsserter_<false, false> {
  public:
    template <class TValue, class TParams>
    static TValue do_assert(char const*, unsigned int, char const*, char const*, char const*,
                            TValue value, char const*, TParams const&) {
        return value;
    }
};

} // namespace Detail

namespace Test {

/// Walks the four forms with every form of parameters, first with a failing and then with a passing
/// value, and catches nothing: the first failure that raises ends it with its exception.
void testAssertions();

} // namespace Test
} // namespace Error

#endif
