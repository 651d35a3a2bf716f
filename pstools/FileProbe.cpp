#include "pstools/FileProbe.h"

#include <sys/stat.h>
#include <sys/types.h>

#include <cwchar>

void QueryFileSize(const wxString& path, std::uint64_t& size) {
    struct __stat64 status;
    if (_wstat64(path.wc_str(), &status) == 0)
        size = static_cast<std::uint64_t>(status.st_size);
}
