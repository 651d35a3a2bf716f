#include "common/WQServices.h"
#include "host/program/commands/Command.h"
#include "host/program/machine/MachineSetup.h"
#include "host/program/report/Language.h"
#include "host/program/settings/Settings.h"
#include "host/program/system/ChildProcess.h"
#include "host/program/workers/AssignmentWork.h"

#include <condition_variable>
#include <deque>
#include <mutex>
#include <thread>
#include <utility>

namespace {

[[noreturn]] void EndAtOnce(ExitCode exitCode) {
    EndThisProcess(static_cast<int>(exitCode));
}

/// The run that this process works for. When it is gone with work under way, nobody waits for that
/// work any more, and it may take long: the process ends at once.
class Run : public ProgressSink {
public:
    Run()
        : m_channel(TakeStandardStreams()), m_reader([this] { ReadAll(); }),
          m_heart([this] { Beat(); }) {}
    ~Run() override {
        m_reader.join();
        m_heart.join();
    }
    Run(const Run&) = delete;
    Run& operator=(const Run&) = delete;

    /// Waits for a message; the work that it asks for is under way from then on.
    /// @return nothing when the run has no more
    template <typename Message>
    std::optional<Message> Next(std::optional<Message> (*decode)(const std::string&)) {
        std::unique_lock lock(m_mutex);
        m_read.wait(lock, [this] { return m_closed || !m_lines.empty(); });
        if (m_lines.empty())
            return std::nullopt;
        std::optional<Message> message = decode(m_lines.front());
        m_lines.pop_front();
        if (!message) {
            std::fputs("quillon: a worker is for the program's own use\n", stderr);
            EndAtOnce(ExitCode::WrongUsage);
        }
        m_busy = true;
        return message;
    }

    void Done() {
        const std::lock_guard lock(m_mutex);
        m_busy = false;
    }

    void Tell(const News& news) { Write(Encode(news)); }

    bool Report(const wxString& text, int percent) override {
        Tell({text, percent, std::nullopt});
        return true;
    }

private:
    void Write(const std::string& line) {
        const std::lock_guard lock(m_writing);
        m_channel.Write(line);
    }

    /// Whoever waits for a document cannot tell a process that takes long from one that was
    /// stopped.
    void Beat() {
        std::unique_lock lock(m_mutex);
        while (!m_end.wait_for(lock, BetweenSignsOfLife, [this] { return m_closed; })) {
            lock.unlock(); // whoever does not read must not keep the rest from ending
            Write(SignOfLife);
            lock.lock();
        }
    }

    void ReadAll() {
        while (std::optional<std::string> line = m_channel.Read()) {
            const std::lock_guard lock(m_mutex);
            m_lines.push_back(std::move(*line));
            m_read.notify_one();
        }
        const std::lock_guard lock(m_mutex);
        if (m_busy)
            EndAtOnce(ExitCode::Interrupted);
        m_closed = true;
        m_read.notify_one();
        m_end.notify_one();
    }

    const LineChannel m_channel;
    std::mutex m_writing; ///< to the channel
    std::mutex m_mutex;   ///< of what follows
    std::condition_variable m_read;
    std::condition_variable m_end;
    std::deque<std::string> m_lines;
    bool m_closed = false;
    bool m_busy = false;

    std::thread m_reader; // last: they use all of the above
    std::thread m_heart;
};

/// What has to be as an assignment says, and is changed only where it is not.
class Surroundings {
public:
    explicit Surroundings(const CommonOptions& options)
        : m_filters(options.FiltersFolder()), m_language(options.language) {}

    /// @return whether the assignment's settings are any
    bool Suit(const Assignment& work) {
        if (std::exchange(m_engineDocuments, work.engineDocuments) != work.engineDocuments)
            KeepEngine(work.engineDocuments);
        if (std::exchange(m_language, work.language) != work.language)
            Speak();
        if (m_settings == work.settings)
            return true;
        Fault fault;
        const std::optional<Settings> settings = Settings::FromXml(work.settings, fault);
        if (!settings)
            return false;
        m_filters.ApplySettings(settings->Node());
        m_settings = work.settings;
        return true;
    }

    const FilterSet& Filters() const { return m_filters; }

private:
    void Speak() const {
        const auto fault =
            UseLanguage(m_language ? std::optional(wxString::FromUTF8(*m_language)) : std::nullopt);
        if (fault)
            SetLevelAndGetLogger(LevelWarning, __FILE__, __func__, __LINE__) << fault->what;
    }

    FilterSet m_filters;
    unsigned m_engineDocuments = 0;
    std::optional<std::string> m_language;
    std::optional<std::string> m_settings;
};

ExitCode RunWorker(const CommonOptions& options, Reporter& /*reporter*/) {
    Run run;
    Surroundings surroundings(options);
    while (const std::optional<Assignment> work = run.Next(DecodeAssignment)) {
        run.Tell({}); // it has begun
        if (!surroundings.Suit(*work))
            EndAtOnce(ExitCode::WrongUsage);
        News news;
        news.outcome = ConvertAssignment(*work, surroundings.Filters(), run);
        run.Done();
        run.Tell(news);
    }
    return ExitCode::Done;
}

} // namespace

void AddWorker(CLI::App& program, Command& chosen) {
    AddSubcommand(program, "worker", "", [&chosen] {
        chosen.isWorker = true;
        chosen.run = RunWorker;
    });
}
