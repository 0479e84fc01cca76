#pragma once

#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "ieUtils/IImporter.h"

namespace vyn::ie::landxml {

// Reads a LandXML document (1.2, and the elements of other versions that agree with 1.2) into the
// container's current dataset, streaming through the library's XML token reader: the collections the
// settings ask for (CgPoints for POINTS or POINT_LISTS, PlanFeatures for LINES, Surfaces for SURFACES,
// Parcels for PARCELS; Units always), each by its handler (LandXmlHandlers.h). The file's units end up
// in the settings (distUnits, angleUnits); every coordinate is converted to meters.
//
// Results: DEX_RESULT_OK; the remarks kResultNotHeld, kResultMalformedSkipped and kResultTruncated
// (LandXmlWords.h) with what was read kept; DEX_RESULT_WRONG_FORMAT when the file is not XML or its root
// is not LandXML; DEX_RESULT_FILE_ERROR when it cannot be opened; DEX_RESULT_STOPPED when
// DexData::stopProcess_ was set (what was read stays).
class LandXmlImporter final : public DexImporterImpl {
 public:
  VYN_CLASS_ALLOCATOR

  LandXmlImporter(DexData* data, const CVynStringT<wchar_t>& fileName, const DexFormat* format);
  ~LandXmlImporter() override;

 protected:
  EDexResult doImport() override;
};

}  // namespace vyn::ie::landxml
