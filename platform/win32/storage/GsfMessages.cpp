#include "platform/win32/storage/GsfMessages.h"

#include "platform/win32/base/LogSink.h"

#include <glib.h>

#include <cstring>

namespace win32 {

namespace {

thread_local GsfMessages* t_messages = nullptr;

void TakeMessage(const char* domain, GLogLevelFlags level, const char* message, gpointer data) {
    if (t_messages)
        t_messages->Add(message);
    else
        g_log_default_handler(domain, level, message, data);
}

void InstallHandlers() {
    static const bool installed = [] {
        const auto everything =
            static_cast<GLogLevelFlags>(G_LOG_LEVEL_MASK | G_LOG_FLAG_RECURSION);
        for (const char* domain : {"libgsf", "libgsf:msole", "libgsf:proxy"})
            g_log_set_handler(domain, everything, TakeMessage, nullptr);
        return true;
    }();
    static_cast<void>(installed);
}

} // namespace

GsfMessages::GsfMessages(const std::string& fileName) : m_fileName(fileName), m_outer(t_messages) {
    InstallHandlers();
    t_messages = this;
}

void GsfMessages::Add(const char* message) {
    if (m_count++ == 0 && message)
        m_first.assign(message, std::strcspn(message, "\n"));
}

GsfMessages::~GsfMessages() {
    t_messages = m_outer;
    if (m_count > 0)
        Log("storage: " + m_fileName + ": " + m_first +
            (m_count > 1 ? " (and " + std::to_string(m_count - 1) + " more)" : ""));
}

} // namespace win32
