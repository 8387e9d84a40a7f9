/// What must hold of any text that a date or a time of day is read from.
///
/// ASCII: a narrow and a wide stream end as the tests' scanner does, in value or failure, state and
/// rest; and what was read reads as itself again when it has been written. Other bytes: reading
/// ends in a value, or in a failure of its own or of the conversion of a word for the message.
#ifndef QORN_FUZZ_TIMEFREETEXT_H
#define QORN_FUZZ_TIMEFREETEXT_H

#include "1Base/Encoding/EncodingExc.h"
#include "2System/Time/TimeScanner.h"

#include <algorithm>
#include <cstddef>
#include <cstdlib>
#include <sstream>
#include <string>

namespace TimeFuzz {

inline void require(bool holds) {
    if (!holds)
        std::abort();
}

template <class TValue>
std::string written(TValue const& value) {
    std::ostringstream stream;
    stream << value;
    return stream.str();
}

/// Any bytes.
template <std::size_t count, class TRead>
void checkBytes(std::string const& text, TRead const& read) {
    TimeTest::streamed<count, wchar_t>(text, read);
    // Converting a mark that is a word by itself fails and keeps a platform string, as it is bound
    // to.
    if (text.find("\xEF\xBB\xBF") != std::string::npos)
        return;
    try {
        TimeTest::streamed<count, char>(text, read);
    } catch (Encoding::TExcEncoding const&) {
    }
}

/// `read` takes fields from a stream, `scan` from a scanner, and `write` makes the text of them
/// that has the first `kept` ones.
template <std::size_t count, class TScan, class TRead, class TWrite>
void checkText(std::string const& text, TScan const& scan, TRead const& read, TWrite const& write,
               std::size_t kept) {
    bool const isASCII = std::all_of(text.begin(), text.end(),
                                     [](char c) { return static_cast<unsigned char>(c) < 0x80; });
    if (!isASCII) {
        checkBytes<count>(text, read);
        return;
    }
    auto const narrow = TimeTest::streamed<count, char>(text, read);
    require(narrow == TimeTest::scanned<count>(text, scan));
    require(narrow == TimeTest::streamed<count, wchar_t>(text, read));
    if (!narrow.fields)
        return;
    auto const again = TimeTest::streamed<count, char>(write(*narrow.fields), read);
    require(again.fields.has_value() && again.rest.empty());
    require(std::equal(narrow.fields->begin(),
                       narrow.fields->begin() + static_cast<std::ptrdiff_t>(kept),
                       again.fields->begin()));
}

} // namespace TimeFuzz

#endif
