#include "standins/office/engine/DocumentCopy.h"

#include "standins/process/Descriptor.h"
#include "standins/process/FileBytes.h"

#include <fcntl.h>
#include <sys/stat.h>

#include <cerrno>

namespace standins {

DocumentCopy CopyDocument(int document, const std::string& path, Heartbeat& heartbeat) {
    const Descriptor copy(
        open(path.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, S_IRUSR | S_IWUSR));
    if (!copy.IsOpen())
        return {{}, errno};
    Sha256 sum;
    const int error = ReadWhole(document, [&](const char* bytes, std::size_t size) {
        heartbeat.Beat();
        sum.Add(bytes, size);
        return WriteWhole(copy.Get(), bytes, size);
    });
    return {sum.Text(), error};
}

} // namespace standins
