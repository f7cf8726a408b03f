// The ratios of a run as a picture.
#pragma once

#include <string>
#include <vector>

#include "Rounds.h"

/// An SVG: for each row a bar for the peer and one for the limit on a logarithmic scale, from parity to the ratio, and
/// the goals as marks. Left of parity is faster.
std::string picture(const std::vector<Row>& rows);
