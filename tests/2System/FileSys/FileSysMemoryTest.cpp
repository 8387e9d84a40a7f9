// What reads and changes a path is guarded: where memory runs out the failure is one of the family
// and names the function.

#include "2System/FileSys/FileSys.h"

#include "1Base/Error/ErrorExcChains.h"
#include "support/RaisedException.h"
#include "support/Registry.h"

#include <gtest/gtest.h>

#include <cstddef>
#include <cstdlib>
#include <new>
#include <string>

namespace {

// Larger blocks are refused while this is set.
std::size_t largestBlock = 0;

} // namespace

void* operator new(std::size_t size) {
    if (largestBlock != 0 && size > largestBlock)
        throw std::bad_alloc();
    if (void* const block = std::malloc(size))
        return block;
    throw std::bad_alloc();
}

void operator delete(void* block) noexcept {
    std::free(block);
}

void operator delete(void* block, std::size_t) noexcept {
    std::free(block);
}

namespace {

using FileSys::CFileSpec;
using TestSupport::CRaised;

class FileSysMemoryTest : public TestSupport::CErrorTest {
  protected:
    void TearDown() override {
        largestBlock = 0;
        CErrorTest::TearDown();
    }

    // What `call` raises where there is no room for another long text.
    template <class TCall>
    static CRaised raisedWithoutMemory(TCall const& call) {
        largestBlock = 100000;
        CRaised const raised = TestSupport::raisedBy<Error::TExcBadAllocException>(call);
        largestBlock = 0;
        return raised;
    }
};

std::wstring const longText(100000, L'x');

TEST_F(FileSysMemoryTest, EveryReaderAndWriterOfAPathIsGuarded) {
    CFileSpec const path(longText + L"/" + longText + L"." + longText);
    CFileSpec changed = path;
    struct {
        char const* function;
        CRaised raised;
    } const cases[] = {
        {"CFileSpec::getPath(", raisedWithoutMemory([&] { path.getPath(); })},
        {"CFileSpec::getFile(", raisedWithoutMemory([&] { path.getFile(); })},
        {"CFileSpec::getFile(", raisedWithoutMemory([&] { path.getFileName(); })},
        {"CFileSpec::getFileExtension(", raisedWithoutMemory([&] { path.getFileExtension(); })},
        {"CFileSpec::setFileExtension(",
         raisedWithoutMemory([&] { changed.setFileExtension(longText, false); })},
        {"CFileSpec::getBasePath(", raisedWithoutMemory([&] { path.getBasePath(path); })},
        {"CFileSpec::getRelativePath(",
         raisedWithoutMemory([&] { path.getRelativePath(CFileSpec()); })},
        {"CFileSpec::makeFileName(",
         raisedWithoutMemory([&] { CFileSpec::makeFileName(longText); })},
        {"CFileSpec::convertRelativeToAbsolutePath(",
         raisedWithoutMemory([&] { CFileSpec::convertRelativeToAbsolutePath(path, path); })}};
    for (auto const& [function, raised] : cases) {
        EXPECT_EQ(raised.name, "BadAllocException") << function;
        EXPECT_NE(raised.func.find(function), std::string::npos) << raised.func;
    }
    EXPECT_EQ(changed, path) << "a failure leaves the path as it was";
}

TEST_F(FileSysMemoryTest, AGuardedBlockFurtherOutAddsItselfToTheTrace) {
    CFileSpec const path(L"/" + longText);
    CRaised const raised = raisedWithoutMemory([&] { path.getFileName(); });
    ASSERT_EQ(raised.trace.size(), 1U);
    EXPECT_NE(raised.trace[0].find("CFileSpec::getFileName("), std::string::npos);
}

// The copy comes before the old record goes.
TEST_F(FileSysMemoryTest, AFailedAssignmentLeavesTheOldRecord) {
    FileSys::CFileInfo target(L"");
    FileSys::CFileInfo const source(L"/");
    largestBlock = 16;
    EXPECT_THROW(target = source, std::bad_alloc);
    largestBlock = 0;
    EXPECT_FALSE(target.exists());
    target = source;
    EXPECT_TRUE(target.exists());
}

} // namespace
