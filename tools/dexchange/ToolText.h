#pragma once

#include <string>
#include <vector>

#include "hostlibs/VynString.h"

// The tool's texts are UTF-8; the library's are wide.
namespace dexchange_tool {

std::string utf8(const CVynStringT<wchar_t>& text);
std::string utf8(std::wstring_view text);
CVynStringT<wchar_t> wide(const std::string& text);
std::string lowerCase(std::string text);

// A value with three decimals ("12.500"), as the tool prints coordinates and stations.
std::string fixed3(double value);

// The items of a comma-separated option value; empty items are kept (and then refused).
std::vector<std::string> commaItems(const std::string& list);

}  // namespace dexchange_tool
