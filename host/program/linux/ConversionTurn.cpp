#include "host/program/system/ConversionTurn.h"

ConversionTurn::ConversionTurn() = default; // each process has a registry of its own

bool ConversionTurn::AreTaken() {
    return false;
}
