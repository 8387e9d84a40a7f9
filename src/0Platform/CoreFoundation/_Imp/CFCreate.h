/// Making objects whose members have destructors.
#ifndef QORN_0PLATFORM_CFCREATE_H
#define QORN_0PLATFORM_CFCREATE_H

#include "0Platform/CoreFoundation/_Imp/CFObject.h"

#include <new>
#include <type_traits>
#include <utility>

namespace CFPlatform {

template <class TObject>
void destroy(Object& object) {
    static_cast<TObject&>(object).~TObject();
}

/// A new object with one owner; null without memory.
template <class TObject, class... TArguments>
TObject* createObject(TArguments&&... arguments) {
    static_assert(std::is_nothrow_constructible_v<TObject, Object::TFinalize, TArguments&&...>);
    void* const memory = CFObjectAllocate_(sizeof(TObject));
    if (memory == nullptr)
        return nullptr;
    return new (memory) TObject(destroy<TObject>, std::forward<TArguments>(arguments)...);
}

/// What `call` returns, or null where its memory is short: no exception leaves the platform.
template <class TCall>
auto nullWithoutMemory(TCall const& call) noexcept -> decltype(call()) {
    try {
        return call();
    } catch (std::bad_alloc const&) {
        return nullptr;
    }
}

} // namespace CFPlatform

#endif
