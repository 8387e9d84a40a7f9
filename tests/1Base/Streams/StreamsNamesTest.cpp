// Names, bases and signatures that callers build on: a change here is a decision.

#include "1Base/Streams/Streams.h"

#include <type_traits>
#if defined(__GNUC__) && !defined(__clang__)
#    include <tr2/type_traits>
#endif

namespace {

using namespace Streams;

template <class TDerived, class TBase>
constexpr bool derivesPubliclyFrom =
    std::is_base_of_v<TBase, TDerived>&& std::is_convertible_v<TDerived*, TBase*>;

static_assert(std::is_same_v<u_ostream, std::basic_ostream<wchar_t>>);

// Files.
static_assert(derivesPubliclyFrom<Detail::basic_filebufW<char>, std::basic_filebuf<char>>);
static_assert(!std::is_polymorphic_v<Detail::CFStreamW<char>>);
static_assert(derivesPubliclyFrom<Detail::basic_ifstreamW<char>, Detail::CFStreamW<char>>);
static_assert(derivesPubliclyFrom<Detail::basic_ifstreamW<char>, std::basic_istream<char>>);
static_assert(derivesPubliclyFrom<Detail::basic_ofstreamW<char>, Detail::CFStreamW<char>>);
static_assert(derivesPubliclyFrom<Detail::basic_ofstreamW<char>, std::basic_ostream<char>>);
static_assert(derivesPubliclyFrom<Detail::basic_fstreamW<char>, Detail::CFStreamW<char>>);
static_assert(derivesPubliclyFrom<Detail::basic_fstreamW<char>, std::basic_iostream<char>>);
static_assert(std::is_same_v<decltype(&Detail::CFStreamW<char>::is_open),
                             bool (Detail::CFStreamW<char>::*)() const>);

#if defined(__GNUC__) && !defined(__clang__)
template <class TStream>
constexpr bool hasBufferFirst =
    std::is_same_v<typename std::tr2::direct_bases<TStream>::type::first::type,
                   Detail::CFStreamW<char>>;
static_assert(hasBufferFirst<Detail::basic_ifstreamW<char>>);
static_assert(hasBufferFirst<Detail::basic_ofstreamW<char>>);
static_assert(hasBufferFirst<Detail::basic_fstreamW<char>>);
#endif

template <class TFile>
constexpr bool opensByWidePath =
    std::is_constructible_v<TFile, wchar_t const*, unsigned int> &&
    !std::is_constructible_v<TFile, char const*, unsigned int> &&
    !std::is_constructible_v<TFile, wchar_t const*> && !std::is_default_constructible_v<TFile>;
static_assert(opensByWidePath<Detail::basic_filebufW<char>>);
static_assert(opensByWidePath<Detail::CFStreamW<char>>);
static_assert(opensByWidePath<Detail::basic_ifstreamW<char>>);
static_assert(opensByWidePath<Detail::basic_ofstreamW<char>>);
static_assert(opensByWidePath<Detail::basic_fstreamW<char>>);

// A stream that moved would leave its pointer to the buffer behind.
static_assert(!std::is_move_constructible_v<Detail::basic_ifstreamW<char>>);
static_assert(!std::is_move_constructible_v<Detail::basic_ofstreamW<char>>);
static_assert(!std::is_move_constructible_v<Detail::basic_fstreamW<char>>);

// Strings.
static_assert(derivesPubliclyFrom<Detail::basic_ostringstream<wchar_t>, std::wostringstream>);
static_assert(derivesPubliclyFrom<Detail::basic_istringstream<wchar_t>, std::wistringstream>);
static_assert(derivesPubliclyFrom<Detail::basic_stringstream<wchar_t>, std::wstringstream>);
static_assert(std::is_constructible_v<Detail::basic_ostringstream<wchar_t>, unsigned int>);
static_assert(std::is_constructible_v<Detail::basic_istringstream<wchar_t>, std::wstring const&,
                                      unsigned int>);
static_assert(std::is_constructible_v<Detail::basic_stringstream<wchar_t>, unsigned int>);
static_assert(!std::is_default_constructible_v<Detail::basic_ostringstream<wchar_t>>);
static_assert(!std::is_default_constructible_v<Detail::basic_istringstream<wchar_t>>);
static_assert(!std::is_default_constructible_v<Detail::basic_stringstream<wchar_t>>);

// Buffers.
using TBuffer = basic_isbufbuf<wchar_t>;
static_assert(derivesPubliclyFrom<TBuffer, std::wstreambuf>);
static_assert(std::is_default_constructible_v<TBuffer>);
static_assert(!std::is_copy_constructible_v<TBuffer>);
static_assert(
    std::is_same_v<decltype(&TBuffer::open), TBuffer& (TBuffer::*)(wchar_t*, unsigned long)>);
static_assert(std::is_same_v<decltype(&TBuffer::close), TBuffer& (TBuffer::*)()>);
static_assert(std::is_same_v<decltype(&TBuffer::is_open), bool (TBuffer::*)() const>);
static_assert(derivesPubliclyFrom<basic_isbufstream<wchar_t>, std::wistream>);
static_assert(std::is_constructible_v<basic_isbufstream<wchar_t>, wchar_t const*, unsigned long>);
static_assert(!std::is_default_constructible_v<basic_isbufstream<wchar_t>>);

// Helpers.
static_assert(std::is_constructible_v<CSentry, std::ios_base&>);
static_assert(!std::is_copy_constructible_v<CSentry>);
static_assert(std::is_same_v<decltype(&readDelimiter<wchar_t, std::char_traits<wchar_t>>),
                             bool (*)(std::wistream&, wchar_t)>);
[[maybe_unused]] constexpr std::wostream& (*writeHexByte)(std::wostream&, unsigned char) = writeHex;
[[maybe_unused]] constexpr std::ostream& (*writeHexRange)(std::ostream&, unsigned char const*,
                                                          unsigned char const*, char) = writeHex;

} // namespace
