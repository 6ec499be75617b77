#include "VtableSlot.h"

#include "Zel_Error.h"

#include <QString>

#include <gtest/gtest.h>

TEST(Zel_ErrorTest, MinusOneAloneMeansNoErrorEvenThroughAnOverriddenCode)
{
    EXPECT_FALSE(Zel_Error().isError());
    EXPECT_EQ(Zel_Error().getCode(), -1);
    for (int code : {0, 42, -2})
        EXPECT_TRUE(Zel_Error(code, QStringLiteral("x")).isError()) << code;
    EXPECT_FALSE(Zel_Error(-1, QStringLiteral("message but no error")).isError());
    EXPECT_FALSE(Zel_Error(13, QStringLiteral("denied")).isPrivilegeError());

    Zel_Error error(5, QStringLiteral("five"));
    error.setCode(-1);
    EXPECT_FALSE(error.isError());
    Zel_Error& self = error;
    error = self;
    EXPECT_EQ(error.getMsg(), QStringLiteral("five"));

    struct AlwaysOk : Zel_Error {
        AlwaysOk() : Zel_Error(7, QStringLiteral("stored")) {}
        const int getCode() const override { return -1; }
        bool isPrivilegeError() const override { return true; }
    };
    const AlwaysOk alwaysOk;
    const Zel_Error& asBase = alwaysOk;
    EXPECT_FALSE(asBase.isError());
    EXPECT_TRUE(asBase.isPrivilegeError());

    EXPECT_EQ(slotsOutOfOrder(2, {ZEL_SLOT_ROW(Zel_Error, setMsg), ZEL_SLOT_ROW(Zel_Error, getMsg),
                                  ZEL_SLOT_ROW(Zel_Error, setCode), ZEL_SLOT_ROW(Zel_Error, getCode),
                                  ZEL_SLOT_ROW(Zel_Error, isError), ZEL_SLOT_ROW(Zel_Error, isPrivilegeError)}),
              "");
}
