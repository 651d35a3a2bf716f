#pragma once

#include "tests/support/CountedObject.h"

/// A class object whose only object lives in it.
class CountedFactory : public Counted<IClassFactory> {
public:
    CountedFactory() : Counted(IID_IClassFactory) {}

    HRESULT STDMETHODCALLTYPE CreateInstance(IUnknown* /*outer*/, REFIID iid,
                                             void** object) override {
        return product.QueryInterface(iid, object);
    }
    HRESULT STDMETHODCALLTYPE LockServer(BOOL /*lock*/) override { return S_OK; }

    Counted<IUnknown> product{IID_IUnknown};
};
