#include "office/dispatch/PowerPointObjects.h"

namespace powerpoint {

void Presentation::Close() {
    Call(2039, VTS_NONE);
}

Presentation Presentations::Open(LPCTSTR fileName, LONG readOnly, LONG untitled, LONG withWindow) {
    return CallForObject<Presentation>(2004, VTS_BSTR VTS_I4 VTS_I4 VTS_I4, fileName, readOnly,
                                       untitled, withWindow);
}

Presentations Application::GetPresentations() {
    return GetObjectProperty<Presentations>(2001);
}

void Application::Quit() {
    Call(2021, VTS_NONE);
}

} // namespace powerpoint
