#include "host/program/page/Wording.h"

#include <wx/datetime.h>

#include <algorithm>

wxString DurationText(double seconds, const Texts& texts) {
    if (seconds < 10)
        return wxString::Format(texts(wxTRANSLATE("%.1f s")), std::max(seconds, 0.0));
    const auto whole = static_cast<unsigned long>(seconds);
    if (whole < 60)
        return wxString::Format(texts(wxTRANSLATE("%lu s")), whole);
    const unsigned long minutes = whole / 60;
    if (minutes < 60)
        return wxString::Format(texts(wxTRANSLATE("%lu min %lu s")), minutes, whole % 60);
    const unsigned long hours = minutes / 60;
    if (hours < 24)
        return wxString::Format(texts(wxTRANSLATE("%lu h %lu min")), hours, minutes % 60);
    return wxString::Format(texts(wxTRANSLATE("%lu d %lu h")), hours / 24, hours % 24);
}

wxString AgeText(JournalTime since, JournalTime now, const Texts& texts) {
    return DurationText(std::chrono::duration<double>(now - since).count(), texts);
}

wxString TimeText(JournalTime time) {
    return wxDateTime(std::chrono::system_clock::to_time_t(time)).FormatISOCombined(' ');
}

wxString BytesText(std::uintmax_t bytes) {
    auto amount = static_cast<double>(bytes);
    const char* const units[] = {"B", "kB", "MB", "GB", "TB", "PB"};
    std::size_t unit = 0;
    for (; amount >= 999.5 && unit + 1 < std::size(units); ++unit)
        amount /= 1000;
    return wxString::Format(unit == 0 || amount >= 99.95 ? "%.0f %s" : "%.1f %s", amount,
                            units[unit]);
}
