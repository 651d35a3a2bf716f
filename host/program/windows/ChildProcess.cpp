#include "host/program/system/ChildProcess.h"

#include "host/program/base/PathText.h"
#include "host/program/base/ProgramFiles.h"

#include <windows.h>

#include <fcntl.h>
#include <io.h>

#include <array>
#include <cstdlib>

namespace {

/// Closes a handle with its owner.
using Handle = std::unique_ptr<void, decltype(&CloseHandle)>;

struct Pipe {
    Handle from{nullptr, CloseHandle};
    Handle to{nullptr, CloseHandle};

    bool Open() {
        HANDLE ends[2] = {};
        if (!CreatePipe(&ends[0], &ends[1], nullptr, 0))
            return false;
        from.reset(ends[0]);
        to.reset(ends[1]);
        return true;
    }

    /// Hands an end on as a stream.
    static std::FILE* Stream(Handle& end, const char* mode) {
        const int descriptor =
            _open_osfhandle(reinterpret_cast<intptr_t>(end.release()), _O_BINARY);
        return descriptor < 0 ? nullptr : _fdopen(descriptor, mode);
    }
};

/// As CommandLineToArgvW takes words apart.
wxString Quoted(const wxString& word) {
    wxString quoted = '"';
    std::size_t backslashes = 0;
    for (const wxUniChar c : word) {
        if (c == '"')
            quoted += wxString('\\', backslashes + 1);
        backslashes = c == '\\' ? backslashes + 1 : 0;
        quoted += c;
    }
    return quoted + wxString('\\', backslashes) + '"';
}

wxString CommandLineFor(const std::vector<std::string>& arguments) {
    wxString line = Quoted(ToText(ProgramFile()));
    for (const std::string& argument : arguments)
        line << ' ' << Quoted(wxString::FromUTF8(argument));
    return line;
}

/// What is in it ends with this process, however that ends. It has it for as long as it lives.
HANDLE Job() {
    static const HANDLE s_job = [] {
        HANDLE job = CreateJobObjectW(nullptr, nullptr);
        JOBOBJECT_EXTENDED_LIMIT_INFORMATION limits = {};
        limits.BasicLimitInformation.LimitFlags = JOB_OBJECT_LIMIT_KILL_ON_JOB_CLOSE;
        SetInformationJobObject(job, JobObjectExtendedLimitInformation, &limits, sizeof limits);
        return job;
    }();
    return s_job;
}

/// Lets a child have these handles, and no other that may be inherited at this moment, and has it
/// in the job from its beginning: one put there afterwards would be left over, suspended, by an end
/// of this process in between.
class ChildAttributes {
public:
    explicit ChildAttributes(std::array<HANDLE, 3> handles) : m_handles(handles) {
        for (HANDLE handle : m_handles)
            SetHandleInformation(handle, HANDLE_FLAG_INHERIT, HANDLE_FLAG_INHERIT);
        constexpr DWORD Count = 2;
        SIZE_T size = 0;
        InitializeProcThreadAttributeList(nullptr, Count, 0, &size);
        m_bytes.resize(size);
        m_ready = InitializeProcThreadAttributeList(List(), Count, 0, &size) &&
                  UpdateProcThreadAttribute(List(), 0, PROC_THREAD_ATTRIBUTE_HANDLE_LIST,
                                            m_handles.data(), sizeof m_handles, nullptr, nullptr) &&
                  UpdateProcThreadAttribute(List(), 0, PROC_THREAD_ATTRIBUTE_JOB_LIST, &m_job,
                                            sizeof m_job, nullptr, nullptr);
    }
    ~ChildAttributes() { DeleteProcThreadAttributeList(List()); }
    ChildAttributes(const ChildAttributes&) = delete;
    ChildAttributes& operator=(const ChildAttributes&) = delete;

    bool IsReady() const { return m_ready; }
    LPPROC_THREAD_ATTRIBUTE_LIST List() {
        return reinterpret_cast<LPPROC_THREAD_ATTRIBUTE_LIST>(m_bytes.data());
    }

private:
    std::array<HANDLE, 3> m_handles;
    HANDLE m_job = Job();
    std::vector<char> m_bytes;
    bool m_ready = false;
};

/// @return the process's handle, or null
HANDLE Spawn(const std::vector<std::string>& arguments, HANDLE in, HANDLE out) {
    HANDLE err = GetStdHandle(STD_ERROR_HANDLE);
    ChildAttributes attributes({in, out, err});
    if (!attributes.IsReady())
        return nullptr;
    STARTUPINFOEXW startup = {};
    startup.StartupInfo.cb = sizeof startup;
    startup.StartupInfo.dwFlags = STARTF_USESTDHANDLES;
    startup.StartupInfo.hStdInput = in;
    startup.StartupInfo.hStdOutput = out;
    startup.StartupInfo.hStdError = err;
    startup.lpAttributeList = attributes.List();
    std::wstring line = CommandLineFor(arguments).ToStdWstring();
    PROCESS_INFORMATION process = {};
    // A group of its own begins without Ctrl-C: it must not end before it knows what that means.
    constexpr DWORD Flags = EXTENDED_STARTUPINFO_PRESENT | CREATE_NEW_PROCESS_GROUP;
    if (!CreateProcessW(nullptr, line.data(), nullptr, nullptr, TRUE, Flags, nullptr, nullptr,
                        &startup.StartupInfo, &process))
        return nullptr;
    CloseHandle(process.hThread);
    return process.hProcess;
}

} // namespace

std::unique_ptr<ChildProcess> ChildProcess::Start(const std::vector<std::string>& arguments,
                                                  Fault& fault) {
    Pipe down;
    Pipe up;
    HANDLE process =
        down.Open() && up.Open() ? Spawn(arguments, down.from.get(), up.to.get()) : nullptr;
    if (!process) {
        fault = {Because({static_cast<int>(GetLastError()), std::system_category()}),
                 Blame::Machine};
        return nullptr;
    }
    LineChannel channel(Pipe::Stream(up.from, "rb"), Pipe::Stream(down.to, "wb"));
    return std::unique_ptr<ChildProcess>(
        new ChildProcess(reinterpret_cast<std::intptr_t>(process), std::move(channel)));
}

ChildProcess::~ChildProcess() {
    Kill();
    Wait();
}

void ChildProcess::Kill() const {
    if (m_process != None)
        TerminateProcess(reinterpret_cast<HANDLE>(m_process), 1);
}

Fault ChildProcess::Wait() {
    constexpr DWORD EndedByTaskManager = 1; // and by taskkill; this program never ends so itself
    DWORD code = 0;
    if (m_process != None) {
        HANDLE process = reinterpret_cast<HANDLE>(m_process);
        WaitForSingleObject(process, INFINITE);
        GetExitCodeProcess(process, &code);
        CloseHandle(process);
        m_process = None;
    }
    return {wxString::Format("ended with exit code %lu", code),
            code == EndedByTaskManager ? Blame::Outside : Blame::Document};
}

LineChannel TakeStandardStreams() {
    const int in = _dup(_fileno(stdin));
    const int out = _dup(_fileno(stdout));
    for (const int descriptor : {in, out}) {
        _setmode(descriptor, _O_BINARY);
        SetHandleInformation(reinterpret_cast<HANDLE>(_get_osfhandle(descriptor)),
                             HANDLE_FLAG_INHERIT, 0);
    }
    _dup2(_fileno(stderr), _fileno(stdout));
    const int nothing = _open("NUL", _O_RDONLY);
    _dup2(nothing, _fileno(stdin));
    _close(nothing);
    SetStdHandle(STD_INPUT_HANDLE, reinterpret_cast<HANDLE>(_get_osfhandle(_fileno(stdin))));
    SetStdHandle(STD_OUTPUT_HANDLE, reinterpret_cast<HANDLE>(_get_osfhandle(_fileno(stdout))));
    return {_fdopen(in, "rb"), _fdopen(out, "wb")};
}

void EndThisProcess(int exitCode) {
    // ExitProcess, which _Exit calls, may wait for ever for a lock of a thread that it has ended.
    TerminateProcess(GetCurrentProcess(), static_cast<UINT>(exitCode));
    std::abort(); // never reached
}
