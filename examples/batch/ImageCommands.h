// The commands around PROM files.
#pragma once

#include <TessalUtility.h>

class Session;

/// Writes PROM files.
bool generate(Session& session, const HkCmdArgs& args);

/// Sums the bytes of the files given, as PROMs would hold them, or those of the PROMs at places in the chain.
bool checksum(Session& session, const HkCmdArgs& args);

/// Prints the parts of the catalogue with their sizes: those of a family, or all where it is null.
void listProms(const char* family);
