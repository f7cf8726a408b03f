// The table as text for a terminal and as comma-separated values for a file.
#pragma once

#include <cstdio>
#include <string>
#include <vector>

#include "Rounds.h"

/// Text put together as printf does, of 511 characters at most.
template <class... Values>
std::string formatted(const char* format, Values... values) {
    char text[512];
    std::snprintf(text, sizeof text, format, values...);
    return text;
}

/// The text as it stands in XML and in a cell of a Markdown table.
std::string escaped(const std::string& text);

/// The machine, its system, the compiler and the build type, in one line.
std::string describeMachine();

/// How many rows there are, and how many of them have an error or a missed goal.
std::string summary(const std::vector<Row>& rows);

/// The columns of a row: item, ours, then name, time, ratio and goal of the peer and of the limit, and the verdict.
/// What is not asked or not there is a "-".
std::vector<std::string> cells(const Row& row);

/// One line with its line end; the heading and the rows have the same columns.
std::string textHeading(std::size_t itemWidth);
std::string textRow(const Row& row, std::size_t itemWidth);

/// A file of one heading line and one line a row, each field of text in quotation marks.
std::string csv(const std::vector<Row>& rows);
