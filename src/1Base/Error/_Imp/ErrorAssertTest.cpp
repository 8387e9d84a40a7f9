#include "1Base/Error/ErrorAssert.h"

#include "1Base/Error/ErrorMacros.h"

namespace Error {
namespace Test {
namespace {

template <bool doThrow, bool doReport, class TParams>
void assertValue(bool value, char const* expr, TParams const& params) {
    Detail::CAsserter_<doThrow, doReport>::do_assert(ERROR_ORIGIN, value, expr, params);
}

template <bool doThrow, bool doReport>
void assertInAllForms(bool value, char const* expr) {
    auto const param = Strings::buildNamedParameter("name", "value");
    assertValue<doThrow, doReport>(value, expr, Detail::CAssertDummy());
    assertValue<doThrow, doReport>(value, expr, param);
    assertValue<doThrow, doReport>(value, expr, Strings::CParameterList<wchar_t>(param));
}

template <bool doThrow, bool doReport>
void assertBothValues() {
    assertInAllForms<doThrow, doReport>(false, "false");
    assertInAllForms<doThrow, doReport>(true, "true");
}

} // namespace

void testAssertions() {
    assertBothValues<false, false>();
    assertBothValues<false, true>();
    assertBothValues<true, false>();
    assertBothValues<true, true>();
}

} // namespace Test
} // namespace Error
