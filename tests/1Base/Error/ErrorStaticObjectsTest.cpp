// Static objects may raise, log and assert before `main` and after it.

#include <gtest/gtest.h>

#include <sys/wait.h>

#include <cstdio>
#include <string>

namespace {

TEST(CErrorStaticObjectsTest, StaticObjectsMayFailAndLogAtStartAndAtExit) {
    std::FILE* const pipe = ::popen("'" STATIC_OBJECTS_PROGRAM "'", "r");
    ASSERT_NE(pipe, nullptr);
    std::string output;
    for (int c = std::fgetc(pipe); c != EOF; c = std::fgetc(pipe))
        output += static_cast<char>(c);
    int const status = ::pclose(pipe);
    EXPECT_TRUE(WIFEXITED(status));
    EXPECT_EQ(WEXITSTATUS(status), 0);
    EXPECT_EQ(output, "early start\nlate start\nmain\nlate end\nearly end\nlast start\nlast end\n");
}

} // namespace
