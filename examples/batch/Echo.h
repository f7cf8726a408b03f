// A checked command in a form that is easy to read.
#pragma once

#include <TessalUtility.h>

#include <string>

/// The command with one line for each argument that was given: name, values, meaning.
std::string echoOf(const HkCmdArgs& args, const char* format);
