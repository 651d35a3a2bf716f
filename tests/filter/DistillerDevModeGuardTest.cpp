#include "pstools/DistillerDevModeGuard.h"

#include "pstools/DistillerDevMode.h"
#include "tests/support/UserDevMode.h"

#include <gtest/gtest.h>

namespace {

using Bytes = std::vector<BYTE>;

const Bytes FixedRecord(DistillerDevMode.begin(), DistillerDevMode.end());

TEST(DistillerDevModeGuard, LeavesNoValueWhereThereWasNone) {
    const UserDevMode user;
    {
        const DistillerDevModeGuard guard;
        EXPECT_EQ(FixedRecord, user.Bytes());
        EXPECT_EQ(DWORD{REG_BINARY}, user.Type());
    }
    EXPECT_FALSE(user.Exists());
}

TEST(DistillerDevModeGuard, BringsBackAValueOfAnyTypeAndSize) {
    for (const auto& [type, bytes] : {std::pair{DWORD{REG_BINARY}, Bytes(2000, 0x5a)},
                                      {REG_BINARY, {}},
                                      {REG_DWORD, {1, 2, 3, 4}},
                                      {REG_SZ, {'a', 0, 0, 0}}}) {
        UserDevMode user;
        user.Set(type, bytes);
        {
            const DistillerDevModeGuard guard;
            EXPECT_EQ(FixedRecord, user.Bytes());
        }
        EXPECT_EQ(type, user.Type());
        EXPECT_EQ(bytes, user.Bytes());
    }
}

} // namespace
