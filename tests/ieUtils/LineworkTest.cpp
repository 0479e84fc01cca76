#include "ieUtils/IELinework.h"

#include <gtest/gtest.h>

#include <map>
#include <sstream>
#include <string>
#include <vector>

#include "ieObjects/IECodesDataInterface.h"
#include "ieObjects/IEDataDictionary.h"
#include "ieObjects/IEDataset.h"
#include "ieObjects/IELayers.h"
#include "ieObjects/IENoValue.h"
#include "ieObjects/IEPoints.h"
#include "ieObjects/IEPolyLines.h"

namespace {

using namespace vyn::ie;

// A dataset of points written "NAME CODE:STRING:STRING CODE ..."; a name starting with "?" has no
// coordinates. Points lie on layer PTS; the code KERB has the layer KERBS.
class Survey {
 public:
  Survey() : dataset_(L"survey") {
    points_.setName(L"PTS");
    kerbs_.setName(L"KERBS");
  }

  DexDataset& with(const std::vector<std::string>& points) {
    double north = 0.0;
    for (const std::string& spec : points) {
      std::istringstream words(spec);
      std::string name;
      words >> name;
      auto* point = new DexDesignPoint();
      point->setName(CVynStringT<wchar_t>(wide(name).c_str()));
      point->setCoords(name[0] == '?' ? kNoValue : ++north, 2.0, 3.0);
      point->setLayer(&points_, false);
      for (std::string code; words >> code;) {
        std::istringstream parts(code);
        std::string part;
        std::getline(parts, part, ':');
        auto* values = new DexCodeValues(description(part));
        while (std::getline(parts, part, ':'))
          values->addCodeString(CVynStringT<wchar_t>(wide(part).c_str()));
        point->addCode(values);
      }
      dataset_.add(point);
    }
    return dataset_;
  }

  // "NAME CODE LAYER[ by code]: POINT POINT ..." for each polyline of the dataset.
  std::vector<std::string> lines() {
    std::vector<std::string> lines;
    for (int i = 0; i < dataset_.getNumberOfElements(OBJECT_TYPE_ALL, IDexStateInterface::ANY_STATE); ++i) {
      const auto* line = dynamic_cast<const DexPolyLine*>(dataset_.getObjectAt(i));
      if (line == nullptr) continue;
      std::string text =
          narrow(line->getName()) + " " + narrow(line->getCode(0)->getDescription()->getName()) + " " +
          narrow(line->getLayer()->getName()) + (line->isLayerByCode() ? " by code" : "") + ":";
      for (int n = 0; n < line->getNumberOfPoints(); ++n)
        text += " " + narrow(line->getPoint(n)->getName());
      EXPECT_TRUE(line->isUsingPoints() && line->isCodeString()) << text;
      lines.push_back(text);
    }
    return lines;
  }

 private:
  static std::wstring wide(const std::string& text) { return std::wstring(text.begin(), text.end()); }
  static std::string narrow(const CVynStringT<wchar_t>& text) {
    return std::string(text.view().begin(), text.view().end());
  }

  const DexCodeDescription* description(const std::string& name) {
    auto& held = codes_[name];
    if (!held) {
      held = std::make_unique<DexCodeDescription>(CVynStringT<wchar_t>(wide(name).c_str()));
      if (name == "KERB") held->setLayer(&kerbs_);
    }
    return held.get();
  }

  DexLayer points_;
  DexLayer kerbs_;
  std::map<std::string, std::unique_ptr<DexCodeDescription>> codes_;
  DexDataset dataset_;
};

struct LineworkCase {
  const char* what;
  std::vector<std::string> points;
  std::vector<std::string> lines;
};

TEST(Linework, PointsOfOneCodeAndStringAreJoinedInTheOrderRead) {
  const LineworkCase cases[] = {
      {"strings of one code",
       {"1 EP:1", "2 EP:1", "3 EP:2", "4 EP:1", "5 EP:2"},
       {"1 EP PTS: 1 2 4", "2 EP PTS: 3 5"}},
      {"several codes and strings at a point",
       {"1 EP:1 KERB:L", "2 EP:1 KERB:L", "3 FENCE:A:B", "4 FENCE:A:B"},
       {"1 EP PTS: 1 2", "L KERB KERBS by code: 1 2", "A FENCE PTS: 3 4", "B FENCE PTS: 3 4"}},
      {"nothing to join", {"1 CL:1", "2 GND", "3 EP:5", "?4 EP:5", "5 EP"}, {}},
  };
  for (const LineworkCase& survey : cases) {
    Survey model;
    DexDataset& dataset = model.with(survey.points);
    EXPECT_EQ(static_cast<int>(survey.lines.size()), utils::createLineworkFromCodes(dataset)) << survey.what;
    EXPECT_EQ(survey.lines, model.lines()) << survey.what;
  }
}

TEST(Linework, RunningItAgainAddsNothing) {
  Survey model;
  DexDataset& dataset = model.with({"1 EP:1", "2 EP:1", "3 EP:1"});
  EXPECT_EQ(1, utils::createLineworkFromCodes(dataset));
  EXPECT_EQ(0, utils::createLineworkFromCodes(dataset));
  EXPECT_EQ(std::vector<std::string>{"1 EP PTS: 1 2 3"}, model.lines());
}

}  // namespace
