// PromUtility stands in several files; its reports and throws have one origin.
#pragma once

#include "s/UnitOrigin.h"

inline constexpr UnitOrigin promUtilityOrigin{"../s/PromUtility", "$Revision: 1.1 $"};
