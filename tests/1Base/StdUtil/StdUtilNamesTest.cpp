// Names and signatures that callers build on: a change here is a decision.

#include "1Base/StdUtil/StdUtil.h"

#include <string>
#include <type_traits>

namespace {

using TWide = std::wstring;

template <class TTarget, class TSource>
constexpr bool isCast = std::is_same_v<decltype(StdUtil::CStreamCaster<TTarget, TSource>::cast(
                                           std::declval<TSource const&>())),
                                       TTarget>&&
    std::is_same_v<decltype(&StdUtil::stream_cast<TTarget, TSource>), TTarget (*)(TSource const&)>;

static_assert(isCast<TWide, TWide>);
static_assert(isCast<TWide, std::string>);
static_assert(isCast<TWide, char const*>);
static_assert(isCast<TWide, wchar_t const*>);
static_assert(isCast<TWide, char*>);
static_assert(isCast<TWide, wchar_t*>);
static_assert(isCast<TWide, char[6]>);
static_assert(isCast<TWide, wchar_t[6]>);
static_assert(isCast<TWide, int>);
static_assert(isCast<int, TWide>);
static_assert(isCast<unsigned int, TWide>);
static_assert(isCast<unsigned short, TWide>);
static_assert(isCast<long, TWide>);

static_assert(std::is_same_v<StdUtil::CStreamCaster<TWide, int>::TString, TWide>);
static_assert(std::is_same_v<StdUtil::CStreamCaster<int, TWide>::TString, TWide>);

static_assert(std::is_same_v<decltype(&StdUtil::Detail::throwStreamCastError),
                             void (*)(char const*, unsigned int, char const*, char const*,
                                      char const*, char const*, char const*)>);

} // namespace
