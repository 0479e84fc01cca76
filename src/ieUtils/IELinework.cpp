#include "ieUtils/IELinework.h"

#include <algorithm>
#include <map>
#include <memory>
#include <string>
#include <utility>
#include <vector>

#include "ieObjects/IECodesDataInterface.h"
#include "ieObjects/IEDataDictionary.h"
#include "ieObjects/IEDataset.h"
#include "ieObjects/IEPoints.h"
#include "ieObjects/IEPolyLines.h"

namespace vyn::ie::utils {

namespace {

// One line: a code's description and one of its code strings.
using LineKey = std::pair<const DexCodeDescription*, std::wstring>;

struct Line {
  std::vector<DexDesignPoint*> points;
  std::size_t order = 0;  // the order of its first point
};

// The code-string polylines the dataset already holds.
std::vector<LineKey> existingLines(DexDataset& dataset, int count) {
  std::vector<LineKey> keys;
  for (int i = 0; i < count; ++i) {
    auto* line = dynamic_cast<DexPolyLine*>(dataset.getObjectAt(i));
    if (line == nullptr || line->getType() != OBJECT_TYPE_POLYLINE || !line->isUsingPoints() ||
        line->getNumberOfCodes() == 0 || !line->isCodeString())
      continue;
    keys.emplace_back(line->getCode(0)->getDescription(), std::wstring(line->getName().view()));
  }
  return keys;
}

DexPolyLine* makeLine(const LineKey& key, const std::vector<DexDesignPoint*>& points) {
  auto line = std::make_unique<DexPolyLine>(true);
  const CVynStringT<wchar_t> name(std::wstring_view(key.second));
  line->setName(name);
  auto* code = new DexCodeValues(key.first);
  code->addCodeString(name);
  line->addCode(code);
  for (DexDesignPoint* point : points)
    line->addPoint(point, 0.0);
  if (key.first->getLayer() != nullptr) {
    line->setLayer(key.first->getLayer(), true);
  } else {
    line->setLayer(points.front()->getLayer(), false);
  }
  return line.release();
}

}  // namespace

int createLineworkFromCodes(DexDataset& dataset) {
  const int count = dataset.getNumberOfElements(OBJECT_TYPE_ALL, IDexStateInterface::ANY_STATE);
  const std::vector<LineKey> existing = existingLines(dataset, count);
  std::map<LineKey, Line> lines;
  for (int i = 0; i < count; ++i) {
    auto* point = dynamic_cast<DexDesignPoint*>(dataset.getObjectAt(i));
    if (point == nullptr || !point->isHorizCoordsDefined()) continue;
    for (int c = 0; c < point->getNumberOfCodes(); ++c) {
      const DexCodeValues* code = point->getCode(c);
      if (code->getDescription() == nullptr) continue;
      for (int s = 0; s < code->getNumberOfTheCodeStrings(); ++s) {
        LineKey key(code->getDescription(), std::wstring(code->getCodeStringAt(s).view()));
        if (key.second.empty()) continue;
        Line& line = lines[key];
        if (line.points.empty()) line.order = lines.size();
        line.points.push_back(point);
      }
    }
  }
  std::vector<std::pair<std::size_t, const std::pair<const LineKey, Line>*>> ordered;
  for (const auto& entry : lines) {
    const bool held = std::find(existing.begin(), existing.end(), entry.first) != existing.end();
    if (entry.second.points.size() >= 2 && !held) ordered.emplace_back(entry.second.order, &entry);
  }
  std::sort(ordered.begin(), ordered.end());
  for (const auto& [order, entry] : ordered)
    dataset.add(makeLine(entry->first, entry->second.points));
  return static_cast<int>(ordered.size());
}

}  // namespace vyn::ie::utils
