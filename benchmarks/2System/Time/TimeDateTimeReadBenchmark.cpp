// Dates from text beside other libraries: ISO and PDF, both in UTC. Every contender reads a text of
// the kind that it takes by nature into its own value.

#include "2System/Time/TimeDateTime.h"

#include "2System/Time/TimeMoments.h"

#ifdef QORN_HAVE_ABSL
#    include <absl/time/time.h>
#endif
#ifdef QORN_HAVE_DATE
#    include <date/date.h>
#endif
#ifdef QORN_HAVE_ICU
#    include <unicode/smpdtfmt.h>
#endif
#ifdef QORN_HAVE_POCO
#    include <Poco/DateTime.h>
#    include <Poco/DateTimeParser.h>
#    include <Poco/Timestamp.h>
#endif
#ifdef QORN_HAVE_QT
#    include <QDateTime>
#endif

#include <iomanip>
#include <memory>
#include <sstream>
#include <string>

namespace {

using Benchmarks::CInputs;
using TMoments = CInputs<std::time_t>;
using TTexts = CInputs<std::string>;

struct CForm {
    char const* strftime;
    char const* absl;
    char const* poco;
    char const* icu;
    char const* qt;
};

CForm const isoForm = {"%Y-%m-%dT%H:%M:%SZ", "%E4Y-%m-%dT%H:%M:%SZ", "%Y-%m-%dT%H:%M:%S%z",
                       "yyyy-MM-dd'T'HH:mm:ss'Z'", "yyyy-MM-ddTHH:mm:ssZ"};
CForm const pdfForm = {"D:%Y%m%d%H%M%SZ", "D:%E4Y%m%d%H%M%SZ", "D:%Y%m%d%H%M%SZ",
                       "'D:'yyyyMMddHHmmss'Z'", "'D:'yyyyMMddHHmmss'Z'"};

std::time_t momentOf(std::tm fields) {
    return timegm(&fields);
}

std::time_t momentOf(Time::CDateTime const& value) {
    std::tm fields = {};
    fields.tm_year = value.getYear() - 1900;
    fields.tm_mon = value.getMonth() - 1;
    fields.tm_mday = value.getDay();
    fields.tm_hour = value.getHour();
    fields.tm_min = value.getMinute();
    fields.tm_sec = value.getSecond();
    return momentOf(fields);
}

#ifdef QORN_HAVE_QT
std::time_t momentOf(QDateTime value) {
    value.setTimeSpec(Qt::UTC);
    return static_cast<std::time_t>(value.toSecsSinceEpoch());
}
#endif

template <class TText, class TRead>
void addReader(std::string const& row, char const* contender, CInputs<TText> const& texts,
               TMoments const& expected, TRead read) {
    Benchmarks::addChecked(row, contender, texts, expected, read,
                           [](auto const& value) { return momentOf(value); });
}

void addStandard(std::string const& row, CForm const& form, TTexts const& texts,
                 TMoments const& expected) {
    addReader(row, "std:strptime", texts, expected, [form](std::string const& text) {
        std::tm fields = {};
        strptime(text.c_str(), form.strftime, &fields);
        return fields;
    });
    addReader(row, "std:get_time", texts, expected, [form](std::string const& text) {
        std::tm fields = {};
        std::istringstream in(text);
        in >> std::get_time(&fields, form.strftime);
        return fields;
    });
}

void addLibraries(std::string const& row, CForm const& form, TTexts const& texts,
                  TMoments const& expected) {
#ifdef QORN_HAVE_ABSL
    Benchmarks::addChecked(
        row, "absl", texts, expected,
        [form](std::string const& text) {
            absl::Time value;
            absl::ParseTime(form.absl, text, &value, nullptr);
            return value;
        },
        [](absl::Time value) { return absl::ToTimeT(value); });
#endif
#ifdef QORN_HAVE_DATE
    Benchmarks::addChecked(
        row, "date", texts, expected,
        [form](std::string const& text) {
            std::istringstream in(text);
            date::sys_seconds value{};
            date::from_stream(in, form.strftime, value);
            return value;
        },
        [](date::sys_seconds value) {
            return static_cast<std::time_t>(value.time_since_epoch().count());
        });
#endif
#ifdef QORN_HAVE_POCO
    Benchmarks::addChecked(
        row, "poco", texts, expected,
        [form](std::string const& text) {
            int zone = 0;
            return Poco::DateTimeParser::parse(form.poco, text, zone);
        },
        [](Poco::DateTime const& value) { return value.timestamp().epochTime(); });
#endif
}

#ifdef QORN_HAVE_ICU
void addICU(std::string const& row, CForm const& form, TTexts const& texts,
            TMoments const& expected) {
    UErrorCode status = U_ZERO_ERROR;
    auto const format = std::make_shared<icu::SimpleDateFormat>(icu::UnicodeString(form.icu),
                                                                icu::Locale::getRoot(), status);
    format->setTimeZone(*icu::TimeZone::getGMT());
    Benchmarks::addChecked(
        row, "icu",
        texts.map([](std::string const& text) { return icu::UnicodeString::fromUTF8(text); }),
        expected,
        [format](icu::UnicodeString const& text) {
            UErrorCode error = U_ZERO_ERROR;
            return format->parse(text, error);
        },
        [](UDate value) { return static_cast<std::time_t>(value / 1000); });
}
#endif

#ifdef QORN_HAVE_QT
void addQt(std::string const& row, CForm const& form, TTexts const& texts,
           TMoments const& expected) {
    auto const wide = texts.map(QString::fromStdString);
    QString const format = QString::fromLatin1(form.qt);
    addReader(row, "qt:pattern", wide, expected,
              [format](QString const& text) { return QDateTime::fromString(text, format); });
    if (&form == &isoForm) {
        addReader(row, "qt:iso", wide, expected,
                  [](QString const& text) { return QDateTime::fromString(text, Qt::ISODate); });
    }
}
#endif

template <class TRead>
void addForm(std::string const& row, CForm const& form, TRead read) {
    TMoments const moments = Benchmarks::randomMoments();
    TTexts const texts = moments.map(
        [&form](std::time_t moment) { return Benchmarks::textOf(moment, form.strftime); });
    addReader(row, "ours", texts, moments, read);
    addStandard(row, form, texts, moments);
    addLibraries(row, form, texts, moments);
#ifdef QORN_HAVE_ICU
    addICU(row, form, texts, moments);
#endif
#ifdef QORN_HAVE_QT
    addQt(row, form, texts, moments);
#endif
}

void addBenchmarks() {
    addForm("DateRead/iso", isoForm, [](std::string const& text) {
        Time::CTimeZone zone;
        Time::CDateTime::TParts parts = 0;
        return Time::CDateTime::readDateTimeFromISO(text, zone, false, 'T', &parts);
    });
    addForm("DateRead/pdf", pdfForm, [](std::string const& text) {
        Time::CTimeZone zone;
        Time::CDateTime::TParts parts = 0;
        return Time::CDateTime::readDateTimeFromPDF(text, zone, false, &parts);
    });
}

Benchmarks::CRegistrar const registrar(addBenchmarks);

} // namespace
