#include "1Base/Encoding/EncodingConverter.h"
#include "1Base/Streams/StreamsString.h"
#include "2System/Time/TimeDate.h"
#include "2System/Time/TimeExc.h"
#include "2System/Time/_Imp/TimeFailures.h"
#include "2System/Time/_Imp/TimeInput.h"
#include "2System/Time/_Imp/TimeNames.h"

#include <istream>
#include <string>
#include <utility>

namespace Time {
namespace {

using Detail::checkInputStream;
using Detail::extract;

template <class TCh>
bool checkDelimDate(TCh c) {
    return c == TCh('-') || c == TCh('.') || c == TCh('/');
}

// Puts the fields into the order day, month, year.
template <class TCh>
void convertEnglishDate(TCh delimiter, int& first, int& second, int& third) {
    if (delimiter == TCh('-'))
        std::swap(first, third);
    else if (delimiter == TCh('/'))
        std::swap(first, second);
}

// Takes words of one repeated letter only: "JJJ" is 1, "Jan" is refused, and so is "DDD". Of the
// months with one initial the first is meant.
template <class TString>
int convertMonthNameToNumber(TString const& name) {
    using TCh = typename TString::value_type;
    if (name.size() >= 3 && name[1] == name[0] && name[2] == name[0])
        for (int i = 0; i <= 10; ++i)
            if (name[0] == static_cast<TCh>(Detail::shortMonthName[i][0]))
                return i + 1;
    ERROR_THROW(
        TExcTimeDateTime,
        Detail::wrongArgument("month", Encoding::convert<std::string>(name), "Invalid month name"));
}

template <class TIStream>
CDate dateFromStream(TIStream& is) {
    using TCh = typename TIStream::char_type;
    char const* const name = "is";
    char const* const expected = "'.' expected";
    checkInputStream(is, name, Error::COrigin(ERROR_ORIGIN));
    int first = 0;
    int second = 0;
    int third = 0;
    std::basic_string<TCh> word;

    extract(is, first);
    checkInputStream(is, name, Error::COrigin(ERROR_ORIGIN));
    TCh delimiter = 0;
    extract(is, delimiter);
    checkInputStream(is, name, Error::COrigin(ERROR_ORIGIN));
    if (!checkDelimDate(delimiter))
        ERROR_THROW(TExcTimeDateTime, Detail::wrongArgument("delimiter", delimiter, expected));
    extract(is, second);
    if (is.fail()) {
        is.clear();
        extract(is, word);
        checkInputStream(is, name, Error::COrigin(ERROR_ORIGIN));
        second = convertMonthNameToNumber(word);
    }
    if (word.empty()) { // a word has no delimiter behind it
        TCh next = 0;
        extract(is, next);
        checkInputStream(is, name, Error::COrigin(ERROR_ORIGIN));
        if (!checkDelimDate(next) || next != delimiter)
            ERROR_THROW(TExcTimeDateTime, Detail::wrongArgument("delimiter", next, expected));
    }
    extract(is, third);
    checkInputStream(is, name, Error::COrigin(ERROR_ORIGIN));

    convertEnglishDate(delimiter, first, second, third);
    auto const month = static_cast<CDate::EMonth>(second);
    if (!CDate::isValid(first, month, third))
        ERROR_THROW(TExcTimeDateTime,
                    Detail::wrongArgument("Date",
                                          L'"' + Detail::dateKey(first, month, third) + L'"',
                                          "Invalid date"));
    return CDate(first, month, third);
}

using TIStringStream = Streams::Detail::basic_istringstream<wchar_t>;

// An unread number is 0.
int numberOf(TIStringStream& stream) {
    int number = 0;
    extract(stream, number);
    return number;
}

} // namespace

CDate::CDate(Strings::string const& day, Strings::string const& month,
             Strings::string const& year) {
    auto const texts = ERROR_PARAMS(ERROR_PARAM(day), ERROR_PARAM(month), ERROR_PARAM(year));
    TIStringStream issDay(day, std::ios_base::in);
    TIStringStream issMonth(month, std::ios_base::in);
    TIStringStream issYear(year, std::ios_base::in);
    day_ = numberOf(issDay);
    year_ = numberOf(issYear);
    int monthNumber = numberOf(issMonth);
    if (issMonth.fail()) {
        Strings::string word;
        issMonth.clear();
        extract(issMonth, word);
        checkInputStream(issMonth, "issMonth", Error::COrigin(ERROR_ORIGIN));
        monthNumber = convertMonthNameToNumber(word);
        Strings::string further;
        extract(issMonth, further);
        if (issMonth.good() || !further.empty())
            ERROR_THROW(TExcTimeDateTime, Detail::wrongArgument("month", month, "Invalid month"),
                        texts);
    }
    month_ = static_cast<EMonth>(monthNumber);
    if (!isValid(day_, month_, year_))
        ERROR_THROW(
            TExcTimeDateTime,
            Detail::wrongArgument("Date", Detail::dateKey(day_, month_, year_), "Invalid date"),
            texts);
}

CDate CDate::readDate(std::istream& stream) {
    return dateFromStream(stream);
}

CDate CDate::readDate(std::wistream& stream) {
    return dateFromStream(stream);
}

} // namespace Time
