#pragma once

// What the DXF plug-in tests share: runs through the loader, a model holding every kind the drawing
// carries, a canonical text of a model to compare, and DXF text written compactly.

#include <map>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "ieDefinitions/IEResult.h"
#include "ieUtils/IEParsersLoader.h"
#include "ieUtils/IESettings.h"

namespace dxf_test {

// The settings of a run: every data kind the DXF format exchanges.
vyn::ie::DexSettings drawingSettings();
std::unique_ptr<vyn::ie::DexParsersLoader> loaderWith(
    const vyn::ie::DexSettings& settings = drawingSettings());
vyn::ie::EDexResult importDxf(vyn::ie::DexParsersLoader& loader, const std::string& path);
vyn::ie::EDexResult exportDxf(vyn::ie::DexParsersLoader& loader, const std::string& path);

// Layers with colours, dash styles and widths; coded points (one without height, one with a
// non-ASCII name); a flat polyline with a bulge, a 3D polyline, an area, a region, a breakline, two
// arcs (one clockwise), a circle, a one-line and a two-line label, and a surface of two triangles.
// Colours come from the objects, their layers and their codes.
void fillDrawing(vyn::ie::DexData& data);

// One line per object of the current dataset (kind, name, layer, codes, coordinates to 3 decimals,
// resolved colour, dash style and width, and the kind's own values), then one per region and surface.
std::vector<std::string> describe(vyn::ie::DexData& data);
// The objects by "kind|layer": point, line (polylines, breaklines, areas and regions), arc, circle,
// text, face (surface triangles).
std::map<std::string, int> countByKindAndLayer(vyn::ie::DexData& data);

// DXF text from groups written "code value|code value|...": "0 SECTION|2 ENTITIES|0 POINT|10 1|...".
std::string groups(std::string_view compact);

}  // namespace dxf_test
