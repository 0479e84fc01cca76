// What the LandXML plug-in tests share: runs through the loader and the shipped plug-ins, the counts
// of what a dataset holds, and the schema check of a written document.

#pragma once

#include <cstdlib>
#include <memory>
#include <string>

#include "ieDefinitions/IEFormatsData.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataset.h"
#include "ieObjects/IEPolyLines.h"
#include "ieObjects/IESurface.h"
#include "ieUtils/IEParsersLoader.h"
#include "ieUtils/IESettings.h"
#include "support/TempDir.h"

namespace landxml_test {

using namespace vyn::ie;

inline const DexFormat* landXml() {
  return getIEFormatsData().getFormatById(L"{11246CDA-812F-45dc-81D4-35173C9A9FE8}");
}

inline DexSettings settingsFor(std::initializer_list<EDexDataType> types) {
  DexSettings settings;
  for (const EDexDataType type : types)
    settings.addDataType(type);
  return settings;
}

inline DexSettings everyKind() {
  return settingsFor({POINTS, POINT_LISTS, LINES, SURFACES, PARCELS, ROADS});
}

// One import (or export) through the loader with its own container.
struct LandXmlRun {
  std::unique_ptr<DexParsersLoader> loader = std::make_unique<DexParsersLoader>();
  EDexResult result = DEX_RESULT_FAILED;

  DexData& data() const { return *loader->getIEData(); }
  DexDataset& dataset() const { return *data().getCurDataset(); }
};

inline LandXmlRun importFile(const std::string& path, const DexSettings& settings = everyKind()) {
  LandXmlRun run;
  run.loader->initIEData(settings);
  run.result = run.loader->importInTheSameThread(dex_test::widen(path).c_str(), landXml(), nullptr);
  return run;
}

inline EDexResult exportTo(const LandXmlRun& run, const std::string& path) {
  return run.loader->exportInTheSameThread(dex_test::widen(path).c_str(), landXml(), nullptr);
}

// What a dataset holds, by kind, comparable in one expectation.
struct Counts {
  int points = 0, polylines = 0, surfaces = 0, positions = 0, triangles = 0, breaklines = 0, parcels = 0,
      regions = 0, lists = 0;
  bool operator==(const Counts&) const = default;
};

inline Counts countsOf(const DexDataset& dataset) {
  Counts counts;
  counts.points = dataset.getNumberOfElements(OBJECT_TYPE_DESIGN_POINT, 2);
  counts.polylines = dataset.getNumberOfElements(OBJECT_TYPE_POLYLINE, 2);
  counts.breaklines = dataset.getNumberOfElements(OBJECT_TYPE_BREAKLINE, 2);
  counts.surfaces = dataset.getNumberOfSurfaces();
  for (int i = 0; i < counts.surfaces; ++i) {
    counts.positions += dataset.getSurfaceAt(i)->getNumberOfPositions();
    counts.triangles += dataset.getSurfaceAt(i)->getNumberOfTriangles();
  }
  counts.parcels = dataset.getNumberOfParcels();
  counts.regions = dataset.getNumberOfRegions();
  counts.lists = dataset.getNumberOfObjectLists();
  return counts;
}

inline std::ostream& operator<<(std::ostream& out, const Counts& c) {
  return out << "points " << c.points << ", polylines " << c.polylines << ", surfaces " << c.surfaces
             << ", positions " << c.positions << ", triangles " << c.triangles << ", breaklines "
             << c.breaklines << ", parcels " << c.parcels << ", regions " << c.regions << ", lists "
             << c.lists;
}

// Whether xmllint finds the document valid against the LandXML 1.2 schema of tests/data/landxml.
inline bool validates(const std::string& path) {
  const std::string command = "xmllint --noout --schema '" + dex_test::dataFile("landxml/LandXML-1.2.xsd") +
                              "' '" + path + "' >/dev/null 2>&1";
  return std::system(command.c_str()) == 0;
}

// A document around body, LandXML 1.2 in meters unless units says otherwise.
inline std::string document(const std::string& body,
                            const std::string& units =
                                "<Metric linearUnit=\"meter\" areaUnit=\"squareMeter\" "
                                "volumeUnit=\"cubicMeter\" temperatureUnit=\"celsius\" "
                                "pressureUnit=\"HPA\" angularUnit=\"decimal degrees\"/>") {
  return "<?xml version=\"1.0\"?>\n<LandXML xmlns=\"http://www.landxml.org/schema/LandXML-1.2\" "
         "version=\"1.2\" date=\"2024-01-15\" time=\"12:00:00\"><Units>" +
         units + "</Units>" + body + "</LandXML>\n";
}

}  // namespace landxml_test
