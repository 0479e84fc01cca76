#pragma once

#include <ostream>
#include <string>

#include "ieObjects/IEData.h"

namespace dexchange_tool {

// Prints what a container holds of roads: the alignments of its datasets (name, station range, parts
// with their elements counted by kind, station-equation set), the parts of its parts dictionary by
// kind and its station-equation sets with their equations. Prints nothing when it holds none of them.
void printRoads(std::ostream& out, const vyn::ie::DexData& data);

}  // namespace dexchange_tool
