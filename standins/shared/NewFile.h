#pragma once

#include "standins/shared/Descriptor.h"

#include <string>

namespace standins {

/// A file that appears under its name when it is whole, and not before. Where the file system can
/// do it, it has no name at all until then, so that nothing is left of it whatever happens to this
/// process; elsewhere it has a hidden one.
class NewFile {
public:
    /// Starts the file in the folder where it will appear.
    explicit NewFile(const std::string& path);
    ~NewFile();
    NewFile(const NewFile&) = delete;
    NewFile& operator=(const NewFile&) = delete;

    /// @return the file, open for writing; -1 when it could not be made, and Error() tells why
    int Get() const { return m_file.Get(); }
    int Error() const { return m_error; }

    /// Gives the file its name, in place of a file that had it before. Its bytes may still be on
    /// their way to the disk: whoever delivers the file waits for them.
    /// @return 0, or the errno of what failed: then the file before is as it was
    int Appear();

private:
    int GiveHiddenName();

    std::string m_path;
    std::string m_folder;
    std::string m_hiddenPath; ///< empty while the file has no name
    Descriptor m_file;
    int m_error = 0;
};

} // namespace standins
