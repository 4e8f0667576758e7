// The shared object exports exactly the names of the family tables and the version query.
#include "frame/exports.hpp"

#include <gtest/gtest.h>

#include <cstdio>
#include <set>
#include <string>

TEST(ExportedNames, SharedObjectMatchesTables)
{
    std::set<std::string> want = {"zoxccGetLibVersion"};
#define ZT_NAME(name, ...) want.insert(#name);
    ZOX_ALL_EXPORTS(ZT_NAME)
#undef ZT_NAME

    const std::string cmd = std::string("nm -D --defined-only --format=posix '") + ZT_LIBRARY_PATH + "'";
    FILE* pipe = popen(cmd.c_str(), "r");
    ASSERT_NE(pipe, nullptr);
    std::set<std::string> got;
    char name[512], type[8];
    while (std::fscanf(pipe, "%511s %7s %*[^\n]", name, type) == 2)
        got.insert(name); // every defined symbol, of any kind
    ASSERT_EQ(pclose(pipe), 0);
    EXPECT_EQ(got, want);
}
