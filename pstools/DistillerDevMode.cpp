#include "pstools/DistillerDevMode.h"

#include <initializer_list>

namespace {

using Record = std::array<BYTE, DistillerDevModeSize>;

constexpr void Put16(Record& record, std::size_t offset, unsigned value) {
    record[offset] = static_cast<BYTE>(value);
    record[offset + 1] = static_cast<BYTE>(value >> 8U);
}

constexpr void Put32(Record& record, std::size_t offset, unsigned value) {
    Put16(record, offset, value);
    Put16(record, offset + 2, value >> 16U);
}

constexpr void PutText(Record& record, std::size_t offset, const char* ascii) {
    for (; *ascii; ++ascii, offset += 2)
        Put16(record, offset, static_cast<unsigned char>(*ascii));
}

constexpr void PutBytes(Record& record, std::size_t offset, std::initializer_list<BYTE> bytes) {
    for (const BYTE byte : bytes)
        record[offset++] = byte;
}

constexpr void PutPublicPart(Record& record) {
    PutText(record, 0, "Acrobat Distiller"); // dmDeviceName
    Put16(record, 64, 0x0401);               // dmSpecVersion
    Put16(record, 66, 0x0502);               // dmDriverVersion
    Put16(record, 68, 220);                  // dmSize
    Put16(record, 70, 1260);                 // dmDriverExtra
    Put32(record, 72, 0x0181EF53);           // dmFields
    Put16(record, 76, 1);                    // dmOrientation: portrait
    Put16(record, 78, 1);                    // dmPaperSize: Letter
    Put16(record, 80, 2794);                 // dmPaperLength, tenths of a millimetre
    Put16(record, 82, 2159);                 // dmPaperWidth
    Put16(record, 84, 100);                  // dmScale
    Put16(record, 86, 1);                    // dmCopies
    Put16(record, 88, 15);                   // dmDefaultSource: form source
    Put16(record, 90, 1200);                 // dmPrintQuality
    Put16(record, 92, 2);                    // dmColor: colour
    Put16(record, 94, 1);                    // dmDuplex: simplex
    Put16(record, 96, 1200);                 // dmYResolution
    Put16(record, 98, 3);                    // dmTTOption: download as outline
    Put16(record, 100, 1);                   // dmCollate
    PutText(record, 102, "Letter");          // dmFormName
    Put32(record, 180, 1);                   // dmNup: by the system
    Put32(record, 188, 1);                   // dmICMMethod: none
    Put32(record, 192, 2);                   // dmICMIntent: contrast
    Put32(record, 196, 1);                   // dmMediaType: standard
}

constexpr void PutPrivatePart(Record& record) {
    PutBytes(record, 220, {0x50, 0x52, 0x49, 0x56, 0xe2, 0x30}); // "PRIV"
    PutBytes(record, 308, {0x18});
    PutBytes(record, 314, {0x10, 0x27, 0x10, 0x27, 0x10, 0x27});
    PutBytes(record, 322, {0x10, 0x27});
    PutBytes(record, 334, {0xc4, 0x02});
    PutBytes(record, 360, {0x03});
    PutBytes(record, 368, {0x28, 0x02, 0x10});
    PutBytes(record, 372, {0x5c, 0x4b, 0x03});
    PutBytes(record, 376, {0x68, 0x43, 0x04});
    PutBytes(record, 408, {0x85, 0x83, 0xe3, 0xac, 0x05});
    PutBytes(record, 416, {0x04});
    PutBytes(record, 420, {0xff});
    PutBytes(record, 422, {0xff});
    PutBytes(record, 928, {0x28, 0x02});
    PutBytes(record, 932, {0x45, 0x42, 0x44, 0x41}); // "EBDA"
    for (const std::size_t offset : {938U, 944U, 948U, 952U})
        record[offset] = 0x01;
    PutText(record, 960, "OneFlowOptimized");
}

constexpr Record MakeDistillerDevMode() {
    Record record{};
    PutPublicPart(record);
    PutPrivatePart(record);
    return record;
}

} // namespace

constexpr Record DistillerDevMode = MakeDistillerDevMode();
