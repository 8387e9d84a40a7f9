/// Named values of a message, as raising and logging statements write them.
///
///     Error::buildNamedParameter("key", path)
///     Error::inOrder(p1, p2, p3)     // p1, p2, p3; the sum p1 + p2 + p3 would come out p3, p1, p2
#ifndef QORN_1BASE_ERRORPARAMETER_H
#define QORN_1BASE_ERRORPARAMETER_H

#include "1Base/Strings/StringsParameter.h"
#include "1Base/TemplMeta/TemplMetaObjList.h"

namespace Error {

/// The same as Strings::buildNamedParameter.
template <class T>
constexpr Strings::CStaticNamedParameter<T> buildNamedParameter(char const* name, T const& value) {
    return Strings::buildNamedParameter(name, value);
}

/// No parameters.
constexpr TemplMeta::CNil inOrder() {
    return TemplMeta::CNil();
}

/// One parameter, as it is.
template <class T>
constexpr Strings::CStaticNamedParameter<T>
inOrder(Strings::CStaticNamedParameter<T> const& parameter) {
    return parameter;
}

/// The parameters in the order in which they are written.
template <class T, class... TOthers>
constexpr auto inOrder(Strings::CStaticNamedParameter<T> const& first, TOthers const&... others) {
    return first + inOrder(others...);
}

} // namespace Error

#endif
