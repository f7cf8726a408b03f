// CableInfo stands in two files; its reports have one origin.
#pragma once

#include "s/UnitOrigin.h"

inline constexpr UnitOrigin cableInfoOrigin{"../s/CableInfo", "$Revision: 1.1 $"};
