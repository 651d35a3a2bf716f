#include "platform/win32/spooler/CupsQueues.h"

#include "platform/win32/base/LogSink.h"
#include "platform/win32/text/Utf8.h"

#include <cups/cups.h>

#include <future>
#include <map>
#include <system_error>
#include <thread>

namespace win32 {

namespace {

using std::chrono::milliseconds;

constexpr milliseconds LongestWait(1000);
constexpr milliseconds ConnectWait(500);
constexpr milliseconds QuestionsWait(700);
constexpr double AnswerWait = 0.5; // seconds
constexpr milliseconds Freshness(3000);

using Connection = std::unique_ptr<http_t, decltype(&httpClose)>;

Connection Connect() {
    // Nobody is there to be asked for a password.
    cupsSetPasswordCB2([](const char*, http_t*, const char*, const char*,
                          void*) -> const char* { return nullptr; },
                       nullptr);
    Connection server(httpConnect2(cupsServer(), ippPort(), nullptr, AF_UNSPEC, cupsEncryption(), 1,
                                   static_cast<int>(ConnectWait.count()), nullptr),
                      httpClose);
    if (server)
        httpSetTimeout(
            server.get(), AnswerWait, [](http_t*, void*) { return 0; }, nullptr);
    return server;
}

/// Whether the server has a printer description of the queue. A raw queue has none.
bool HasPpd(http_t* server, const std::string& queue) {
    const std::string resource = "/printers/" + queue + ".ppd";
    httpClearFields(server);
    if (httpHead(server, resource.c_str()) != 0)
        return false;
    http_status_t status = HTTP_STATUS_CONTINUE;
    while (status == HTTP_STATUS_CONTINUE)
        status = httpUpdate(server);
    httpFlush(server);
    return status == HTTP_STATUS_OK;
}

std::wstring TextOf(ipp_attribute_t* attribute) {
    const char* text = ippGetString(attribute, 0, nullptr);
    return text ? FromUtf8(text) : std::wstring();
}

DWORD ToPrinterAttributes(int cupsType) {
    const bool isRemote = (cupsType & CUPS_PRINTER_REMOTE) != 0;
    const bool isDefault = (cupsType & CUPS_PRINTER_DEFAULT) != 0;
    return (isRemote ? PRINTER_ATTRIBUTE_NETWORK : PRINTER_ATTRIBUTE_LOCAL) |
           (isDefault ? PRINTER_ATTRIBUTE_DEFAULT : 0);
}

struct Queue {
    std::shared_ptr<Printer> printer = std::make_shared<Printer>();
    PrinterDriver driver;
};

/// Reads the attributes of one queue.
/// @param attribute the first of them; receives what stands behind the last
Queue ReadQueue(ipp_t* answer, ipp_attribute_t*& attribute) {
    Queue queue;
    queue.printer->isQueue = true;
    const std::map<std::string, std::wstring*> texts = {
        {"printer-name", &queue.printer->name},
        {"printer-make-and-model", &queue.driver.name},
        {"device-uri", &queue.printer->portName},
    };
    for (; attribute && ippGetGroupTag(attribute) == IPP_TAG_PRINTER;
         attribute = ippNextAttribute(answer)) {
        const char* key = ippGetName(attribute);
        const auto text = texts.find(key ? key : "");
        if (text != texts.end())
            *text->second = TextOf(attribute);
        else if (key && key == std::string("printer-type"))
            queue.printer->attributes = ToPrinterAttributes(ippGetInteger(attribute, 0));
    }
    return queue;
}

std::vector<Queue> ReadQueues(ipp_t* answer) {
    std::vector<Queue> queues;
    ipp_attribute_t* attribute = ippFirstAttribute(answer);
    while (attribute) {
        if (ippGetGroupTag(attribute) == IPP_TAG_PRINTER)
            queues.push_back(ReadQueue(answer, attribute));
        else
            attribute = ippNextAttribute(answer);
    }
    return queues;
}

Printers AskServer() {
    const auto lastQuestion = std::chrono::steady_clock::now() + QuestionsWait;
    const Connection server = Connect();
    if (!server)
        return {};
    static const char* const Wanted[] = {"printer-name", "printer-make-and-model", "device-uri",
                                         "printer-type"};
    ipp_t* request = ippNewRequest(IPP_OP_CUPS_GET_PRINTERS);
    ippAddStrings(request, IPP_TAG_OPERATION, IPP_CONST_TAG(IPP_TAG_KEYWORD),
                  "requested-attributes", static_cast<int>(std::size(Wanted)), nullptr, Wanted);
    const std::unique_ptr<ipp_t, decltype(&ippDelete)> answer(
        cupsDoRequest(server.get(), request, "/"), ippDelete);
    if (!answer)
        return {};
    Printers printers;
    for (Queue& queue : ReadQueues(answer.get())) {
        if (queue.printer->name.empty())
            continue;
        const std::string name = ToReadableUtf8(queue.printer->name);
        if (std::chrono::steady_clock::now() > lastQuestion)
            Log("spooler: no time to ask for the PPD of the queue " + name);
        else if (HasPpd(server.get(), name))
            queue.driver.dataFile = queue.printer->name + L".ppd";
        queue.printer->driver = std::make_shared<const PrinterDriver>(std::move(queue.driver));
        printers.push_back(std::move(queue.printer));
    }
    return printers;
}

} // namespace

CupsQueues& CupsQueues::Instance() {
    static CupsQueues queues;
    return queues;
}

Printers CupsQueues::List() {
    const std::lock_guard lock(m_mutex);
    if (std::chrono::steady_clock::now() < m_staleAt)
        return m_queues;
    m_queues.clear();
    try {
        // On a thread of its own, which is left behind when it takes too long: a name look-up, for
        // one, cannot be cut short.
        std::packaged_task<Printers()> ask(AskServer);
        std::future<Printers> answer = ask.get_future();
        std::thread(std::move(ask)).detach();
        if (answer.wait_for(LongestWait) == std::future_status::ready)
            m_queues = answer.get();
        else
            Log("spooler: the print server does not answer");
    } catch (const std::exception& error) {
        Log(std::string("spooler: cannot ask the print server: ") + error.what());
    }
    m_staleAt = std::chrono::steady_clock::now() + Freshness;
    return m_queues;
}

} // namespace win32
