#include "platform/win32/files/ShareTable.h"

#include <windows.h>

#include <algorithm>

namespace win32 {

namespace {

bool Allows(const ShareMode& handle, const ShareMode& other) {
    return (!other.reads || (handle.share & FILE_SHARE_READ) != 0) &&
           (!other.writes || (handle.share & FILE_SHARE_WRITE) != 0);
}

bool GoTogether(const ShareMode& left, const ShareMode& right) {
    const bool bothTouchData = (left.reads || left.writes) && (right.reads || right.writes);
    return !bothTouchData || (Allows(left, right) && Allows(right, left));
}

} // namespace

ShareTable& ShareTable::Instance() {
    static ShareTable table;
    return table;
}

bool ShareTable::Enter(const FileId& file, const ShareMode& mode) {
    const std::lock_guard lock(m_mutex);
    const auto [first, last] = m_modes.equal_range(file);
    const bool fits =
        std::all_of(first, last, [&](const auto& entry) { return GoTogether(entry.second, mode); });
    if (fits)
        m_modes.emplace(file, mode);
    return fits;
}

void ShareTable::Leave(const FileId& file, const ShareMode& mode) {
    const std::lock_guard lock(m_mutex);
    const auto [first, last] = m_modes.equal_range(file);
    const auto found = std::find_if(first, last, [&](const auto& entry) {
        return entry.second.reads == mode.reads && entry.second.writes == mode.writes &&
               entry.second.share == mode.share;
    });
    if (found != last)
        m_modes.erase(found);
}

bool ShareTable::MayDelete(const FileId& file) {
    const std::lock_guard lock(m_mutex);
    const auto [first, last] = m_modes.equal_range(file);
    return std::all_of(first, last, [](const auto& entry) {
        return (entry.second.share & FILE_SHARE_DELETE) != 0;
    });
}

} // namespace win32
