// A scripted road plug-in for the tests of the multi-file road bases: it reads and writes a road kept
// in three small text files (".thal" horizontal, ".tval" vertical, ".txs" cross sections).
//
// Each file holds one line "NAME COUNT [STATION]": a part named NAME with COUNT items (line elements,
// long sections or cross sections) that starts at STATION (horizontal only). An empty file holds no
// part (so does a blank line); the line "bad", or a reader whose file did not open, is a file that cannot be
// read. The exporter writes the same line for every part it is given.
//
// Exporters also read the script <export folder>.script, one command a line:
//   stop-after-step N   sets DexData::stopProcess_ after step N, as a user would

#include <fstream>
#include <sstream>
#include <string>

#include "hostlibs/VynString.h"
#include "ieObjects/IECrossSections.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEHorizontalAlignment.h"
#include "ieObjects/IEHorizontalElements.h"
#include "ieObjects/IEVerticalAlignment.h"
#include "ieUtils/IEMultipleFilesRoadExporter.h"
#include "ieUtils/IEMultipleFilesRoadImporter.h"

namespace {

using vyn::ie::DexCrossSection;
using vyn::ie::DexCrossSectionSet;
using vyn::ie::DexData;
using vyn::ie::DexFormat;
using vyn::ie::DexHorizontalAlignment;
using vyn::ie::DexLongSection;
using vyn::ie::DexVerticalAlignment;

struct PartLine {
  CVynStringT<wchar_t> name;
  int count = 0;
  double station = 0.0;
};

enum class LineRead { PART, EMPTY, UNREADABLE };

LineRead readPartLine(CTextFile& reader, PartLine& part) {
  if (!reader.IsOpen()) return LineRead::UNREADABLE;
  CVynStringT<wchar_t> line;
  if (!reader.ReadString(line)) return LineRead::EMPTY;
  std::istringstream words(vyn_text::toUtf8(line.view()));
  std::string name;
  if (!(words >> name)) return LineRead::EMPTY;
  if (!(words >> part.count)) return LineRead::UNREADABLE;
  words >> part.station;
  part.name = CVynStringT<wchar_t>(name.c_str(), vyn_text::CP_UTF8);
  return LineRead::PART;
}

// Reads one part: make(line) builds it from a line.
template <class Part, class Make>
bool readPart(CTextFile& reader, Part*& out, Make make) {
  PartLine line;
  const LineRead read = readPartLine(reader, line);
  out = read == LineRead::PART ? make(line) : nullptr;
  if (out != nullptr) out->setName(line.name);
  return read != LineRead::UNREADABLE;
}

class RoadImporter : public vyn::ie::IDexMultipleFilesRoadImporter {
 public:
  RoadImporter(DexData* data, const CVynStringT<wchar_t>& fileName, const DexFormat* format)
      : IDexMultipleFilesRoadImporter(data, fileName, format) {}

 protected:
  CVynStringT<wchar_t> getHAlExtension() override { return L".thal"; }
  CVynStringT<wchar_t> getVAlExtension() override { return L".tval"; }
  CVynStringT<wchar_t> getXSectExtension() override { return L".txs"; }

  bool readHAl(DexHorizontalAlignment*& out) override {
    return readPart(hAlFile, out, [](const PartLine& line) {
      auto* const part = new DexHorizontalAlignment;
      part->setStaStart(line.station);
      for (int i = 0; i < line.count; ++i)
        part->addSegment(new vyn::ie::DexLine2D);
      return part;
    });
  }
  bool readVAl(DexVerticalAlignment*& out) override {
    return readPart(vAlFile, out, [](const PartLine& line) {
      auto* const part = new DexVerticalAlignment;
      for (int i = 0; i < line.count; ++i)
        part->addLongSection(new DexLongSection(DexLongSection::LEVEL_POINT));
      return part;
    });
  }
  bool readXSect(DexCrossSectionSet*& out) override {
    return readPart(xSectFile, out, [](const PartLine& line) {
      auto* const part = new DexCrossSectionSet(false);
      for (int i = 0; i < line.count; ++i)
        part->addCrossSection(new DexCrossSection(nullptr));
      return part;
    });
  }
};

void writePartLine(FILE* stream, const CVynStringT<wchar_t>& name, int count) {
  const std::string line = vyn_text::toUtf8(name.view()) + " " + std::to_string(count) + "\n";
  std::fputs(line.c_str(), stream);
}

int stopStepOf(const CVynStringT<wchar_t>& folder) {
  std::ifstream script(vyn_text::toUtf8(folder.view()) + ".script");
  std::string command;
  int step = -1;
  while (script >> command) {
    if (command == "stop-after-step") script >> step;
  }
  return step;
}

class RoadExporter : public vyn::ie::IDexMultipleFilesRoadExporter {
 public:
  RoadExporter(DexData* data, const CVynStringT<wchar_t>& fileName, const DexFormat* format)
      : IDexMultipleFilesRoadExporter(data, fileName, format), stopStep_(stopStepOf(fileName)) {}

 protected:
  bool singleStep() override {
    const bool more = IDexMultipleFilesRoadExporter::singleStep();
    if (currentStep == stopStep_) DexData::stopProcess_ = true;
    return more;
  }
  bool writeHAl(const DexHorizontalAlignment* part) override {
    if (!openHAlFile(part, L".thal")) return false;
    writePartLine(hAlFile, part->getName(), part->getNumberOfSegments());
    return true;
  }
  bool writeVAl(const DexVerticalAlignment* part) override {
    if (!openVAlFile(part, L".tval")) return false;
    writePartLine(vAlFile, part->getName(), part->getNumberOfLongSections());
    return true;
  }
  bool writeXSect(const DexCrossSectionSet* part,
                  const DexVerticalAlignment* /*verticalAlignment*/) override {
    if (!openXSectFile(part, L".txs")) return false;
    writePartLine(xSectFile, part->getName(), part->getNumberOfCrossSections());
    return true;
  }

 private:
  int stopStep_;
};

}  // namespace

DEX_MAKE_IMPORTER(data, fileName, format) {
  return new RoadImporter(data, fileName, format);
}

DEX_MAKE_EXPORTER(data, fileName, format) {
  return new RoadExporter(data, fileName, format);
}
