// Writes records to a log from several threads at once. Arguments: the log file, a mark for the
// records, the number of threads, the number of records of each.

#include "host/services/Log.h"

#include <wx/init.h>

#include <cstdlib>
#include <thread>
#include <vector>

namespace {

void WriteRecords(const char* mark, int thread, int count) {
    for (int record = 0; record < count; ++record)
        SetLevelAndGetLogger(LevelInformation, __FILE__, __func__, __LINE__)
            << "<" << mark << wxString::Format(".%d.%d", thread, record)
            << wxString('x', record % 300) << ">";
}

} // namespace

int main(int argc, char** argv) {
    const wxInitializer toolkit;
    if (argc != 5 || !toolkit.IsOk() || !Log::ToFile(argv[1]))
        return 2;
    const int threadCount = std::atoi(argv[3]); // NOLINT(cert-err34-c): the test's own number
    const int recordCount = std::atoi(argv[4]); // NOLINT(cert-err34-c)
    std::vector<std::thread> threads;
    threads.reserve(static_cast<std::size_t>(threadCount));
    for (int thread = 0; thread < threadCount; ++thread)
        threads.emplace_back(WriteRecords, argv[2], thread, recordCount);
    for (std::thread& thread : threads)
        thread.join();
    return 0;
}
