/// Small helpers for reading and writing by the standard streams.
///
///     std::ostringstream out;
///     unsigned char const bytes[] = {10, 255};
///     Streams::writeHex(out, std::begin(bytes), std::end(bytes), ':');   // out.str() == "0a:ff"
#ifndef QORN_1BASE_STREAMSHELPERS_H
#define QORN_1BASE_STREAMSHELPERS_H

#include <ios>
#include <istream>
#include <ostream>

namespace Streams {

/// Puts a stream's format flags back to what they were when the object was made.
class CSentry {
  public:
    /// Remembers the flags; the stream must outlive the object.
    explicit CSentry(std::ios_base& stream) : stream_(stream), flags_(stream.flags()) {}
    CSentry(CSentry const&) = delete;
    CSentry& operator=(CSentry const&) = delete;
    ~CSentry() { stream_.flags(flags_); }

  private:
    std::ios_base& stream_;
    std::ios_base::fmtflags const flags_;
};

/// Skips white space, reads one character and tells whether it is the delimiter. Any other
/// character is read all the same and stays consumed.
template <class TChar, class TTraits>
bool readDelimiter(std::basic_istream<TChar, TTraits>& stream, TChar delimiter) {
    TChar character = 0;
    stream >> std::ws >> character;
    return character == delimiter && !stream.fail();
}

/// Writes the byte as two hexadecimal digits, in lower case unless the stream's `uppercase` flag is
/// set. The flags come back as they were; the fill does not: the stream is left with "0".
template <class TChar, class TTraits>
std::basic_ostream<TChar, TTraits>& writeHex(std::basic_ostream<TChar, TTraits>& stream,
                                             unsigned char value) {
    CSentry const sentry(stream);
    stream.setf(std::ios_base::hex, std::ios_base::basefield);
    stream.width(2);
    stream.fill(stream.widen('0'));
    // As it stands the byte would be written as a character on a narrow stream.
    return stream << static_cast<unsigned int>(value);
}

/// Writes the bytes of a range in the same form, with the separator between each two, or with
/// nothing between them when the separator is 0.
template <class TChar, class TTraits, class TIterator>
std::basic_ostream<TChar, TTraits>& writeHex(std::basic_ostream<TChar, TTraits>& stream,
                                             TIterator first, TIterator last, char separator) {
    CSentry const sentry(stream);
    if (first == last)
        return stream;
    writeHex(stream, static_cast<unsigned char>(*first));
    for (++first; first != last; ++first) {
        if (separator != 0)
            stream << separator;
        writeHex(stream, static_cast<unsigned char>(*first));
    }
    return stream;
}

} // namespace Streams

#endif
