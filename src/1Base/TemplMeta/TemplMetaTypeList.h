/// Lists of types.
///
///     using TSmall = TemplMeta::CTypeList<char, TemplMeta::CTypeList<short, TemplMeta::CNil>>;
///     TemplMeta::contains<TSmall, short>   // true
#ifndef QORN_1BASE_TEMPLMETATYPELIST_H
#define QORN_1BASE_TEMPLMETATYPELIST_H

#include "1Base/TemplMeta/TemplMetaTag.h"

namespace TemplMeta {

/// A list of types. TTail is another CTypeList or CNil.
template <class THead, class TTail>
struct CTypeList {};

/// Names the conjunction of conditions where a template takes a policy.
struct CAnd {};

namespace Detail {

template <class TList, class TWanted>
struct CContains;

template <class TWanted>
struct CContains<CNil, TWanted> {
    static constexpr bool value = false;
};

template <class TTail, class TWanted>
struct CContains<CTypeList<TWanted, TTail>, TWanted> {
    static constexpr bool value = true;
};

template <class THead, class TTail, class TWanted>
struct CContains<CTypeList<THead, TTail>, TWanted> : CContains<TTail, TWanted> {};

} // namespace Detail

/// True where TWanted stands in TList.
template <class TList, class TWanted>
inline constexpr bool contains = Detail::CContains<TList, TWanted>::value;

} // namespace TemplMeta

#endif
