/// Watching the exception registry in tests.
#ifndef QORN_TESTS_REGISTRY_H
#define QORN_TESTS_REGISTRY_H

#include "1Base/Error/ErrorExc.h"

#include "support/ObjectCount.h"

#include <vector>

namespace TestSupport {

inline Error::CExcRegistry& registry() {
    return *Error::CExcImplementation::accessRegistry();
}

inline std::vector<Error::CExcImplementation const*> liveExceptions() {
    return registry().getExceptions();
}

/// Registers an observer while it lives.
class CRegisteredObserver {
  public:
    explicit CRegisteredObserver(Error::CExcRegistry::CObserver const& observer)
        : observer_(observer) {
        registry().registerObserver(&observer_);
    }
    ~CRegisteredObserver() { registry().unregisterObserver(&observer_); }

    CRegisteredObserver(CRegisteredObserver const&) = delete;
    CRegisteredObserver& operator=(CRegisteredObserver const&) = delete;

  private:
    Error::CExcRegistry::CObserver const& observer_;
};

/// A test that ends with as many live exceptions and platform objects as it began with.
class CErrorTest : public CObjectCountTest {
  protected:
    void SetUp() override {
        CObjectCountTest::SetUp();
        ASSERT_TRUE(liveExceptions().empty());
    }
    void TearDown() override {
        EXPECT_TRUE(liveExceptions().empty());
        CObjectCountTest::TearDown();
    }
};

} // namespace TestSupport

#endif
