// All rows of the table, in the order in which their files are linked.
#pragma once

#include <vector>

#include "Item.h"

std::vector<Item>& registeredItems();
