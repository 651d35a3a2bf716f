// LibreOffice, started once and kept, in a program of its own: the supervisor of documents has it
// fork a child for each. The supervisor gives it a channel as descriptor 3.
//   office-host PROGRAM FONTS…    LibreOffice's program folder, folders of fonts

#include "standins/office/host/ForkServer.h"
#include "standins/office/host/HostedOffice.h"
#include "standins/office/shared/OfficeReach.h"

#include <cstdlib>
#include <exception>
#include <string>
#include <vector>

namespace {

constexpr int ChannelDescriptor = 3;

} // namespace

int main(int argc, char** argv) {
    constexpr int FewestArguments = 2;
    if (argc < FewestArguments)
        return EXIT_FAILURE;
    const std::string program = argv[1];
    const std::vector<std::string> fontFolders(argv + FewestArguments, argv + argc);
    standins::Channel supervisor{standins::Descriptor(ChannelDescriptor)};
    try {
        const std::string failure = standins::HostedOffice::Run(program, [&] {
            standins::ForkServer(supervisor, standins::OfficeReach(program, fontFolders)).Serve();
        });
        supervisor.Send(standins::MessageKind::Failed, failure);
    } catch (const std::exception&) { // the supervisor sees the channel close
    }
    _exit(EXIT_FAILURE); // LibreOffice does not expect to end here
}
