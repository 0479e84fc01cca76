#pragma once

#include <memory>
#include <string>

#include "ieDefinitions/IEFormats.h"

// Finding the format a command line names, and what the tool can do with it.
namespace dexchange_tool {

// Whether the shipped plug-ins read (write) the format. They read and write the point files
// ("CSV (Comma delimited)" and "Customizable ASCII Point Files") although the registry lists each
// for one direction only.
bool toolReads(const vyn::ie::DexFormat& format);
bool toolWrites(const vyn::ie::DexFormat& format);

// A format's name without the trailing list of extensions: "Customizable ASCII Point Files".
std::string plainName(const vyn::ie::DexFormat& format);

// The format a command line names for one direction. For a format the shipped plug-ins serve in a
// direction the registry lacks, a copy completed with the shipped library of that direction.
class FormatChoice {
 public:
  // spec, case ignored, is: a braced GUID; a registry index (the "#" of "dexchange formats"); a
  // format's name, plain name or title; an extension (".txt" or "txt"; a number needs its dot); a
  // prefix of one format's plain name or title. An empty spec takes the extension of path. Where
  // several formats fit a name or an extension, those the tool can run in that direction come first;
  // several formats of one name, or a prefix of several, are refused with the candidates. Null with
  // error when nothing fits or the format cannot be used in that direction.
  static std::unique_ptr<FormatChoice> find(const std::string& spec, const std::string& path, bool forExport,
                                            std::string& error);

  const vyn::ie::DexFormat* format() const { return format_; }
  std::string name() const;
  unsigned int index() const { return index_; }

 private:
  FormatChoice(const vyn::ie::DexFormat* format, unsigned int index) : format_(format), index_(index) {}

  std::unique_ptr<vyn::ie::DexFormat> completed_;
  const vyn::ie::DexFormat* format_;
  unsigned int index_;
};

}  // namespace dexchange_tool
