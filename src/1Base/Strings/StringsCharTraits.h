/// Character traits of the element types that the standard has none for.
///
/// Some libraries serve std::char_traits of any integer, as a habit of their own. libc++ has given
/// it up, and there std::char_traits<short> and std::char_traits<unsigned char> come from here.
#ifndef QORN_1BASE_STRINGSCHARTRAITS_H
#define QORN_1BASE_STRINGSCHARTRAITS_H

#include <algorithm>
#include <cstddef>
#include <cwchar>
#include <ios>
#include <string>
#include <type_traits>

namespace Strings {
namespace Detail {

/// The traits of an integer narrower than int. Elements compare by their values, a negative one
/// below zero; eof() is no element's number.
template <class TElement>
struct CIntegerTraits {
    static_assert(std::is_integral_v<TElement> && sizeof(TElement) < sizeof(int));

    using char_type = TElement;
    using int_type = int;
    using off_type = std::streamoff;
    using pos_type = std::streampos;
    using state_type = std::mbstate_t;

    static constexpr void assign(char_type& to, char_type const& from) noexcept { to = from; }
    static constexpr bool eq(char_type a, char_type b) noexcept { return a == b; }
    static constexpr bool lt(char_type a, char_type b) noexcept { return a < b; }

    static constexpr int compare(char_type const* a, char_type const* b, std::size_t count) {
        for (; count > 0; --count, ++a, ++b) {
            if (*a != *b) {
                return *a < *b ? -1 : 1;
            }
        }
        return 0;
    }

    static constexpr std::size_t length(char_type const* text) {
        std::size_t count = 0;
        while (text[count] != char_type{}) {
            ++count;
        }
        return count;
    }

    static constexpr char_type const* find(char_type const* text, std::size_t count,
                                           char_type const& wanted) {
        for (; count > 0; --count, ++text) {
            if (*text == wanted) {
                return text;
            }
        }
        return nullptr;
    }

    static char_type* move(char_type* to, char_type const* from, std::size_t count) {
        if (to < from) {
            std::copy_n(from, count, to);
        } else {
            std::copy_backward(from, from + count, to + count);
        }
        return to;
    }

    static char_type* copy(char_type* to, char_type const* from, std::size_t count) {
        std::copy_n(from, count, to);
        return to;
    }

    static char_type* assign(char_type* to, std::size_t count, char_type value) {
        std::fill_n(to, count, value);
        return to;
    }

    static constexpr char_type to_char_type(int_type number) noexcept {
        return static_cast<char_type>(number);
    }
    static constexpr int_type to_int_type(char_type element) noexcept {
        return static_cast<std::make_unsigned_t<char_type>>(element);
    }
    static constexpr bool eq_int_type(int_type a, int_type b) noexcept { return a == b; }
    static constexpr int_type eof() noexcept { return -1; }
    static constexpr int_type not_eof(int_type number) noexcept {
        return number == eof() ? 0 : number;
    }
};

} // namespace Detail
} // namespace Strings

// libc++ warns of its own template since release 16 and lacks it since 19.
#if defined(_LIBCPP_VERSION) && _LIBCPP_VERSION >= 160000

template <>
struct std::char_traits<short> : Strings::Detail::CIntegerTraits<short> {};

template <>
struct std::char_traits<unsigned char> : Strings::Detail::CIntegerTraits<unsigned char> {};

#endif

#endif
