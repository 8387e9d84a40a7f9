// Reads the dates of an invoice as its XML gives them, reckons the day on which it is due, and
// writes both for a PDF and for a log.
//
// Prints:
//     issued:  2021-03-05T00:00:00Z
//     in PDF:  D:20210305000000Z
//     due:     2021-04-04, a Sunday
//     to read: 4.4.21
//     refused: Argument XML date 2021030 is wrong: Invalid format code

#include "1Base/Encoding/Encoding.h"
#include "1Base/Error/Error.h"
#include "2System/Time/Time.h"

#include <iostream>
#include <string>

namespace {

using Time::CDateTime;

// The format code that invoices use for a plain day, year first.
constexpr int dayCode = 102;

std::string narrow(Strings::string const& text) {
    return Encoding::convert<std::string>(text);
}

} // namespace

int main() {
    // What the invoice says is a day of no particular zone; it is written here as one of UTC.
    Time::CTimeZone const utc(Time::CTimeZone::etzUTC, 0, 0);
    CDateTime const issued = CDateTime::readDateTimeFromCEFACTFormatCode(L"20210305", dayCode);
    std::cout << "issued:  " << narrow(issued.getAsISOdate(utc)) << "\n";
    std::cout << "in PDF:  " << issued.getAsPDFdate(utc) << "\n";

    CDateTime due = issued;
    due.addDays(30);
    std::cout << "due:     " << narrow(due.format(L"YYYY-MM-DD")) << ", a "
              << narrow(Time::CDate::getWeekdayNameLong(due.getDayOfWeek())) << "\n";
    std::cout << "to read: " << narrow(due.format(L"D.M.YY")) << "\n";

    try {
        CDateTime::readDateTimeFromCEFACTFormatCode(L"2021030", dayCode);
    } catch (Time::TExcTimeDateTime const& exc) {
        std::cout << "refused: " << exc.getInfo().getMessage() << "\n";
    }
}
