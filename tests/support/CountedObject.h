#pragma once

#include <ole2.h>

#include <string>
#include <vector>

/// A COM object of one interface that counts its references; the first one is its maker's. It
/// stays when the last one goes, unless a class below sees to that.
template <typename Interface>
class Counted : public Interface {
public:
    explicit Counted(REFIID iid = IID_IUnknown) : m_iid(iid) {}
    virtual ~Counted() = default;
    Counted(const Counted&) = delete;
    Counted& operator=(const Counted&) = delete;

    HRESULT STDMETHODCALLTYPE QueryInterface(REFIID iid, void** object) override {
        const bool isKnown = iid == IID_IUnknown || iid == m_iid;
        *object = isKnown ? static_cast<Interface*>(this) : nullptr;
        if (!isKnown)
            return E_NOINTERFACE;
        AddRef();
        return S_OK;
    }
    ULONG STDMETHODCALLTYPE AddRef() override { return ++m_references; }
    ULONG STDMETHODCALLTYPE Release() override {
        const ULONG left = --m_references;
        if (left == 0)
            LastReferenceGone();
        return left;
    }

    ULONG References() const { return m_references; }

protected:
    virtual void LastReferenceGone() {}

private:
    const IID m_iid;
    ULONG m_references = 1;
};

/// An automation object whose members are called by number alone.
class CountedDispatch : public Counted<IDispatch> {
public:
    CountedDispatch() : Counted(IID_IDispatch) {}

    HRESULT STDMETHODCALLTYPE GetTypeInfoCount(UINT* /*count*/) override { return E_NOTIMPL; }
    HRESULT STDMETHODCALLTYPE GetTypeInfo(UINT /*index*/, LCID /*locale*/,
                                          ITypeInfo** /*info*/) override {
        return E_NOTIMPL;
    }
    HRESULT STDMETHODCALLTYPE GetIDsOfNames(REFIID /*reserved*/, LPOLESTR* /*names*/,
                                            UINT /*count*/, LCID /*locale*/,
                                            DISPID* /*ids*/) override {
        return E_NOTIMPL;
    }
};

/// A class object whose only object lives in it.
template <typename Product>
class CountedFactory : public Counted<IClassFactory> {
public:
    CountedFactory() : Counted(IID_IClassFactory) {}

    HRESULT STDMETHODCALLTYPE CreateInstance(IUnknown* /*outer*/, REFIID iid,
                                             void** object) override {
        return product.QueryInterface(iid, object);
    }
    HRESULT STDMETHODCALLTYPE LockServer(BOOL /*lock*/) override { return S_OK; }

    Product product;
};

/// The texts among a call's arguments, which come the last first.
inline std::vector<std::wstring> TextsOf(const DISPPARAMS& arguments) {
    std::vector<std::wstring> texts;
    for (UINT i = arguments.cArgs; i-- > 0;) {
        const VARIANT* value = &arguments.rgvarg[i];
        if (value->vt == (VT_VARIANT | VT_BYREF))
            value = value->pvarVal;
        if (value->vt == VT_BSTR && value->bstrVal)
            texts.emplace_back(value->bstrVal);
    }
    return texts;
}
