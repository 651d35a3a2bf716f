#include "host/program/journal/PostgresRow.h"

#include "host/program/journal/JobRow.h"

#include <glib.h>

namespace {

int DigitOf(char digit) {
    return g_ascii_xdigit_value(digit);
}

std::string Escaped(const std::string& bytes) {
    const bool isText = g_utf8_validate(bytes.data(), static_cast<gssize>(bytes.size()), nullptr);
    std::string text;
    for (const char each : bytes) {
        static const char* const Digits = "0123456789abcdef";
        const auto value = static_cast<unsigned char>(each);
        if (each == '\\')
            text += "\\\\";
        else if (isText || value < 0x80)
            text += each;
        else
            text.append("\\x").append(1, Digits[value >> 4]).append(1, Digits[value & 15]);
    }
    return text;
}

std::string Unescaped(const std::string& text) {
    std::string bytes;
    for (std::size_t at = 0; at < text.size(); ++at) {
        const bool isEscaped = text[at] == '\\' && at + 1 < text.size();
        at += isEscaped ? 1 : 0;
        if (isEscaped && text[at] == 'x' && at + 2 < text.size()) {
            bytes += static_cast<char>(DigitOf(text[at + 1]) * 16 + DigitOf(text[at + 2]));
            at += 2;
        } else {
            bytes += text[at];
        }
    }
    return bytes;
}

} // namespace

std::filesystem::path PostgresRow::Path() {
    return m_map.ToLocal(Unescaped(Bytes()));
}

JournalTime PostgresRow::Time() {
    return JournalTime(std::chrono::microseconds(Integer()));
}

std::string PathText(const std::filesystem::path& path, const PathMap& map) {
    return Escaped(map.ToShared(path));
}

// A time that there is none of is NULL.
const char* const PostgresJobColumns =
    "job.id, folder, source, inside, device, number, size, modified, priority, state, open::int, "
    "attempts, deaths, microseconds_of(inserted), microseconds_of(due), microseconds_of(begun), "
    "microseconds_of(ended), seconds, workplace, product, output, aside, print_server, "
    "print_queue, print_number, print_uuid, print_held::int, print_message, fault_blame, fault, "
    "fault_code, fault_advice, text, claimed_by, token, digest";

std::vector<Job> ReadJobs(const pqxx::result& rows, const PathMap& map) {
    std::vector<Job> jobs;
    for (const pqxx::row& each : rows) {
        PostgresRow row(each, map);
        jobs.push_back(ReadJob(row));
        jobs.back().digest = row.Bytes();
    }
    return jobs;
}

bool StoreJob(PostgresConnection& connection, const PathMap& map, const Job& job) {
    const Fault fault = job.fault.value_or(Fault());
    const pqxx::result stored = connection.Run(
        "UPDATE job SET source=$4, priority=$5, state=$6, open=$7, attempts=$8, deaths=$9, "
        "due=coalesce(time_of($10), now()), begun=time_of($11), ended=time_of($12), seconds=$13, "
        "workplace=$14, "
        "product=$15, output=$16, aside=$17, fault_blame=$18, fault=$19, fault_code=$20, "
        "fault_advice=$21, text=$22, print_server=$23, print_queue=$24, print_number=$25, "
        "print_uuid=$26, print_held=$27, print_message=$28, changed=now(), "
        "lease_until=now()+lease WHERE id=$1 AND token=$2 AND claimed_by=$3",
        job.id, job.token, job.claimedBy, PathText(job.source, map), job.priority,
        NameOf(job.state), job.open, job.attempts, job.deaths, job.due, job.begun, job.ended,
        job.seconds, PathText(job.workplace, map), job.product, PathText(job.output, map),
        PathText(job.aside, map), job.fault ? NameOf(fault.blame) : "", fault.what, fault.code,
        fault.advice, job.text, job.print.server, job.print.queue, job.print.number, job.print.uuid,
        job.print.held, job.print.message);
    return stored.affected_rows() > 0;
}
