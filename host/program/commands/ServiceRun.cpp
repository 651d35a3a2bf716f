#include "host/program/commands/ServiceRun.h"

#include "host/program/machine/Engines.h"
#include "host/program/page/PageServer.h"
#include "host/program/report/Readiness.h"
#include "host/program/system/InstalledFonts.h"
#include "host/program/system/Interruption.h"
#include "machine/OfficeApplication.h"

#include <wx/filename.h>
#include <wx/intl.h>
#include <wx/utils.h>

namespace {

/// Tells the page's figures what becomes of documents.
class PageAudience : public WatchService::Audience {
public:
    explicit PageAudience(PageServer& page) : m_page(page) {}

    void OnEnd(const Job& job, const Outcome& outcome) override {
        const auto application =
            ApplicationForExtension(wxFileName(job.source.u8string()).GetExt());
        m_page.Count(job.folder, NameOf(outcome.state), outcome.fault ? outcome.fault->code : 0,
                     application ? NameOf(*application) : "", outcome.seconds.value_or(0));
    }

    void OnRetry(const Job& job) override { m_page.CountRetry(job.folder); }

private:
    PageServer& m_page;
};

Machine ThisMachine(const ServiceRun& run) {
    Machine self;
    self.name = wxString::Format("%s:%lu", wxGetHostName(), wxGetProcessId());
    self.finds = run.finds;
    self.jobs = run.configuration.jobs;
    self.takesAnyVersion = run.anyVersion;
    if (!run.finds || run.configuration.jobs > 0)
        self.makers = {QUILLON_VERSION, OfficeEngine(), PdfEngine(),
                       wxString::FromUTF8(DigestOfFonts())};
    return self;
}

/// @return why it must not work on a journal that others work on, too
std::optional<Fault> FindObstacle(const Machine& self, Journal& journal) {
    SharedJournal* const shared = journal.Shared();
    if (!shared || self.takesAnyVersion || self.makers.program.empty())
        return std::nullopt;
    try {
        return FindMisfit(self.makers, shared->Machines());
    } catch (const JournalError& error) {
        return Fault{
            wxString::Format(_("the journal cannot be used: %s"), wxString::FromUTF8(error.what())),
            Blame::Machine};
    }
}

std::unique_ptr<PageServer> StartPage(const WatchConfiguration& configuration,
                                      WatchService& service, const StatusBoard& board,
                                      Fault& fault) {
    const auto openJournal = [where = configuration.journal, map = configuration.map](Fault& why) {
        return OpenJournal(where, why, JournalNeed::Make, map);
    };
    return PageServer::Start(
        configuration.http, openJournal, board, [&service] { service.Wake(); }, fault);
}

void TakeCommonOptions(WatchService::Means& means, const CommonOptions& options) {
    means.workerArguments = WorkerArguments(options);
    means.workerPatience = WorkerPatience(options);
    means.language = options.language;
    means.engineDocuments = options.engineDocuments;
}

} // namespace

void Override(WatchConfiguration& configuration, const ServiceOptions& options) {
    if (options.queue)
        configuration.journal = *options.queue;
    if (options.http)
        configuration.http = *options.http;
    if (options.jobs)
        configuration.jobs = *options.jobs;
}

ExitCode RunService(ServiceRun run, const CommonOptions& options, Reporter& reporter) {
    const FilterSet filters(options.FiltersFolder());
    if (const std::optional<Fault> missing = FindMissingFilter(filters))
        return reporter.Error(*missing);
    TakeCommonOptions(run.means, options);
    const WatchConfiguration& configuration = run.configuration;
    Fault fault;
    const std::unique_ptr<Journal> journal =
        OpenJournal(configuration.journal, fault, JournalNeed::Make, configuration.map);
    if (!journal)
        return reporter.Error(fault);
    run.means.self = ThisMachine(run);
    if (const std::optional<Fault> obstacle = FindObstacle(run.means.self, *journal))
        return reporter.Error(*obstacle);
    StatusBoard board;
    WatchService service(configuration, std::move(run.means), *journal, filters, board, reporter);
    std::unique_ptr<PageServer> page;
    std::optional<PageAudience> audience;
    if (!configuration.http.empty()) {
        page = StartPage(configuration, service, board, fault);
        if (!page && run.pageIsAsked)
            return reporter.Error(fault);
        if (!page) // documents are printed all the same
            reporter.Error(
                {wxString::Format(_("there is no page: %s"), fault.Text()), fault.blame});
        else
            service.SetAudience(&audience.emplace(*page));
    }
    if (run.obeysHangUp)
        Interruption::ReloadOnHangUp();
    return service.Run();
}
