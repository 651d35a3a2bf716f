#include "standins/office/inprocess/Applications.h"

namespace standins {

const std::vector<Application>& Applications() {
    static const std::vector<Application> applications = {
        {{0x4FCF94F6, 0x47C7, 0x49E5, {0xA4, 0x13, 0xEB, 0xE3, 0x33, 0x6F, 0xE5, 0x85}},
         L"Word.Application",
         L"Word, served by LibreOffice",
         {"libswlo.so"},
         StartWord},
        {{0x111CA3CB, 0xD64A, 0x4DD7, {0x9A, 0x0F, 0x63, 0xC1, 0x02, 0x32, 0xBF, 0xEC}},
         L"Excel.Application",
         L"Excel, served by LibreOffice",
         {"libsclo.so"},
         StartExcel},
        {{0xFB1FDA8C, 0xEE57, 0x4938, {0x87, 0x8B, 0xB5, 0x7A, 0x25, 0x51, 0xD5, 0x53}},
         L"PowerPoint.Application",
         L"PowerPoint, served by LibreOffice",
         {"libsdlo.so"},
         StartPowerPoint},
        {{0x6DB2C1F6, 0x5C0B, 0x4C94, {0x9B, 0x1D, 0x5A, 0x0E, 0x7F, 0x3C, 0xD8, 0x42}},
         L"Publisher.Application",
         L"Publisher, served by LibreOffice",
         {"libsdlo.so", "libwpftdrawlo.so"}, // Draw, and its import of publications
         StartPublisher},
    };
    return applications;
}

} // namespace standins
