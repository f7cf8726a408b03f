// The page and the picture of a run, as docs/ keeps them.
#pragma once

#include <string>
#include <vector>

#include "Rounds.h"

/// A page of Markdown: on what was measured, how, and the table. It shows the picture benchmarks.svg of its folder
/// pictures.
std::string page(const std::vector<Row>& rows, const RoundSettings& settings);
