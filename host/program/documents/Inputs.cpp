#include "host/program/documents/Inputs.h"

#include "host/program/base/PathText.h"

#include <wx/filename.h>

#include <algorithm>
#include <optional>
#include <set>

namespace fs = std::filesystem;

namespace {

bool IsLeftOut(const fs::path& file) {
    const std::string name = file.filename().u8string();
    return name.rfind('.', 0) == 0 || name.rfind("~$", 0) == 0;
}

/// @return nothing when the folder cannot be read
std::optional<std::vector<fs::path>> FilesIn(const fs::path& folder) {
    std::vector<fs::path> files;
    std::error_code error;
    for (fs::directory_iterator entry(folder, error), end; !error && entry != end;
         entry.increment(error)) {
        std::error_code unreadable;
        if (!entry->is_directory(unreadable) && !IsLeftOut(entry->path()))
            files.push_back(entry->path());
    }
    if (error)
        return std::nullopt;
    std::sort(files.begin(), files.end());
    return files;
}

fs::path Absolute(const fs::path& path) {
    std::error_code error;
    fs::path full = fs::absolute(path, error);
    return error ? path : full;
}

} // namespace

std::vector<Input> ListInputs(const std::vector<std::string>& arguments) {
    std::vector<Input> inputs;
    std::set<fs::path> known;
    const auto add = [&](const fs::path& path, bool named) {
        Input input{path, Absolute(path), named};
        if (known.insert(input.full.lexically_normal()).second)
            inputs.push_back(std::move(input));
    };
    for (const std::string& argument : arguments) {
        const fs::path path = FromArgument(argument);
        std::error_code ignored;
        const auto files = fs::is_directory(path, ignored) ? FilesIn(path) : std::nullopt;
        if (!files)
            add(path, true);
        else
            for (const fs::path& file : *files)
                add(file, false);
    }
    return inputs;
}

wxString ExtensionOf(const Input& input) {
    return wxFileName(ToText(input.full)).GetExt();
}
