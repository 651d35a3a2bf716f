#pragma once

// Written on the Windows API alone, for whoever implements an interface of COM's.

#include <objbase.h>

#include <atomic>

/// The part of IUnknown that is the same for every object: counted references, one interface.
/// Make one with new and hand it out: it begins with the caller's reference and goes by its last
/// Release.
template <typename Interface>
class ComObject : public Interface {
public:
    explicit ComObject(REFIID iid) : m_iid(iid) {}
    ComObject(const ComObject&) = delete;
    ComObject& operator=(const ComObject&) = delete;

    HRESULT STDMETHODCALLTYPE QueryInterface(REFIID iid, void** object) final {
        if (!object)
            return E_POINTER;
        *object = nullptr;
        if (iid != IID_IUnknown && iid != m_iid)
            return E_NOINTERFACE;
        AddRef();
        *object = static_cast<Interface*>(this);
        return S_OK;
    }

    ULONG STDMETHODCALLTYPE AddRef() final { return ++m_references; }

    ULONG STDMETHODCALLTYPE Release() final {
        const ULONG left = --m_references;
        if (left == 0)
            delete this;
        return left;
    }

protected:
    virtual ~ComObject() = default;

private:
    const IID& m_iid; // one of the fixed ones
    std::atomic<ULONG> m_references = 1;
};
