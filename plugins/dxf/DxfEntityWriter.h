#pragma once

#include <array>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

#include "DxfDocument.h"
#include "DxfStyles.h"
#include "DxfWriter.h"
#include "hostlibs/VynString.h"

namespace vyn::ie {
class DexArc;
class DexCircle;
class DexData;
class DexDataset;
class DexDesignPoint;
class DexLayer;
class DexObject;
class DexPolyLine;
class DexRegion;
class DexStation;
class DexSurface;
class DexTextLabel;
}  // namespace vyn::ie

namespace vyn::ie::dxf {

// Writes the model's objects as the entities of a drawing (see DxfExporter for what becomes what),
// in the units and decimals of the data's settings, into the frame of DxfDocument.
class DxfEntityWriter {
 public:
  explicit DxfEntityWriter(DexData& data);

  // Creates the file and writes the frame up to the entities; false when it cannot be created.
  bool begin(const std::string& path);
  // The objects the settings' data types ask for; a null or unwanted object writes nothing.
  void writeObject(DexObject* object);
  void writeRegion(const DexRegion& region);
  void writeSurface(const DexSurface& surface);
  // Flushes the buffer; false when a write failed.
  bool flush() { return writer_.flush(); }
  // The end of the frame; false when the file cannot be written or closed.
  bool end();

  DexDataset* dataset() const noexcept { return dataset_; }
  bool writesRegions() const noexcept { return areas_; }
  bool writesSurfaces() const noexcept { return surfaces_; }

 private:
  // An entity's drawing values; by layer where they come from its own layer.
  struct Style {
    int color = kColorByLayer;
    long long trueColor = -1;
    std::wstring lineType;  // empty: by layer
    int lineWeight = kLineWeightByLayer;
  };
  // The extended data of an entity; nothing is written when kind is empty.
  struct Extras {
    std::string_view kind;
    std::wstring_view name;
    std::wstring codes;
    std::wstring_view surface;
  };
  struct Vertex {
    double x, y, z, bulge;
  };

  void scan();
  void noteLayer(const DexLayer* layer);
  void notePosition(double north, double east, double height);
  DxfFrame frame();
  DxfLayerRow layerRow(const DexLayer* layer, const std::string& name) const;

  void writePoint(const DexDesignPoint& point);
  void writeLine(const DexPolyLine& line, std::string_view kind, const Style& style);
  void writeVertices(std::string_view layer, const Style& style, const std::vector<Vertex>& vertices,
                     bool closed, bool heights, const Extras& extras);
  void writeArc(const DexArc& arc);
  void writeCircle(const DexCircle& circle);
  void writeLabel(const DexTextLabel& label);

  void beginEntity(std::string_view type, std::string_view layer, const Style& style);
  void writeExtras(const Extras& extras);
  Extras extrasOf(const DexObject& object, std::string_view kind);
  Style styleOf(const DexObject& object, int colorType, bool withLine) const;
  Style colorStyle(bool defined, unsigned long color) const;
  const std::string& layerName(const DexLayer* layer) const;

  // Drawing coordinates in the file's units.
  double x(const DexStation& station) const;
  double y(const DexStation& station) const;
  double z(const DexStation& station) const;
  double units(double meters) const noexcept { return meters * toUnits_; }
  void position(int code, double px, double py, double pz);

  DexData& data_;
  DexDataset* dataset_;
  DxfStyles styles_;
  DxfWriter writer_;
  double toUnits_ = 1.0;
  int unitsCode_ = 6;
  std::array<int, 3> decimals_{3, 3, 3};  // X, Y, Z
  int lengthDecimals_ = 3;
  bool points_, lines_, areas_, surfaces_, labels_;
  const DexLayer* defaultLayer_ = nullptr;
  std::array<bool, 3> defaultDefines_{};  // colour, dash style, width

  std::vector<const DexLayer*> layers_;
  std::unordered_map<const DexLayer*, std::string> layerNames_;
  std::string zeroLayer_ = "0";
  double minX_, minY_, minZ_, maxX_, maxY_, maxZ_;
  std::vector<Vertex> vertices_;
};

}  // namespace vyn::ie::dxf
