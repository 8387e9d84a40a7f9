/// String streams whose mode is an unsigned number. They add nothing else to the standard ones.
///
///     Streams::Detail::basic_ostringstream<wchar_t> out(std::ios_base::out);
///     out << 42;   // out.str() == L"42"
#ifndef QORN_1BASE_STREAMSSTRING_H
#define QORN_1BASE_STREAMSSTRING_H

#include <memory>
#include <sstream>
#include <string>

namespace Streams {
namespace Detail {

/// Writes a string; `out` is added to the mode.
template <class TChar, class TTraits = std::char_traits<TChar>,
          class TAllocator = std::allocator<TChar>>
class basic_ostringstream : public std::basic_ostringstream<TChar, TTraits, TAllocator> {
  public:
    explicit basic_ostringstream(unsigned int mode)
        : std::basic_ostringstream<TChar, TTraits, TAllocator>(
              static_cast<std::ios_base::openmode>(mode) | std::ios_base::out) {}
};

/// Reads a copy of `text`; `in` is added to the mode.
template <class TChar, class TTraits = std::char_traits<TChar>,
          class TAllocator = std::allocator<TChar>>
class basic_istringstream : public std::basic_istringstream<TChar, TTraits, TAllocator> {
  public:
    basic_istringstream(std::basic_string<TChar, TTraits, TAllocator> const& text,
                        unsigned int mode)
        : std::basic_istringstream<TChar, TTraits, TAllocator>(
              text, static_cast<std::ios_base::openmode>(mode) | std::ios_base::in) {}
};

/// Reads and writes a string in exactly the mode given.
template <class TChar, class TTraits = std::char_traits<TChar>,
          class TAllocator = std::allocator<TChar>>
class basic_stringstream : public std::basic_stringstream<TChar, TTraits, TAllocator> {
  public:
    explicit basic_stringstream(unsigned int mode)
        : std::basic_stringstream<TChar, TTraits, TAllocator>(
              static_cast<std::ios_base::openmode>(mode)) {}
};

extern template class basic_ostringstream<wchar_t>;
extern template class basic_istringstream<wchar_t>;
extern template class basic_stringstream<wchar_t>;

} // namespace Detail
} // namespace Streams

#endif
