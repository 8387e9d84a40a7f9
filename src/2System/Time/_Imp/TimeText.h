/// Numbers in columns, by hand or by a stream.
///
///     Time::Detail::makeText<wchar_t>([](auto& text) {
///         text.putNumber(7, 2, '0');
///         text.put('.');
///     });                                                // L"07."
#ifndef QORN_2SYSTEM_TIMETEXT_H
#define QORN_2SYSTEM_TIMETEXT_H

#include "1Base/Config/ConfigInt.h"
#include "1Base/StdUtil/StdUtilLocale.h"

#include <algorithm>
#include <charconv>
#include <cstddef>
#include <iomanip>
#include <iterator>
#include <limits>
#include <ostream>
#include <sstream>
#include <string>

namespace Time {
namespace Detail {

/// The text that a stream of the classic locale would hold, without the stream.
template <class TChar>
class CDigitText {
  public:
    void put(char character) {
        makeRoom(1);
        append(character);
    }

    /// Padded on the left with `fill`, in front of a sign as well.
    void putNumber(Config::Int32 number, int width, char fill) {
        makeRoom(widest);
        if (width == 2 && isBelow(number, 100)) {
            append(number < 10 ? fill : digit(number / 10));
            append(digit(number % 10));
        } else {
            putAnyNumber(number, width, fill);
        }
    }

    std::basic_string<TChar> str() const {
        std::basic_string<TChar> text(flushed_);
        text.append(static_cast<TChar const*>(buffer_), used_);
        return text;
    }

  private:
    static constexpr std::size_t widest = std::numeric_limits<Config::Int32>::digits10 + 2;

    static bool isBelow(Config::Int32 number, Config::UInt32 limit) {
        return static_cast<Config::UInt32>(number) < limit;
    }

    static char digit(Config::Int32 value) { return static_cast<char>('0' + value); }

    void putAnyNumber(Config::Int32 number, int width, char fill) {
        char digits[widest];
        char const* const end = std::to_chars(std::begin(digits), std::end(digits), number).ptr;
        for (auto missing = width - (end - digits); missing > 0; --missing)
            append(fill);
        for (char const* next = digits; next != end; ++next)
            append(*next);
    }

    void append(char character) { buffer_[used_++] = static_cast<TChar>(character); }

    void makeRoom(std::size_t count) {
        if (count > std::size(buffer_) - used_) {
            flushed_.append(static_cast<TChar const*>(buffer_), used_);
            used_ = 0;
        }
    }

    std::basic_string<TChar> flushed_; // what the buffer had no room for
    std::size_t used_ = 0;
    TChar buffer_[64];
};

/// The same on a stream, whose locale and flags decide.
template <class TChar>
class CStreamText {
  public:
    explicit CStreamText(std::basic_ostream<TChar>& stream) : stream_(stream) {}

    void put(char character) { stream_ << character; }

    /// The fill is the stream's own again afterwards. A width of 0 leaves the stream's as it is.
    void putNumber(Config::Int32 number, int width, char fill) {
        if (width == 0) {
            stream_ << number;
            return;
        }
        TChar const before = stream_.fill(stream_.widen(fill));
        stream_ << std::setw(width) << number;
        stream_.fill(before);
    }

  private:
    std::basic_ostream<TChar>& stream_;
};

/// What `write` puts into the text it is given. By hand only while a new stream would do the same:
/// a global locale may group digits or write others.
template <class TChar, class TWrite>
std::basic_string<TChar> makeText(TWrite const& write) {
    if (StdUtil::isGlobalLocaleClassic()) {
        CDigitText<TChar> text;
        write(text);
        return text.str();
    }
    std::basic_ostringstream<TChar> stream;
    CStreamText<TChar> text(stream);
    write(text);
    return stream.str();
}

} // namespace Detail
} // namespace Time

#endif
