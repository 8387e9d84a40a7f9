/// Counts the platform's live objects in a test program.
#ifndef QORN_TESTS_OBJECTCOUNT_H
#define QORN_TESTS_OBJECTCOUNT_H

#include <gtest/gtest.h>

namespace TestSupport {

/// The number of platform objects alive now, and of all that were made so far.
long liveObjects();
long objectsMade();

/// A test that ends with as many live platform objects as it began with.
class CObjectCountTest : public testing::Test {
  protected:
    void SetUp() override { before_ = liveObjects(); }
    void TearDown() override { EXPECT_EQ(liveObjects(), before_ + expectedLeaks_); }

    /// For the paths that are bound to leave objects unreleased.
    void expectLeaks(long count) { expectedLeaks_ = count; }

  private:
    long before_ = 0;
    long expectedLeaks_ = 0;
};

} // namespace TestSupport

#endif
