// What moves bytes between the prompt and a PROM: block by block, with progress, until ^C.
#pragma once

#include <functional>
#include <string>

#include "Chain.h"
#include "DataFile.h"

/// Does something with the block of this place; what went wrong, empty where nothing did.
using BlockStep = std::function<std::string(int offset, int length)>;

/// Takes the step for each block of the first @p length bytes of a PROM. A failure, or ^C, ends it and is reported with
/// the place that was reached.
/// @param title what is being done, as in "programming"
bool forEachBlock(const Prom& prom, const char* title, int length, const BlockStep& step);

/// The same for blocks that have been read from the PROM.
using ReadStep = std::function<std::string(int offset, const unsigned char* block, int length)>;
bool readBlocks(const Prom& prom, const char* title, int length, const ReadStep& step);

bool eraseProm(const Prom& prom);
bool programProm(const Prom& prom, const Bytes& image);
