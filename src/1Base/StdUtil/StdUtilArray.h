/// The bounds of an array.
///
///     int const sizes[] = {1, 2, 3};
///     std::vector<int> const copy(StdUtil::begin(sizes), StdUtil::end(sizes));   // three elements
#ifndef QORN_1BASE_STDUTILARRAY_H
#define QORN_1BASE_STDUTILARRAY_H

#include <cstddef>

namespace StdUtil {

/// The first element.
template <class TElement, std::size_t count>
constexpr TElement* begin(TElement (&array)[count]) noexcept {
    return array;
}

/// Behind the last element.
template <class TElement, std::size_t count>
constexpr TElement* end(TElement (&array)[count]) noexcept {
    return array + count;
}

} // namespace StdUtil

#endif
