// The table as text for a terminal and as comma-separated values for a file.
#pragma once

#include <string>
#include <vector>

#include "Rounds.h"

/// The machine, the compiler and the build type, in one line.
std::string describeMachine();

/// One line with its line end; the heading and the rows have the same columns.
std::string textHeading(std::size_t itemWidth);
std::string textRow(const Row& row, std::size_t itemWidth);

/// A file of one heading line and one line a row, each field of text in quotation marks.
std::string csv(const std::vector<Row>& rows);
