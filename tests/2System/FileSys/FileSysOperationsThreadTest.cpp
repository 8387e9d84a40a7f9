// Temporary files that several threads make at once.

#include "2System/FileSys/FileSysTempFile.h"

#include "support/FileRoot.h"

#include <gtest/gtest.h>

#include <cstddef>
#include <set>
#include <string>
#include <thread>
#include <vector>

namespace {

using FileSys::CFileSpec;

using CTempFileThreadTest = TestSupport::CFileRootTest;

TEST_F(CTempFileThreadTest, ThreadsGetFilesAndFoldersOfTheirOwn) {
    constexpr std::size_t threadCount = 8;
    constexpr std::size_t fileCount = 50;
    CFileSpec const hint(path("name"));
    std::vector<std::vector<CFileSpec>> made(threadCount);
    std::vector<std::thread> threads;
    for (std::vector<CFileSpec>& specs : made)
        threads.emplace_back([&specs, &hint] {
            for (std::size_t i = 0; i < fileCount; ++i) {
                specs.push_back(FileSys::createTempFile(hint));
                specs.push_back(FileSys::createTempFolder(hint));
            }
        });
    for (std::thread& thread : threads)
        thread.join();
    std::set<CFileSpec> unique;
    for (std::vector<CFileSpec> const& specs : made)
        unique.insert(specs.begin(), specs.end());
    EXPECT_EQ(unique.size(), 2 * threadCount * fileCount);
    EXPECT_EQ(TestSupport::listTree(path()).size(), 2 * threadCount * fileCount);
}

} // namespace
