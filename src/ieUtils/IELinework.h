#pragma once

#include "hostlibs/DexApi.h"

// Linework from the codes of surveyed points: the lines a field crew strings along kerbs, edges and
// fences by giving points the same code and code string ("EP:1", "KERB:L").
namespace vyn::ie {
class DexDataset;
}

namespace vyn::ie::utils {

// Joins the design points of dataset (point-to-line points included) into polylines by their codes:
// every point whose code carries a code string goes, in the dataset's order, into the polyline of
// that code and that string, so a point coded "EP:1 KERB:L" ends up in two polylines and one coded
// "FENCE:A:B" in the polylines A and B of its fence. A polyline refers to its points (point mode,
// straight segments, open), is named after its code string and carries its code with that string,
// so that DexPolyLine::isCodeString() holds for it. It lies on the layer of the code's description
// when that has one (the layer then counts as given by the code), otherwise on its first point's.
//
// Points without horizontal coordinates are passed over. A code and string met at one point only
// give no polyline; nor does one for which the dataset already holds a code-string polyline of that
// name and code, so running this twice changes nothing. The polylines are appended to the dataset,
// which owns them, in the order their first points come. Answers how many were added.
DEX_API int createLineworkFromCodes(DexDataset& dataset);

}  // namespace vyn::ie::utils
