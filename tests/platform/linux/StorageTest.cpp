// Compound files and the limits of a process.

#include "tests/support/CompoundFile.h"
#include "tests/support/TemporaryFolder.h"

#include <ole2.h>
#include <windows.h>

#include <gtest/gtest.h>
#include <pthread.h>

namespace {

struct Opening {
    std::wstring path;
    HRESULT result;
};

void* Open(void* argument) {
    auto* opening = static_cast<Opening*>(argument);
    IStorage* storage = nullptr;
    opening->result = StgOpenStorage(opening->path.c_str(), nullptr,
                                     STGM_READ | STGM_SHARE_DENY_WRITE, nullptr, 0, &storage);
    if (storage)
        storage->Release();
    return nullptr;
}

/// The result of opening a storage on a thread with a small stack.
HRESULT OpenOnSmallStack(const std::wstring& path) {
    Opening opening{path, E_UNEXPECTED};
    pthread_attr_t attributes;
    pthread_attr_init(&attributes);
    pthread_attr_setstacksize(&attributes, 1 << 20);
    pthread_t thread{};
    if (pthread_create(&thread, &attributes, Open, &opening) == 0)
        pthread_join(thread, nullptr);
    pthread_attr_destroy(&attributes);
    return opening.result;
}

TEST(LinuxStorages, ADirectoryDoesNotUseUpStackOrTime) {
    const TemporaryFolder folder;
    const auto write = [&](int entries, bool isDegenerate) {
        CompoundFile file;
        for (int i = 0; i < entries; ++i) {
            std::u16string name = u"S";
            for (const char digit : std::to_string(i))
                name += static_cast<char16_t>(digit);
            file.AddStream(name, "");
        }
        if (isDegenerate) // a reader goes down one step a sibling
            file.MakeDirectoryDegenerate();
        return folder.Write("deep.doc", file.Bytes()).wstring();
    };
    EXPECT_EQ(S_OK, OpenOnSmallStack(write(900, true)));
    EXPECT_EQ(STG_E_DOCFILECORRUPT, OpenOnSmallStack(write(15000, true)));
    EXPECT_EQ(STG_E_DOCFILECORRUPT, OpenOnSmallStack(write(50000, true)));
    EXPECT_EQ(S_OK, OpenOnSmallStack(write(2000, false)));
    EXPECT_EQ(STG_E_DOCFILECORRUPT, OpenOnSmallStack(write(25000, false))); // a matter of time
}

} // namespace
