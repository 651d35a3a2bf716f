#include "pstools/DistillerDevModeGuard.h"

#include "pstools/DistillerDevMode.h"
#include "tests/support/UserDevMode.h"

#include <gtest/gtest.h>

namespace {

using Bytes = std::vector<BYTE>;

const Bytes FixedRecord(DistillerDevMode.begin(), DistillerDevMode.end());

TEST(DistillerDevModeGuard, LeavesNoValueWhereThereWasNone) {
    UserDevMode user;
    {
        const DistillerDevModeGuard guard;
        EXPECT_EQ(FixedRecord, user.Bytes());
        EXPECT_EQ(DWORD{REG_BINARY}, user.Type());
    }
    EXPECT_FALSE(user.Exists());
}

TEST(DistillerDevModeGuard, BringsBackAValueOfAnyTypeAndSize) {
    const struct {
        DWORD type;
        Bytes bytes;
    } values[] = {
        {REG_BINARY, Bytes(DistillerDevModeSize, 0x5a)},
        {REG_BINARY, Bytes(2000, 0x5a)},
        {REG_BINARY, Bytes(3, 0x5a)},
        {REG_BINARY, {}},
        {REG_DWORD, {1, 2, 3, 4}},
        {REG_SZ, {'a', 0, 0, 0}},
    };
    for (const auto& value : values) {
        UserDevMode user;
        user.Set(value.type, value.bytes);
        {
            const DistillerDevModeGuard guard;
            EXPECT_EQ(FixedRecord, user.Bytes());
        }
        EXPECT_EQ(value.type, user.Type());
        EXPECT_EQ(value.bytes, user.Bytes());
    }
}

/// The record is data that no other code reads: sampled here against the fields of a DEVMODEW.
TEST(DistillerDevMode, HoldsItsFieldsWhereWindowsReadsThem) {
    const auto word = [](std::size_t offset) {
        return DistillerDevMode[offset] | DistillerDevMode[offset + 1] << 8;
    };
    EXPECT_EQ('A', word(0));
    EXPECT_EQ('r', word(32));
    EXPECT_EQ(0, word(34));
    EXPECT_EQ(0x0401, word(64));
    EXPECT_EQ(220, word(68));
    EXPECT_EQ(1260, word(70));
    EXPECT_EQ(0xEF53, word(72));
    EXPECT_EQ(0x0181, word(74));
    EXPECT_EQ(2794, word(80));
    EXPECT_EQ(1200, word(96));
    EXPECT_EQ('L', word(102));
    EXPECT_EQ(1, word(196));
    EXPECT_EQ(0x5250, word(220));
    EXPECT_EQ('d', word(990));
    EXPECT_EQ(0, word(992));
    // Any slip of a private byte shows in the sum of all.
    unsigned sum = 0;
    for (std::size_t i = 0; i < DistillerDevMode.size(); ++i)
        sum += static_cast<unsigned>(i + 1) * DistillerDevMode[i];
    EXPECT_EQ(3'060'612U, sum);
}

} // namespace
