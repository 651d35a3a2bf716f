#include "host/program/commands/MachineReport.h"

#include "tests/host/FakeJournal.h"

#include <gmock/gmock.h>

using testing::HasSubstr;
using testing::Not;

namespace {

Machine MachineOf(const char* name, const char* version, std::set<std::string> cannot = {}) {
    Machine machine;
    machine.name = name;
    machine.makers = {version, "LibreOffice 7", "", "f0"};
    machine.cannot = std::move(cannot);
    machine.isAlive = true;
    machine.started = machine.seen = std::chrono::system_clock::now();
    return machine;
}

Machine Finder() {
    Machine finder = MachineOf("finder", "");
    finder.finds = true;
    return finder;
}

Machine Gone() {
    Machine gone = MachineOf("gone", "2.0");
    gone.isAlive = false;
    return gone;
}

Machine Other(PageMakers makers) {
    Machine other = MachineOf("other", "2.0");
    other.makers = std::move(makers);
    return other;
}

std::string Told(std::vector<Machine> machines, bool json) {
    FakeJournal::Content content;
    content.machines = std::move(machines);
    FakeJournal journal(content);
    Reporter reporter(json);
    testing::internal::CaptureStdout();
    TellMachines(journal, reporter);
    return testing::internal::GetCapturedStdout();
}

TEST(MachineReport, SaysHowMachinesAreAndWhatWaitsInVain) {
    const Machine usual = MachineOf("usual", "2.0");
    const struct {
        std::vector<Machine> machines;
        const char* says;
        const char* doesNotSay;
    } cases[] = {
        {{}, "No machine converts", "has anything"},
        {{Finder()}, "finder: finds documents, 0 under way\nNo machine converts", "converts as"},
        {{Gone()}, "No machine converts", "under way"},
        {{usual, Gone()}, "gone: converts as many at a time as pay, not heard of", "No machine"},
        {{usual, MachineOf("b", "2.0", {"pub"})}, "has nothing to open pub with", "No machine"},
        {{MachineOf("a", "2.0", {"doc", "pub"}), MachineOf("b", "2.0", {"pub"}), Finder()},
         "No machine has anything to open these with: pub.",
         "with: doc"},
        {{Other({"2.1", "LibreOffice 7", "", "f0"}), usual, usual},
         "differs: quillon 2.1\n",
         "usual: converts as many at a time as pay, 0 under way, differs"},
        {{usual, usual, Other({"2.0", "", "Ghostscript 10", "f1"})},
         "differs: no Office application, Ghostscript 10, other fonts\n",
         "quillon 2"},
    };
    for (const auto& [machines, says, doesNotSay] : cases) {
        const std::string told = Told(machines, false);
        EXPECT_THAT(told, HasSubstr(says));
        EXPECT_THAT(told, Not(HasSubstr(doesNotSay))) << says;
    }
    const std::string record = Told({Finder()}, true);
    for (const char* member : {R"("type":"machine","name":"finder","finds":true)",
                               R"("alive":true)", R"("differs":false)"})
        EXPECT_THAT(record, HasSubstr(member));
}

} // namespace
