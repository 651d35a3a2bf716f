#include "host/program/printing/PrintDesk.h"

PrintDesk::PrintDesk(const wxString& server, std::function<void()> onReply)
    : m_onReply(std::move(onReply)), m_spooler(server), m_thread([this] { Run(); }) {}

PrintDesk::~PrintDesk() {
    {
        const std::lock_guard lock(m_mutex);
        m_isStopping = true;
    }
    m_changed.notify_all();
    m_thread.join();
}

std::future<PrintReply> PrintDesk::Ask(Question question) {
    Task task(std::move(question));
    std::future<PrintReply> reply = task.get_future();
    {
        const std::lock_guard lock(m_mutex);
        m_tasks.push_back(std::move(task));
    }
    m_changed.notify_all();
    return reply;
}

std::optional<PrintDesk::Task> PrintDesk::Next() {
    std::unique_lock lock(m_mutex);
    m_changed.wait(lock, [this] { return m_isStopping || !m_tasks.empty(); });
    if (m_isStopping)
        return std::nullopt;
    Task task = std::move(m_tasks.front());
    m_tasks.pop_front();
    return task;
}

void PrintDesk::Run() {
    while (std::optional<Task> task = Next()) {
        (*task)(m_spooler);
        m_onReply();
    }
}
