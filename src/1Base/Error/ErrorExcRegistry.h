/// The registry of live exceptions, and those who watch it.
#ifndef QORN_1BASE_ERROREXCREGISTRY_H
#define QORN_1BASE_ERROREXCREGISTRY_H

#include <vector>

namespace Error {

class CExcImplementation;
class CInfo;

/// Knows the exceptions of the family that are alive, at most 127 at a time: where there are more,
/// the 65th oldest is forgotten for each new one, without notice. Reached by
/// CExcImplementation::accessRegistry(). It owns neither exceptions nor observers.
///
/// All operations but begin and end lock the registry, also while observers run.
class CExcRegistry {
  public:
    /// Told when an exception comes and goes. It runs under the registry's lock, on the thread of
    /// the exception: it must not raise an exception of the family, nor register or unregister.
    /// What it throws is caught and told to std::cerr.
    class CObserver {
      public:
        virtual ~CObserver() = default;

        /// @{
        /// `impl` is being built: an identity, and not to be followed. `info` is what it says, or
        /// what the exception that it wraps says.
        virtual void exceptionAdded(CExcImplementation const* impl, CInfo const& info) const = 0;
        virtual void exceptionRemoved(CExcImplementation const* impl) const = 0;
        /// @}
    };

    virtual ~CExcRegistry() = default;

    /// A copy of the entries, the oldest first: identities that other threads may end at any time.
    virtual std::vector<CExcImplementation const*> getExceptions() const = 0;

    /// Appends the observer and logs it. One that is registered twice is told twice.
    virtual void registerObserver(CObserver const* observer) const = 0;

    /// Removes the first equal observer and logs it; an unknown one changes nothing.
    virtual void unregisterObserver(CObserver const* observer) const = 0;

    /// @{
    /// For the constructors and the destructor of exceptions alone. `removeException_` says whether
    /// the exception was still known.
    virtual void addException_(CExcImplementation const* impl, CInfo const& info) = 0;
    virtual bool removeException_(CExcImplementation const* impl) = 0;
    /// @}

    /// @{
    /// The pointer in the first slot, and the one in the slot behind the last entry: contents, not
    /// positions, and read without the lock.
    virtual CExcImplementation const* begin() const = 0;
    virtual CExcImplementation const* end() const = 0;
    /// @}
};

} // namespace Error

#endif
