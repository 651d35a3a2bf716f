#include <ole2.h>

namespace {

/// The ids of COM's own interfaces differ in their first field only.
constexpr GUID OleId(std::uint32_t number) {
    return {number, 0, 0, {0xC0, 0, 0, 0, 0, 0, 0, 0x46}};
}

} // namespace

extern "C" {

const IID IID_NULL{};
const IID IID_IUnknown = OleId(0x00000000);
const IID IID_IClassFactory = OleId(0x00000001);
const IID IID_IStorage = OleId(0x0000000B);
const IID IID_IStream = OleId(0x0000000C);
const IID IID_IDispatch = OleId(0x00020400);
}
