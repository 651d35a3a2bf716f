#include "standins/inprocess/DocumentFile.h"

#include "standins/shared/Text.h"

#include <fcntl.h>
#include <sys/stat.h>

#include <cerrno>

namespace standins {

namespace {

/// What is to blame when a file cannot be opened.
Fault FaultOf(int error) {
    const bool isScarce = error == EMFILE || error == ENFILE || error == ENOMEM || error == EIO;
    return isScarce ? Fault::Machine : Fault::Document;
}

} // namespace

DocumentFile OpenDocumentFile(const std::wstring& path, Failure& failure) {
    const std::optional<std::string> utf8 = ToUtf8(path);
    struct stat status {};
    // Looked at before it is opened: opening alone can start something in a device.
    if (!utf8 || utf8->find('\0') != std::string::npos) {
        failure = {"no file can have this name"};
        return {};
    }
    if (stat(utf8->c_str(), &status) == 0 && !S_ISREG(status.st_mode)) {
        failure = {"it is not a regular file"};
        return {};
    }
    DocumentFile file;
    file.descriptor = Descriptor(open(utf8->c_str(), O_RDONLY | O_NONBLOCK | O_NOCTTY | O_CLOEXEC));
    if (!file.descriptor.IsOpen()) {
        failure = {ErrorWords(errno), FaultOf(errno)};
        return {};
    }
    if (fstat(file.descriptor.Get(), &status) != 0 || !S_ISREG(status.st_mode)) {
        failure = {"it is not a regular file"};
        return {};
    }
    if (status.st_size == 0) {
        failure = {"it is empty"};
        return {};
    }
    file.size = static_cast<std::uint64_t>(status.st_size);
    return file;
}

} // namespace standins
