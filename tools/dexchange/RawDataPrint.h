#pragma once

#include <ostream>

#include "ieObjects/IERawData.h"

namespace dexchange_tool {

// Prints the raw observations of a dataset: records by kind, the stations set up and the time range.
void printRawData(std::ostream& out, const vyn::ie::DexRawData& rawData);

}  // namespace dexchange_tool
