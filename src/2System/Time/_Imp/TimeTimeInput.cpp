#include "2System/Time/TimeExc.h"
#include "2System/Time/TimeTime.h"
#include "2System/Time/_Imp/TimeFailures.h"
#include "2System/Time/_Imp/TimeInput.h"

#include <istream>

namespace Time {
namespace {

using Detail::checkInputStream;
using Detail::extract;

// The grave accent (0x60) is accepted on purpose.
template <class TCh>
bool checkDelimTime(TCh c) {
    return c == TCh(':') || c == TCh('`');
}

template <class TIStream>
CTime timeFromStream(TIStream& is) {
    using TCh = typename TIStream::char_type;
    char const* const name = "is";
    char const* const expected = "':' expected";
    checkInputStream(is, name, Error::COrigin(ERROR_ORIGIN));
    int hour = 0;
    int minute = 0;
    int second = 0;
    int milliSecond = 0;

    extract(is, hour);
    checkInputStream(is, name, Error::COrigin(ERROR_ORIGIN));
    TCh delimiter = 0;
    extract(is, delimiter);
    checkInputStream(is, name, Error::COrigin(ERROR_ORIGIN));
    if (!checkDelimTime(delimiter))
        ERROR_THROW(TExcTimeDateTime, Detail::wrongArgument("delimiter", delimiter, expected));
    extract(is, minute);
    checkInputStream(is, name, Error::COrigin(ERROR_ORIGIN));
    if (!is.eof()) {
        TCh next = 0;
        extract(is, next);
        checkInputStream(is, name, Error::COrigin(ERROR_ORIGIN));
        if (!checkDelimTime(next) || next != delimiter)
            ERROR_THROW(TExcTimeDateTime, Detail::wrongArgument("delimiter", next, expected));
        extract(is, second);
        checkInputStream(is, name, Error::COrigin(ERROR_ORIGIN));
    }
    if (!is.eof()) {
        TCh next = 0;
        extract(is, next); // any other character is lost
        checkInputStream(is, name, Error::COrigin(ERROR_ORIGIN));
        if (checkDelimTime(next))
            extract(is, milliSecond);
    }
    checkInputStream(is, name, Error::COrigin(ERROR_ORIGIN));
    return CTime(hour, minute, second, milliSecond);
}

} // namespace

CTime CTime::readTime(std::istream& stream) {
    return timeFromStream(stream);
}

CTime CTime::readTime(std::wistream& stream) {
    return timeFromStream(stream);
}

} // namespace Time
