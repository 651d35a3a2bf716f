#include "platform/win32/log/LogSink.h"
#include "platform/win32/text/Utf8.h"

#include <windows.h>

void WINAPI OutputDebugStringW(LPCWSTR text) {
    if (!text)
        return;
    std::string record = win32::ToReadableUtf8(text);
    while (!record.empty() && (record.back() == '\n' || record.back() == '\r'))
        record.pop_back();
    win32::Log(record);
}
