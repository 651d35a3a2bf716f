#include "plugin/interface/ResultCodes.h"

#include "common/Translated.h"

#include <algorithm>
#include <iterator>

namespace {

struct ResultMessage {
    ResultCode code;
    const char* english; ///< also the key in the host's catalogue, to the letter
};

const ResultMessage Messages[] = {
    {0, "No Error"},
    {-1, "Error"},
    {-1002, "Input file not found"},
    {-1003, "Filter conversion failed"},
    {-1005, "Invalid input file"},
    {-1006, "Filter is not initialized"},
    {-1007, "PDF conversion failed"},
    {-1008, "PDF preflight failed"},
    {-1009, "PDF merge failed"},
    {-1010, "Distiller is not installed"},
    {1011, "MS Office is not installed"},
    {1012, "MS Word is not installed"},
    {1013, "MS Power Point is not installed"},
    {1014, "MS Excel is not installed"},
    {1015, "MS Publisher is not installed"},
    {1016, "MS Word cannot be started"},
    {1017, "MS Power Point cannot be started"},
    {1018, "MS Excel cannot be started"},
    {1019, "MS Publisher cannot be started"},
    {1020, "Error printing output file"},
    {1021, "Output file not found"},
    {1022, "Error: Expecting Correct PS Header"},
    {1023, "Error: Publisher 2000 or Previous"},
    {1024, "Error: Unable to Open ps/pdf prefix.ps file"},
    {1025, "Error: Unable to open or create RES file"},
    {1026, "Error: Unable to get CT/LW Resolution"},
    {1027, "Error: Resolution is not reasonable"},
    {1028, "Error: Unable to open temp directory"},
    {1029, "Error: Unable to open configuration file for filter"},
    {1030, "Error: invalid separation name for 1-bit Tiff"},
    {1031, "Error: General processing error during conversion"},
    {1032, "Error: CSL library error during conversion"},
};

} // namespace

wxString GetResultText(ResultCode code) {
    const auto* found =
        std::find_if(std::begin(Messages), std::end(Messages),
                     [code](const ResultMessage& message) { return message.code == code; });
    const ResultMessage& message = found != std::end(Messages) ? *found : Messages[0];
    return Translated(wxString::FromAscii(message.english));
}
