// A date of one of the UN/CEFACT formats.
//
// The first byte is the code, the others are the text, a byte a character. What must hold: the text
// is a date without milliseconds, or it raises one of the two failures; one more character behind a
// date changes nothing.

#include "1Base/Error/Error.h"
#include "1Base/StdUtil/StdUtilExc.h"
#include "2System/Time/TimeExc.h"
#include "2System/Time/TimeReadOutcome.h"

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <optional>
#include <string>

namespace {

using Time::CDateTime;

std::optional<CDateTime> read(std::wstring const& text, int code) {
    try {
        return CDateTime::readDateTimeFromCEFACTFormatCode(text, code);
    } catch (Time::TExcTimeDateTime const&) {
        return std::nullopt;
    } catch (StdUtil::TExcStreamCast const&) {
        return std::nullopt;
    }
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size);

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size) {
    if (size == 0)
        return 0;
    int const code = data[0];
    std::wstring const text(data + 1, data + size);
    std::optional<CDateTime> const value = read(text, code);
    if (!value)
        return 0;
    std::optional<CDateTime> const longer = read(text + L'7', code);
    if (value->getMilliSecond() != 0 || !longer ||
        TimeTest::fieldsOf(*longer) != TimeTest::fieldsOf(*value))
        std::abort();
    if (!Time::CDate::isValid(value->getDay(), value->getMonth(), value->getYear()))
        std::abort();
    return 0;
}
