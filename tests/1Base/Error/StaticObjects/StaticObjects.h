/// A program whose own static objects use errors and logging before `main` and after it.
#ifndef QORN_TESTS_STATICOBJECTS_H
#define QORN_TESTS_STATICOBJECTS_H

#include "1Base/Error/Error.h"

namespace StaticObjects {

/// Uses everything that may fail or log when it is made and when it goes, and says so in one line
/// each. Ends the process with status 1 where something does not come out as it should. In between
/// an exception, an observer and a log target of its own are alive.
class CUser {
  public:
    explicit CUser(char const* name);
    ~CUser();
    CUser(CUser const&) = delete;
    CUser& operator=(CUser const&) = delete;

  private:
    class CCounter : public Error::CExcRegistry::CObserver, public Error::CLogTarget {
      public:
        void exceptionAdded(Error::CExcImplementation const* impl,
                            Error::CInfo const& info) const override;
        void exceptionRemoved(Error::CExcImplementation const* impl) const override;
        void write(char const* file, unsigned int line, char const* func, char const* date,
                   char const* time, char const* tag, char const* target, char const* severity,
                   Error::CMessage const& message) const override;

        mutable int added = 0;
        mutable int removed = 0;
        mutable int written = 0;
    };

    void use() const;
    void say(char const* when) const;

    char const* name_;
    CCounter counter_;
    Error::XExc<Error::TExcErrorAssert> alive_;
};

} // namespace StaticObjects

#endif
