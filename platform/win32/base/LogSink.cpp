#include "platform/win32/base/LogSink.h"

#include "platform/win32/text/Utf8.h"

#include <windows.h>

#include <cstdio>
#include <mutex>

namespace win32 {

namespace {

struct SinkHolder {
    std::mutex mutex;
    LogSink sink;
};

SinkHolder& Holder() {
    static SinkHolder holder;
    return holder;
}

thread_local bool t_inSink = false;

void WriteToStandardError(const std::string& record) {
    const std::string line = record + '\n';
    std::fwrite(line.data(), 1, line.size(), stderr);
}

} // namespace

void SetLogSink(LogSink sink) {
    const std::lock_guard lock(Holder().mutex);
    Holder().sink = std::move(sink);
}

void Log(const std::string& record) {
    if (t_inSink) {
        WriteToStandardError(record);
        return;
    }
    const std::lock_guard lock(Holder().mutex);
    if (!Holder().sink) {
        WriteToStandardError(record);
        return;
    }
    t_inSink = true;
    try {
        Holder().sink(record);
    } catch (...) {
        WriteToStandardError(record); // the API's callers must not see a sink's exception
    }
    t_inSink = false;
}

} // namespace win32

void WINAPI OutputDebugStringW(LPCWSTR text) {
    if (!text)
        return;
    std::string record = win32::ToReadableUtf8(text);
    while (!record.empty() && (record.back() == '\n' || record.back() == '\r'))
        record.pop_back();
    win32::Log(record);
}
