#include "support/test_core.hpp"
#include "zoxcc.h"

#include <gtest/gtest.h>

#include <cstring>

TEST(Version, RecordFollowsFeature128)
{
    zt::core::feature128 = 0;
    const LibraryVersion* plain = zoxccGetLibVersion();
    EXPECT_EQ(plain, zoxccGetLibVersion()) << "same pointer while the answer stays";
    zt::core::feature128 = 1;
    const LibraryVersion* plus = zoxccGetLibVersion();
    zt::core::feature128 = 0;

    EXPECT_STREQ(plain->name, "zoxCC SSE4.1/4.2 (p8)");
    EXPECT_STREQ(plus->name, "zoxCC SSE4.1/4.2 (p8)+");
    for (const LibraryVersion* v : {plain, plus}) {
        EXPECT_EQ(v->major, 8);
        EXPECT_EQ(v->minor, 2);
        EXPECT_EQ(v->update, 1);
        EXPECT_EQ(v->revision, 44077);
        uint32_t code;
        std::memcpy(&code, v->targetCode, 4);
        EXPECT_EQ(code, 0x3870u);
        EXPECT_STREQ(v->versionText, "8.2.1 (r44077)");
        EXPECT_STREQ(v->buildDate, "Oct  9 2014");
    }
}

TEST(Version, FeatureWordAskedOnceAtLoad)
{
    EXPECT_EQ(zt::core::featureWordCalls.load(), 1);
}
