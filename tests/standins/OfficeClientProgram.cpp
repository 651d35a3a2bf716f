// A client of Word that opens a document, to be killed meanwhile.

#include "tests/standins/OfficeClient.h"
#include "tests/standins/StandInModule.h"

#include <ole2.h>

#include <filesystem>

int main(int /*argc*/, char** argv) {
    CoInitialize(nullptr);
    StandInModule::Instance().Register();
    WordClient word;
    return RaisedBy([&] { word.Open(std::filesystem::path(argv[1]).wstring()); }).empty() ? 0 : 1;
}
