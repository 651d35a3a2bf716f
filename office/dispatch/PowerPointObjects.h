#pragma once

#include "office/dispatch/DispatchWrapper.h"

// PowerPoint's objects. Yes and no are the numbers 1 and 0.

namespace powerpoint {

class Presentation : public DispatchWrapper {
public:
    using DispatchWrapper::DispatchWrapper;

    void Close();
};

class Presentations : public DispatchWrapper {
public:
    using DispatchWrapper::DispatchWrapper;

    Presentation Open(LPCTSTR fileName, LONG readOnly, LONG untitled, LONG withWindow);
};

class Application : public DispatchWrapper {
public:
    using DispatchWrapper::DispatchWrapper;

    Presentations GetPresentations();
    void Quit();
};

} // namespace powerpoint
