#include <afxdisp.h>

#include <cwchar>

namespace {

BOOL CopyMessage(const std::wstring& message, LPTSTR buffer, UINT size) {
    if (size == 0)
        return FALSE;
    const std::size_t length = message.copy(buffer, size - 1);
    buffer[length] = L'\0';
    return !message.empty();
}

} // namespace

BOOL CException::GetErrorMessage(LPTSTR buffer, UINT size) const {
    return CopyMessage({}, buffer, size);
}

void CException::Delete() {
    delete this;
}

BOOL COleException::GetErrorMessage(LPTSTR buffer, UINT size) const {
    wchar_t code[32];
    std::swprintf(code, 32, L"COM error 0x%08X", static_cast<unsigned>(m_sc));
    return CopyMessage(code, buffer, size);
}

BOOL COleDispatchException::GetErrorMessage(LPTSTR buffer, UINT size) const {
    return CopyMessage(m_strDescription.GetString(), buffer, size);
}

void AfxThrowMemoryException() {
    throw new CMemoryException; // NOLINT(misc-throw-by-value-catch-by-reference): as MFC does
}

void AfxThrowOleException(SCODE sc) {
    auto* exception = new COleException;
    exception->m_sc = sc;
    throw exception; // NOLINT(misc-throw-by-value-catch-by-reference): as MFC does
}
