/// File streams that are opened by a wide path. The content stays narrow.
///
///     Streams::Detail::basic_ofstreamW<char> out(L"/tmp/caf\u00E9", std::ios_base::trunc);
///     out << "text";        // goes to the file named "/tmp/caf\xC3\xA9"
///     bool const failed = !out;   // true where the file could not be opened
///
/// A stream opens its file in the constructor and closes it in the destructor; it has no open or
/// close of its own. A file that cannot be opened leaves failbit set and throws nothing, so a
/// caller has to look at the stream. A path that is no valid text raises the conversion failure
/// of Encoding::convert. The mode is the std::ios_base::openmode as an unsigned number.
#ifndef QORN_1BASE_STREAMSFILE_H
#define QORN_1BASE_STREAMSFILE_H

#include "1Base/Encoding/EncodingConverter.h"
#include "1Base/Strings/StringsKinds.h"

#include <fstream>
#include <ios>
#include <istream>
#include <ostream>
#include <string>

namespace Streams {
namespace Detail {

/// A file buffer that opens the file named by the UTF-8 form of `path`.
template <class TChar, class TTraits = std::char_traits<TChar>>
class basic_filebufW : public std::basic_filebuf<TChar, TTraits> {
  public:
    basic_filebufW(wchar_t const* path, unsigned int mode) {
        this->open(Encoding::convert<std::string>(Strings::string(path)),
                   static_cast<std::ios_base::openmode>(mode));
    }
};

/// The file buffer of a stream. It is the first base of each stream, so that the buffer is built
/// before the standard stream is given it. It cannot be copied or moved: the stream points into it.
///
/// Building it may fail. By then the standard stream's own base must be initialised, since it can
/// be destroyed in no other state: each stream sees to that itself.
template <class TChar, class TTraits = std::char_traits<TChar>>
class CFStreamW {
  public:
    CFStreamW(wchar_t const* path, unsigned int mode) : filebuf_(path, mode) {}
    CFStreamW(CFStreamW const&) = delete;
    CFStreamW& operator=(CFStreamW const&) = delete;

    /// Whether the buffer holds an open file.
    bool is_open() const { return filebuf_.is_open(); }

  protected:
    basic_filebufW<TChar, TTraits> filebuf_;
};

/// Reads a file; `in` is added to the mode.
template <class TChar, class TTraits = std::char_traits<TChar>>
class basic_ifstreamW : public CFStreamW<TChar, TTraits>,
                        public std::basic_istream<TChar, TTraits> {
  public:
    basic_ifstreamW(wchar_t const* path, unsigned int mode)
        : std::basic_ios<TChar, TTraits>(nullptr),
          CFStreamW<TChar, TTraits>(path, mode | static_cast<unsigned int>(std::ios_base::in)),
          std::basic_istream<TChar, TTraits>(&this->filebuf_) {
        if (!this->is_open())
            this->setstate(std::ios_base::failbit);
    }
};

/// Writes a file; `out` is added to the mode.
template <class TChar, class TTraits = std::char_traits<TChar>>
class basic_ofstreamW : public CFStreamW<TChar, TTraits>,
                        public std::basic_ostream<TChar, TTraits> {
  public:
    basic_ofstreamW(wchar_t const* path, unsigned int mode)
        : std::basic_ios<TChar, TTraits>(nullptr),
          CFStreamW<TChar, TTraits>(path, mode | static_cast<unsigned int>(std::ios_base::out)),
          std::basic_ostream<TChar, TTraits>(&this->filebuf_) {
        if (!this->is_open())
            this->setstate(std::ios_base::failbit);
    }
};

/// Reads and writes a file in exactly the mode given.
template <class TChar, class TTraits = std::char_traits<TChar>>
class basic_fstreamW : public CFStreamW<TChar, TTraits>,
                       public std::basic_iostream<TChar, TTraits> {
  public:
    basic_fstreamW(wchar_t const* path, unsigned int mode)
        : std::basic_ios<TChar, TTraits>(nullptr),
          CFStreamW<TChar, TTraits>(path, mode),
          std::basic_iostream<TChar, TTraits>(&this->filebuf_) {
        if (!this->is_open())
            this->setstate(std::ios_base::failbit);
    }
};

extern template class basic_filebufW<char>;
extern template class CFStreamW<char>;
extern template class basic_ifstreamW<char>;
extern template class basic_ofstreamW<char>;
extern template class basic_fstreamW<char>;

} // namespace Detail
} // namespace Streams

#endif
