#pragma once

#include "standins/office/server/Applications.h"
#include "standins/office/server/ModuleUse.h"

#include <atomic>

namespace standins {

/// The class object of an application: each instance is an application of its own.
class ClassFactory final : public IClassFactory {
public:
    explicit ClassFactory(const Application& application) : m_application(application) {}
    ClassFactory(const ClassFactory&) = delete;
    ClassFactory& operator=(const ClassFactory&) = delete;

    HRESULT STDMETHODCALLTYPE QueryInterface(REFIID iid, void** object) override;
    ULONG STDMETHODCALLTYPE AddRef() override;
    ULONG STDMETHODCALLTYPE Release() override;
    HRESULT STDMETHODCALLTYPE CreateInstance(IUnknown* outer, REFIID iid, void** object) override;
    HRESULT STDMETHODCALLTYPE LockServer(BOOL lock) override;

private:
    const Application& m_application;
    std::atomic<ULONG> m_references = 1;
    ModuleUse m_use;
};

} // namespace standins
