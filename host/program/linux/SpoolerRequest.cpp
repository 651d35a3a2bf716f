#include "host/program/linux/SpoolerRequest.h"

#include <wx/intl.h>

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

} // namespace

IppMessage RequestAbout(const wxString& queue, ipp_op_t operation) {
    return Request(operation, "printer-uri", "/printers/" + queue.utf8_string());
}

IppMessage RequestAbout(int job, ipp_op_t operation) {
    return Request(operation, "job-uri", "/jobs/" + std::to_string(job));
}

IppMessage Ask(http_t* server, IppMessage request, Fault& fault, const char* file) {
    const char* const resource = file ? "/printers/" : "/";
    IppMessage answer(cupsDoFileRequest(server, request.release(), resource, file), ippDelete);
    const ipp_status_t status = cupsLastError();
    if (answer && status < IPP_STATUS_ERROR_BAD_REQUEST)
        return answer;
    fault = {
        wxString::Format(_("the print server says: %s"), wxString::FromUTF8(cupsLastErrorString())),
        BlameFor(status)};
    return {nullptr, ippDelete};
}

bool WasNotFound() {
    return cupsLastError() == IPP_STATUS_ERROR_NOT_FOUND ||
           cupsLastError() == IPP_STATUS_ERROR_GONE;
}
