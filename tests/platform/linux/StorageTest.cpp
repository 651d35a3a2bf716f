// Compound files and the limits of a process.

#include "office/ComPointer.h"
#include "tests/support/CompoundFile.h"
#include "tests/support/TemporaryFolder.h"
#include "tests/support/linux/ResourceLimit.h"

#include <ole2.h>

#include <gtest/gtest.h>

namespace {

HRESULT Open(const std::filesystem::path& path) {
    const ResourceLimit smallStack(RLIMIT_STACK, 1 << 20); // as a thread of its own may have it
    ComPointer<IStorage> storage;
    return StgOpenStorage(path.wstring().c_str(), nullptr, STGM_READ | STGM_SHARE_DENY_WRITE,
                          nullptr, 0, storage.Receive());
}

TEST(LinuxStorages, ADirectoryDoesNotUseUpStackOrTime) {
    const struct {
        int entries;
        bool isDegenerate; // a reader goes down one step a sibling
        HRESULT result;
    } cases[] = {
        {900, true, S_OK},
        {15000, true, STG_E_DOCFILECORRUPT},
        {50000, true, STG_E_DOCFILECORRUPT},
        {2000, false, S_OK},
        {25000, false, STG_E_DOCFILECORRUPT}, // a matter of time
    };
    const TemporaryFolder folder;
    for (const auto& expected : cases) {
        CompoundFile file;
        for (int i = 0; i < expected.entries; ++i) {
            const std::string digits = std::to_string(i);
            file.AddStream(std::u16string(digits.begin(), digits.end()), "");
        }
        if (expected.isDegenerate)
            file.MakeDirectoryDegenerate();
        EXPECT_EQ(expected.result, Open(folder.Write("deep.doc", file.Bytes())))
            << expected.entries << " entries";
    }
}

} // namespace
