/// Lists of values of any mix of types, held flat on the stack and built without allocation.
///
///     auto const list = TemplMeta::CConcatObjList<int, double>::concat(1, 2.5);
///     // CObjList<int, CObjList<double, CNil>>: 1, then 2.5; listSize(list) == 2
#ifndef QORN_1BASE_TEMPLMETAOBJLIST_H
#define QORN_1BASE_TEMPLMETAOBJLIST_H

#include "1Base/TemplMeta/TemplMetaTag.h"

namespace TemplMeta {

/// The head by value, then the tail by value: another CObjList, or CNil, which takes no room.
template <class THead, class TTail>
class CObjList {
  public:
    /// Copies the head and the tail.
    constexpr CObjList(THead const& head, TTail const& tail) : head_(head), tail_(tail) {}

    /// @{
    /// They live as long as the list.
    constexpr THead const& head() const { return head_; }
    constexpr TTail const& tail() const { return tail_; }
    /// @}

  private:
    THead head_;
    TTail tail_;
};

/// A list of one element.
template <class THead>
class CObjList<THead, CNil> {
  public:
    /// Copies the head.
    constexpr CObjList(THead const& head, CNil) : head_(head) {}

    /// @{
    /// They live as long as the list.
    constexpr THead const& head() const { return head_; }
    constexpr CNil tail() const { return CNil(); }
    /// @}

  private:
    THead head_;
};

namespace Detail {

template <class TList>
struct CListSize;

template <>
struct CListSize<CNil> {
    static constexpr unsigned long value = 0;
};

template <class THead, class TTail>
struct CListSize<CObjList<THead, TTail>> {
    static constexpr unsigned long value = 1 + CListSize<TTail>::value;
};

/// A value is joined to another value or to the front of a list.
template <class TLeft, class TRight>
struct CConcatObjList_ {
    using TResult = CObjList<TLeft, CObjList<TRight, CNil>>;

    static constexpr TResult concat(TLeft const& left, TRight const& right) {
        return TResult(left, CObjList<TRight, CNil>(right, CNil()));
    }
};

template <class TLeft, class THead, class TTail>
struct CConcatObjList_<TLeft, CObjList<THead, TTail>> {
    using TResult = CObjList<TLeft, CObjList<THead, TTail>>;

    static constexpr TResult concat(TLeft const& left, CObjList<THead, TTail> const& right) {
        return TResult(left, right);
    }
};

// Without these two a list on the left would be taken for a value and silently nested.
template <class THead, class TTail, class TRight>
struct CConcatObjList_<CObjList<THead, TTail>, TRight>;

template <class THead1, class TTail1, class THead2, class TTail2>
struct CConcatObjList_<CObjList<THead1, TTail1>, CObjList<THead2, TTail2>>;

} // namespace Detail

/// The number of elements by the list's type alone: a constant also where only a reference is at
/// hand.
template <class TList>
inline constexpr unsigned long listSizeOf = Detail::CListSize<TList>::value;

/// The number of elements. The argument isn't read.
template <class TList>
constexpr unsigned long listSize(TList const&) {
    return listSizeOf<TList>;
}

/// Joins a value to another value or to the front of a list. There is no join with a list on the
/// left: that does not compile.
template <class TLeft, class TRight>
struct CConcatObjList {
    /// The list that comes out.
    using TResult = typename Detail::CConcatObjList_<TLeft, TRight>::TResult;

    /// Copies both into a new list, `left` in front.
    static constexpr TResult concat(TLeft const& left, TRight const& right) {
        return Detail::CConcatObjList_<TLeft, TRight>::concat(left, right);
    }
};

} // namespace TemplMeta

#endif
