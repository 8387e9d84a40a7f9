/// The lazily made instance of any default-constructible class.
///
///     CRegister& theRegister = StdUtil::CSingleton::get<CRegister>();
///
/// `get` takes no lock: the first call for a type must not race with another one. Once it has
/// returned, calls are safe on any thread. No instance is destroyed when the process ends, so one
/// may be used, and even made, while other static objects are destroyed.
#ifndef QORN_1BASE_STDUTILSINGLETON_H
#define QORN_1BASE_STDUTILSINGLETON_H

#include "1Base/Error/ErrorMacros.h"

#include <cstddef>
#include <memory>
#include <vector>

namespace StdUtil {
namespace Detail {
class CSingletonWrapperBase;
}

/// Knows the order of events; TTraits knows where things are kept and how they are made.
template <class TTraits>
class CSingletonManager {
  public:
    /// The instance, made now if there is none. What its constructor throws passes, and the next
    /// call tries again.
    template <class TSingleton>
    static TSingleton& get();

    /// The slot of one type, null until it is filled.
    template <class TSingleton>
    static TSingleton*& get_() {
        return TTraits::template get_<TSingleton>();
    }

    /// All instances made so far, in the order of their making.
    static std::vector<Detail::CSingletonWrapperBase*>& getSingletons() {
        return TTraits::getSingletons();
    }

    /// Fills the slot, which must be empty: otherwise the assertion fails.
    template <class TSingleton>
    static void instantiate() {
        TSingleton* const s = get_<TSingleton>();
        ERROR_ASSERT(s == NULL);
        get_<TSingleton>() = TTraits::template createInstance<TSingleton>();
    }

    /// Empties the slot and deletes what was in it.
    template <class TSingleton>
    static void deInstantiate() {
        TSingleton*& slot = get_<TSingleton>();
        slot = TTraits::template deleteInstance<TSingleton>(slot);
    }
};

namespace Detail {

/// An instance's place in the list of all.
class CSingletonWrapperBase {
  public:
    virtual ~CSingletonWrapperBase() = default;

  protected:
    template <class TTraits, class TSingleton>
    static void instantiate() {
        CSingletonManager<TTraits>::template instantiate<TSingleton>();
    }

    template <class TTraits, class TSingleton>
    static void deInstantiate() {
        CSingletonManager<TTraits>::template deInstantiate<TSingleton>();
    }
};

/// Makes the instance and unmakes it; a failure while unmaking ends the process.
template <class TTraits, class TSingleton>
class CSingletonWrapper : public CSingletonWrapperBase {
  public:
    CSingletonWrapper() { instantiate<TTraits, TSingleton>(); }
    CSingletonWrapper(CSingletonWrapper const&) = delete;
    CSingletonWrapper& operator=(CSingletonWrapper const&) = delete;
    ~CSingletonWrapper() override { deInstantiate<TTraits, TSingleton>(); }
};

} // namespace Detail

template <class TTraits>
template <class TSingleton>
TSingleton& CSingletonManager<TTraits>::get() {
    if (get_<TSingleton>() == nullptr) {
        std::vector<Detail::CSingletonWrapperBase*>& singletons = getSingletons();
        auto wrapper = std::make_unique<Detail::CSingletonWrapper<TTraits, TSingleton>>();
        singletons.push_back(wrapper.get());
        wrapper.release();
    }
    return *get_<TSingleton>();
}

/// The traits in use, and the entry for callers.
class CSingleton {
  public:
    /// The type's instance, made at the first call.
    template <class TSingleton>
    static TSingleton& get() {
        return CSingletonManager<CSingleton>::get<TSingleton>();
    }

    /// The slot of one type.
    template <class TSingleton>
    static TSingleton*& get_() {
        static TSingleton* singleton_ = nullptr;
        return singleton_;
    }

    /// All instances made so far, of all types.
    static std::vector<Detail::CSingletonWrapperBase*>& getSingletons();

    /// A new instance; the caller owns it.
    template <class TSingleton>
    static TSingleton* createInstance() {
        return new TSingleton;
    }

    /// Deletes the instance, if there is one, and returns null.
    template <class TSingleton>
    static TSingleton* deleteInstance(TSingleton* instance) {
        delete instance;
        return nullptr;
    }
};

} // namespace StdUtil

#endif
