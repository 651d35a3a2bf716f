#include "standins/office/server/excel/ExcelWorkbooks.h"

#include "standins/office/server/excel/ExcelWorkbook.h"

namespace standins {

namespace {

const std::vector<DocumentFormat> Formats = {
    {"xls", "MS Excel 97", "pdf:calc_pdf_Export"},
    {"xlsx", "Calc MS Excel 2007 XML", "pdf:calc_pdf_Export"},
};

// Arguments of Open. Those that are not named have no bearing: workbooks are read only, never
// updated from elsewhere, never listed.
constexpr UINT OpenFileName = 0;
constexpr UINT OpenFormat = 3;
constexpr UINT OpenPassword = 4;
constexpr UINT OpenWriteResPassword = 5;
constexpr UINT OpenDelimiter = 8;
constexpr UINT OpenConverter = 11;

} // namespace

const std::vector<Member>& ExcelWorkbooks::Members() const {
    static const std::vector<Member> members = {
        {682, DISPATCH_METHOD, L"Open", 1, 13, Handle<&ExcelWorkbooks::Open>},
    };
    return members;
}

void ExcelWorkbooks::Open(Call& call) {
    if (call.Has(OpenPassword) || call.Has(OpenWriteResPassword))
        throw Raised{L"Passwords are not supported."};
    if (call.Has(OpenFormat) || call.Has(OpenDelimiter) || call.Has(OpenConverter))
        throw Raised{L"The format of a workbook is told by its extension alone."};
    call.Return(
        MakeObject<ExcelWorkbook>(TheSession(), OpenedDocument(call.Text(OpenFileName), Formats)));
}

} // namespace standins
