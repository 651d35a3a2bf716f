#include "standins/office/inprocess/ClassFactory.h"

#include <exception>

namespace standins {

HRESULT ClassFactory::CreateInstance(IUnknown* outer, REFIID iid, void** object) {
    if (!object)
        return E_POINTER;
    *object = nullptr;
    if (outer)
        return CLASS_E_NOAGGREGATION;
    try {
        IDispatch* application = m_application.start();
        const HRESULT result = application->QueryInterface(iid, object);
        application->Release();
        return result;
    } catch (const std::exception&) {
        return E_OUTOFMEMORY;
    }
}

HRESULT ClassFactory::LockServer(BOOL lock) {
    LockModule(lock != FALSE);
    return S_OK;
}

} // namespace standins
