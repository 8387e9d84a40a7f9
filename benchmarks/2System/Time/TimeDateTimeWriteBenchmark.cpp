// Dates to text beside other libraries: ISO, PDF and a pattern. Every contender starts from the
// value that it takes by nature, in UTC, and makes a text of its own kind that it owns.

#include "2System/Time/TimeDateTime.h"

#include "2System/Time/TimeMoments.h"

#ifdef QORN_HAVE_ABSL
#    include <absl/time/time.h>
#endif
#ifdef QORN_HAVE_DATE
#    include <date/date.h>
#endif
#ifdef QORN_HAVE_FMT
#    include <fmt/chrono.h>
#    include <fmt/xchar.h>
#endif
#ifdef QORN_HAVE_ICU
#    include <unicode/smpdtfmt.h>
#endif
#ifdef QORN_HAVE_POCO
#    include <Poco/DateTimeFormatter.h>
#    include <Poco/Timestamp.h>
#endif
#ifdef QORN_HAVE_QT
#    include <QDateTime>
#endif

#include <chrono>
#include <iomanip>
#include <memory>
#include <sstream>
#include <string>

namespace {

using Benchmarks::CInputs;
using Benchmarks::narrowOf;
using TMoments = CInputs<std::time_t>;

// One text form in the languages of all contenders.
struct CForm {
    char const* strftime;
    std::wstring ours;
    std::wstring wide;
    std::string fmt;
    std::wstring fmtWide;
    char const* absl;
    char const* poco;
    char const* icu;
    char const* qt;
};

CForm const isoForm = {"%Y-%m-%dT%H:%M:%SZ",     L"",
                       L"%Y-%m-%dT%H:%M:%SZ",    "{:%Y-%m-%dT%H:%M:%SZ}",
                       L"{:%Y-%m-%dT%H:%M:%SZ}", "%Y-%m-%dT%H:%M:%SZ",
                       "%Y-%m-%dT%H:%M:%SZ",     "yyyy-MM-dd'T'HH:mm:ss'Z'",
                       "yyyy-MM-ddTHH:mm:ssZ"};
CForm const pdfForm = {"D:%Y%m%d%H%M%SZ",      L"",
                       L"D:%Y%m%d%H%M%SZ",     "{:D:%Y%m%d%H%M%SZ}",
                       L"{:D:%Y%m%d%H%M%SZ}",  "D:%Y%m%d%H%M%SZ",
                       "D:%Y%m%d%H%M%SZ",      "'D:'yyyyMMddHHmmss'Z'",
                       "'D:'yyyyMMddHHmmss'Z'"};
CForm const patternForm = {"%d.%m.%Y %H:%M:%S",    L"DD.MM.YYYY hh:mm:ss",  L"%d.%m.%Y %H:%M:%S",
                           "{:%d.%m.%Y %H:%M:%S}", L"{:%d.%m.%Y %H:%M:%S}", "%d.%m.%Y %H:%M:%S",
                           "%d.%m.%Y %H:%M:%S",    "dd.MM.yyyy HH:mm:ss",   "dd.MM.yyyy hh:mm:ss"};

#ifdef QORN_HAVE_QT
std::string narrowOf(QString const& text) {
    return text.toStdString();
}
#endif

template <class TValue, class TWrite>
void addWriter(std::string const& row, char const* contender, CInputs<TValue> const& values,
               CInputs<std::string> const& expected, TWrite write) {
    Benchmarks::addChecked(row, contender, values, expected, write,
                           [](auto const& text) { return narrowOf(text); });
}

void addStandard(std::string const& row, CForm const& form, TMoments const& moments,
                 CInputs<std::string> const& expected) {
    auto const fields = moments.map(Benchmarks::fieldsOf);
    addWriter(row, "std:strftime", fields, expected, [form](std::tm const& value) {
        char text[64];
        return std::string(text, std::strftime(text, sizeof text, form.strftime, &value));
    });
    addWriter(row, "std:put_time", fields, expected, [form](std::tm const& value) {
        std::wostringstream out;
        out << std::put_time(&value, form.wide.c_str());
        return out.str();
    });
#ifdef QORN_HAVE_FMT
    addWriter(row, "fmt", fields, expected,
              [form](std::tm const& value) { return fmt::format(fmt::runtime(form.fmt), value); });
    addWriter(row, "fmt:wide", fields, expected, [form](std::tm const& value) {
        return fmt::format(fmt::runtime(form.fmtWide), value);
    });
#endif
}

void addLibraries(std::string const& row, CForm const& form, TMoments const& moments,
                  CInputs<std::string> const& expected) {
#ifdef QORN_HAVE_ABSL
    addWriter(row, "absl", moments.map(absl::FromTimeT), expected, [form](absl::Time value) {
        return absl::FormatTime(form.absl, value, absl::UTCTimeZone());
    });
#endif
#ifdef QORN_HAVE_DATE
    auto const seconds = moments.map(
        [](std::time_t moment) { return date::sys_seconds(std::chrono::seconds(moment)); });
    addWriter(row, "date", seconds, expected,
              [form](date::sys_seconds value) { return date::format(form.strftime, value); });
#endif
#ifdef QORN_HAVE_POCO
    auto const stamps = moments.map(Poco::Timestamp::fromEpochTime);
    addWriter(row, "poco", stamps, expected, [form](Poco::Timestamp const& value) {
        return Poco::DateTimeFormatter::format(value, form.poco);
    });
#endif
}

#ifdef QORN_HAVE_ICU
void addICU(std::string const& row, CForm const& form, TMoments const& moments,
            CInputs<std::string> const& expected) {
    UErrorCode status = U_ZERO_ERROR;
    auto const format = std::make_shared<icu::SimpleDateFormat>(icu::UnicodeString(form.icu),
                                                                icu::Locale::getRoot(), status);
    format->setTimeZone(*icu::TimeZone::getGMT());
    auto const dates =
        moments.map([](std::time_t moment) { return static_cast<UDate>(moment) * 1000; });
    Benchmarks::addChecked(
        row, "icu", dates, expected,
        [format](UDate value) {
            icu::UnicodeString text;
            format->format(value, text);
            return text;
        },
        [](icu::UnicodeString const& text) {
            std::string narrow;
            return text.toUTF8String(narrow);
        });
}
#endif

#ifdef QORN_HAVE_QT
void addQt(std::string const& row, CForm const& form, TMoments const& moments,
           CInputs<std::string> const& expected) {
    auto const values = moments.map(
        [](std::time_t moment) { return QDateTime::fromSecsSinceEpoch(moment, Qt::UTC); });
    QString const format = QString::fromLatin1(form.qt);
    addWriter(row, "qt:pattern", values, expected,
              [format](QDateTime const& value) { return value.toString(format); });
    if (&form == &isoForm) {
        addWriter(row, "qt:iso", values, expected,
                  [](QDateTime const& value) { return value.toString(Qt::ISODate); });
    }
}
#endif

template <class TWrite>
void addForm(std::string const& row, CForm const& form, TWrite write) {
    TMoments const moments = Benchmarks::randomMoments();
    auto const expected = moments.map(
        [&form](std::time_t moment) { return Benchmarks::textOf(moment, form.strftime); });
    auto const ours = moments.map(
        [](std::time_t moment) { return Time::CDateTime(Benchmarks::fieldsOf(moment)); });
    addWriter(row, "ours", ours, expected, write);
    addStandard(row, form, moments, expected);
    addLibraries(row, form, moments, expected);
#ifdef QORN_HAVE_ICU
    addICU(row, form, moments, expected);
#endif
#ifdef QORN_HAVE_QT
    addQt(row, form, moments, expected);
#endif
}

void addBenchmarks() {
    Time::CTimeZone const utc(Time::CTimeZone::etzUTC, 0, 0);
    addForm("DateWrite/iso", isoForm,
            [utc](Time::CDateTime const& value) { return value.getAsISOdate(utc); });
    addForm("DateWrite/pdf", pdfForm,
            [utc](Time::CDateTime const& value) { return value.getAsPDFdate(utc); });
    addForm("DateWrite/pattern", patternForm,
            [](Time::CDateTime const& value) { return value.format(patternForm.ours); });
}

Benchmarks::CRegistrar const registrar(addBenchmarks);

} // namespace
