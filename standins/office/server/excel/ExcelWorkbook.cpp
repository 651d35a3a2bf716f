#include "standins/office/server/excel/ExcelWorkbook.h"

namespace standins {

const std::vector<Member>& ExcelWorkbook::Members() const {
    static const std::vector<Member> members = {
        {277, DISPATCH_METHOD, L"Close", 0, 3, Handle<&ExcelWorkbook::Close>},
    };
    return members;
}

/// What is to be saved does not matter: documents are never changed.
void ExcelWorkbook::Close(Call& /*call*/) {
    m_document.Close();
}

} // namespace standins
