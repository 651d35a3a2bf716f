#pragma once

#include "platform/win32/base/Errors.h"

#include <algorithm>
#include <cwchar>
#include <vector>

namespace win32 {

/// Hands records to a caller of the spooler: they stand at the start of the buffer, the texts that
/// they point to behind them in the same buffer.
/// @param records whose texts belong to somebody else
/// @param texts the record's members that point to texts; null ones stay null
/// @param needed receives the bytes needed, also when the buffer is too small
template <typename Record, std::size_t Count>
BOOL PackRecords(const std::vector<Record>& records, LPWSTR Record::*const (&texts)[Count],
                 LPBYTE buffer, DWORD size, LPDWORD needed) {
    std::size_t total = records.size() * sizeof(Record);
    for (const Record& record : records)
        for (const auto text : texts)
            total += record.*text ? (std::wcslen(record.*text) + 1) * sizeof(WCHAR) : 0;
    *needed = static_cast<DWORD>(total);
    if (size < total)
        return Fail(ERROR_INSUFFICIENT_BUFFER);

    auto* room = reinterpret_cast<LPWSTR>(buffer + records.size() * sizeof(Record));
    for (std::size_t i = 0; i < records.size(); ++i) {
        Record record = records[i];
        for (const auto text : texts) {
            if (!(record.*text))
                continue;
            const std::size_t length = std::wcslen(record.*text) + 1;
            record.*text = std::copy_n(record.*text, length, room) - length;
            room += length;
        }
        std::copy_n(reinterpret_cast<const BYTE*>(&record), sizeof(Record),
                    buffer + i * sizeof(Record));
    }
    return TRUE;
}

/// A text for a record, which only PackRecords reads.
inline LPWSTR Lend(const std::wstring& text) {
    return const_cast<LPWSTR>(text.c_str());
}

/// A text that a caller may have left out.
inline std::wstring TextOrEmpty(LPCWSTR text) {
    return text ? text : L"";
}

} // namespace win32
