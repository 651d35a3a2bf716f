#include "host/program/ServerInformation.h"

namespace {

constexpr int ServerVersion = 16;

} // namespace

wxString ServerInformation() {
    return wxString::Format("<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
                            "<ServerInformation>\n"
                            "  <ServerName>Marlo</ServerName>\n"
                            "  <ServerVersion>%d</ServerVersion>\n"
                            "</ServerInformation>\n",
                            ServerVersion);
}
