#pragma once

#include "platform/com/ComObject.h"
#include "standins/office/inprocess/Applications.h"
#include "standins/office/inprocess/ModuleUse.h"

namespace standins {

/// The class object of an application: each instance is an application of its own.
class ClassFactory final : public ComObject<IClassFactory> {
public:
    explicit ClassFactory(const Application& application)
        : ComObject(IID_IClassFactory), m_application(application) {}

    HRESULT STDMETHODCALLTYPE CreateInstance(IUnknown* outer, REFIID iid, void** object) override;
    HRESULT STDMETHODCALLTYPE LockServer(BOOL lock) override;

private:
    const Application& m_application;
    ModuleUse m_use;
};

} // namespace standins
