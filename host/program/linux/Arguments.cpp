#include "host/program/Arguments.h"

std::vector<std::string> Arguments(int argc, const char* const* argv) {
    return {argv + (argc > 0 ? 1 : 0), argv + argc};
}
