#include "Zel_Message.h"

#include <QString>

#include <gtest/gtest.h>

TEST(Zel_MessageTest, HoldsItsText)
{
    Zel_Message copy;
    EXPECT_TRUE(static_cast<QString>(copy).isNull());
    copy = Zel_Message(QStringLiteral("hello"));
    EXPECT_EQ(static_cast<QString>(copy), QStringLiteral("hello"));
}
