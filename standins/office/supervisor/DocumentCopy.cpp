#include "standins/office/supervisor/DocumentCopy.h"

#include "standins/shared/Descriptor.h"
#include "standins/shared/FileBytes.h"

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
