#include <afxwin.h>

#include <utility>

namespace {

AFX_MODULE_STATE g_processState;
thread_local AFX_MODULE_STATE* t_moduleState = nullptr;

} // namespace

AFX_MODULE_STATE* AfxGetModuleState() {
    return t_moduleState ? t_moduleState : &g_processState;
}

AFX_MAINTAIN_STATE2::AFX_MAINTAIN_STATE2(AFX_MODULE_STATE* state) noexcept
    : m_previous(std::exchange(t_moduleState, state)) {}

AFX_MAINTAIN_STATE2::~AFX_MAINTAIN_STATE2() {
    t_moduleState = m_previous;
}

BOOL AfxWinInit(HINSTANCE instance, HINSTANCE previous, LPTSTR /*commandLine*/, int /*show*/) {
    return instance != nullptr && previous == nullptr;
}
