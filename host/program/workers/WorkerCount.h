#pragma once

#include "host/program/documents/Inputs.h"

#include <cstddef>
#include <vector>

/// How many documents can be asked to be converted at a time.
constexpr unsigned MostWorkers = 64;

/// How many documents are best converted at a time: one for each processor, and more of those that
/// wait without using one, as far as there is memory for them.
/// @param inputs those that are to be converted
/// @return from 1 to the number of documents; 1 when there are none
std::size_t WorthwhileWorkers(const std::vector<Input>& inputs);

/// For how many documents each worker best keeps an engine once it is started.
/// @return 1 where an engine for each is faster
unsigned WorthwhileEngineDocuments(std::size_t documents, std::size_t workers);
