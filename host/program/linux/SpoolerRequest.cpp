#include "host/program/linux/SpoolerRequest.h"

#include <wx/intl.h>

#include <sys/socket.h>

#include <chrono>
#include <condition_variable>
#include <filesystem>
#include <mutex>
#include <thread>

namespace {

/// What a status means for whoever has asked.
Blame BlameFor(ipp_status_t status) {
    switch (status) {
    case IPP_STATUS_ERROR_FORBIDDEN:
    case IPP_STATUS_ERROR_NOT_AUTHENTICATED:
    case IPP_STATUS_ERROR_NOT_AUTHORIZED:
    case IPP_STATUS_ERROR_NOT_FOUND:
    case IPP_STATUS_ERROR_ATTRIBUTES_OR_VALUES:
    case IPP_STATUS_ERROR_CONFLICTING:
    case IPP_STATUS_ERROR_CUPS_AUTHENTICATION_CANCELED:
    case IPP_STATUS_ERROR_CUPS_PKI:
        return Blame::Usage;
    case IPP_STATUS_ERROR_BAD_REQUEST:
    case IPP_STATUS_ERROR_REQUEST_ENTITY:
    case IPP_STATUS_ERROR_REQUEST_VALUE:
    case IPP_STATUS_ERROR_DOCUMENT_FORMAT_NOT_SUPPORTED:
    case IPP_STATUS_ERROR_DOCUMENT_FORMAT_ERROR:
    case IPP_STATUS_ERROR_DOCUMENT_ACCESS:
        return Blame::Document;
    default: // busy, away, or full of jobs, which it says by "not possible"
        return Blame::Machine;
    }
}

IppMessage Request(ipp_op_t operation, const char* uriName, const std::string& resource) {
    IppMessage request(ippNewRequest(operation), ippDelete);
    char uri[HTTP_MAX_URI] = {};
    httpAssembleURI(HTTP_URI_CODING_ALL, uri, sizeof uri, "ipp", nullptr, "localhost", 0,
                    resource.c_str());
    ippAddString(request.get(), IPP_TAG_OPERATION, IPP_TAG_URI, uriName, nullptr, uri);
    ippAddString(request.get(), IPP_TAG_OPERATION, IPP_TAG_NAME, "requesting-user-name", nullptr,
                 cupsUser());
    return request;
}

/// Why a request was in vain.
/// @param answer null when there was none that can be read
Fault ReasonOf(ipp_t* answer, ipp_status_t status) {
    switch (status) {
    case IPP_STATUS_ERROR_NOT_AUTHENTICATED:
    case IPP_STATUS_ERROR_NOT_AUTHORIZED:
    case IPP_STATUS_ERROR_FORBIDDEN:
    case IPP_STATUS_ERROR_CUPS_AUTHENTICATION_CANCELED:
        return {_("the print server does not let this user do that, or asks for a password"),
                BlameFor(status), ConversionFailed,
                _("Have its administrator allow it for this user")};
    default:
        break;
    }
    // Without an answer, the text is of whatever went wrong last.
    if (!answer && status != IPP_STATUS_ERROR_NOT_FOUND)
        return {_("the print server does not answer, or not as a print server does"),
                Blame::Machine};
    return {
        wxString::Format(_("the print server says: %s"), wxString::FromUTF8(cupsLastErrorString())),
        BlameFor(status)};
}

/// Ends a conversation that takes too long. The library's clock begins anew with each byte.
class Deadline {
public:
    /// @param file that is sent; null for none
    Deadline(int socket, const char* file) {
        constexpr std::uintmax_t LeastSpeed = 100'000; // bytes a second
        std::error_code error;
        std::chrono::seconds time = AnswerTakes;
        if (file)
            if (const auto size = std::filesystem::file_size(file, error); !error)
                time += std::chrono::seconds(size / LeastSpeed);
        m_thread = std::thread([this, socket, time] {
            std::unique_lock lock(m_mutex);
            if (!m_changed.wait_for(lock, time, [this] { return m_isOver; }))
                shutdown(socket, SHUT_RDWR);
        });
    }
    ~Deadline() {
        {
            const std::lock_guard lock(m_mutex);
            m_isOver = true;
        }
        m_changed.notify_all();
        m_thread.join();
    }
    Deadline(const Deadline&) = delete;
    Deadline& operator=(const Deadline&) = delete;

private:
    static constexpr std::chrono::seconds AnswerTakes{20};

    std::mutex m_mutex;
    std::condition_variable m_changed;
    bool m_isOver = false;
    std::thread m_thread;
};

} // namespace

IppMessage RequestAbout(const wxString& queue, ipp_op_t operation) {
    return Request(operation, "printer-uri", "/printers/" + queue.utf8_string());
}

IppMessage RequestAbout(int job, ipp_op_t operation) {
    return Request(operation, "job-uri", "/jobs/" + std::to_string(job));
}

IppMessage Ask(http_t* server, IppMessage request, Fault& fault, const char* file) {
    const char* const resource = file ? "/printers/" : "/";
    const Deadline deadline(httpGetFd(server), file);
    IppMessage answer(cupsDoFileRequest(server, request.release(), resource, file), ippDelete);
    const ipp_status_t status = cupsLastError();
    if (answer && status < IPP_STATUS_ERROR_BAD_REQUEST)
        return answer;
    fault = ReasonOf(answer.get(), status);
    return {nullptr, ippDelete};
}

bool WasNotFound() {
    return cupsLastError() == IPP_STATUS_ERROR_NOT_FOUND ||
           cupsLastError() == IPP_STATUS_ERROR_GONE;
}
