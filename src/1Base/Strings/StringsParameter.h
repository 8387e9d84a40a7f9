/// Named values at the place where a message is raised or logged.
///
///     Strings::buildNamedParameter("key", path) + Strings::buildNamedParameter("line", 7)
///
/// costs two pointers a value and no allocation; text is made only when a CParameterList is built
/// of it, if that ever happens.
#ifndef QORN_1BASE_STRINGSPARAMETER_H
#define QORN_1BASE_STRINGSPARAMETER_H

#include "1Base/TemplMeta/TemplMetaObjList.h"

#include <memory>

namespace Strings {

/// A name and a value, neither of them copied: both must outlive the object, which inside one full
/// expression they do.
template <class T>
class CStaticNamedParameter {
  public:
    /// A name that ends in a zero, and a value; neither may be null.
    constexpr CStaticNamedParameter(char const* name, T const* value)
        : name_(name), value_(value) {}

    /// @{
    /// What the constructor was given.
    constexpr char const* getName() const { return name_; }
    constexpr T const& getValue() const { return *value_; }
    /// @}

  private:
    char const* name_;
    T const* value_;
};

/// Names a value for the length of the statement.
///
///     buildNamedParameter("line", 7)
template <class T>
constexpr CStaticNamedParameter<T> buildNamedParameter(char const* name, T const& value) {
    return CStaticNamedParameter<T>(name, std::addressof(value));
}

/// The two parameters, left then right.
template <class TLeft, class TRight>
constexpr auto operator+(CStaticNamedParameter<TLeft> const& left,
                         CStaticNamedParameter<TRight> const& right) {
    return TemplMeta::CConcatObjList<CStaticNamedParameter<TLeft>,
                                     CStaticNamedParameter<TRight>>::concat(left, right);
}

/// The parameter, then the list.
template <class TLeft, class THead, class TTail>
constexpr auto operator+(CStaticNamedParameter<TLeft> const& left,
                         TemplMeta::CObjList<THead, TTail> const& right) {
    return TemplMeta::CConcatObjList<CStaticNamedParameter<TLeft>,
                                     TemplMeta::CObjList<THead, TTail>>::concat(left, right);
}

/// The parameter, then the list, although the parameter stands on the right: a + b + c gives
/// c, a, b. Callers rely on which of two equal names comes first.
template <class THead, class TTail, class TRight>
constexpr auto operator+(TemplMeta::CObjList<THead, TTail> const& left,
                         CStaticNamedParameter<TRight> const& right) {
    return right + left;
}

} // namespace Strings

#endif
