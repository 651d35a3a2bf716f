#include <afxdisp.h>

void CException::Delete() {
    delete this;
}

void AfxThrowMemoryException() {
    throw new CMemoryException; // NOLINT(misc-throw-by-value-catch-by-reference): as MFC does
}

void AfxThrowOleException(SCODE sc) {
    auto* exception = new COleException;
    exception->m_sc = sc;
    throw exception; // NOLINT(misc-throw-by-value-catch-by-reference): as MFC does
}
