#include "FormatChoice.h"

#include <algorithm>
#include <cctype>
#include <functional>
#include <vector>

#include "ToolText.h"
#include "ieDefinitions/IEFormatsData.h"
#include "pointfiles/PointLayout.h"

namespace dexchange_tool {

using vyn::ie::DexFormat;
using WideString = CVynStringT<wchar_t>;

bool toolReads(const DexFormat& format) {
  return vyn::ie::point_files::isPointFileFormat(&format);
}

bool toolWrites(const DexFormat& format) {
  return vyn::ie::point_files::isPointFileFormat(&format);
}

std::string plainName(const DexFormat& format) {
  std::string name = utf8(format.getName());
  const std::size_t open = name.rfind('(');
  if (open == std::string::npos || name.back() != ')') return name;
  const std::string group = name.substr(open);
  if (group.find("*.") == std::string::npos && group.rfind("(.", 0) != 0) return name;
  const std::size_t end = name.find_last_not_of(' ', open == 0 ? 0 : open - 1);
  return open == 0 || end == std::string::npos ? name : name.substr(0, end + 1);
}

namespace {

constexpr const wchar_t* kShippedImportLibrary = L"ImportParsers";
constexpr const wchar_t* kShippedExportLibrary = L"ExportParsers";
constexpr std::size_t kShownCandidates = 6;

struct Match {
  unsigned int index = 0;
  const DexFormat* format = nullptr;
};
using Matches = std::vector<Match>;

Matches formatsWhere(const std::function<bool(const DexFormat&)>& fits) {
  const vyn::ie::DexFormatsData& registry = vyn::ie::getIEFormatsData();
  Matches matches;
  for (unsigned int i = 0; i < registry.getNumberOfFormats(); ++i) {
    const DexFormat* format = registry.getFormatByIndex(i);
    if (format != nullptr && fits(*format)) matches.push_back({i, format});
  }
  return matches;
}

// How the tool serves a format in a direction: 2 through the shipped plug-ins, 1 through a library
// the registry names (when it is installed), 0 not at all.
int service(const DexFormat& format, bool forExport) {
  if (forExport ? toolWrites(format) : toolReads(format)) return 2;
  return format.getDllName(forExport).IsEmpty() ? 0 : 1;
}

Matches bestServed(Matches matches, bool forExport) {
  int best = 0;
  for (const Match& match : matches)
    best = std::max(best, service(*match.format, forExport));
  matches.erase(std::remove_if(matches.begin(), matches.end(),
                               [&](const Match& match) { return service(*match.format, forExport) < best; }),
                matches.end());
  return matches;
}

std::string extensionOf(const std::string& path) {
  const std::size_t slash = path.find_last_of('/');
  const std::size_t dot = path.find_last_of('.');
  if (dot == std::string::npos || (slash != std::string::npos && dot < slash)) return {};
  return path.substr(dot + 1);
}

// Whether the format names the extension (lower case, no dot) as its own (2) or in its dialog filter (1).
int extensionMatch(const DexFormat& format, const std::string& extension) {
  if (lowerCase(utf8(format.getExtension(false))) == extension) return 2;
  const std::string filter = lowerCase(utf8(format.getFilterExtension()));
  const std::string pattern = "*." + extension;
  for (std::size_t at = filter.find(pattern); at != std::string::npos; at = filter.find(pattern, at + 1)) {
    const std::size_t end = at + pattern.size();
    if (end == filter.size() || filter[end] == ';' || filter[end] == ')' || filter[end] == '|') return 1;
  }
  return 0;
}

// The shipped formats first, then the own extension before a filter's, then a library for the
// direction, then the registry's order.
Matches byExtension(const std::string& extension, bool forExport) {
  Match best;
  int bestRank = 0;
  for (const Match& match :
       formatsWhere([&](const DexFormat& format) { return extensionMatch(format, extension) > 0; })) {
    const int served = service(*match.format, forExport);
    const int rank =
        (served == 2 ? 8 : 0) + extensionMatch(*match.format, extension) * 2 + (served > 0 ? 1 : 0);
    if (rank > bestRank) {
      best = match;
      bestRank = rank;
    }
  }
  return best.format == nullptr ? Matches{} : Matches{best};
}

Matches byName(const std::string& wanted, bool forExport) {
  return bestServed(formatsWhere([&wanted](const DexFormat& format) {
                      return lowerCase(utf8(format.getName())) == wanted ||
                             lowerCase(plainName(format)) == wanted ||
                             lowerCase(utf8(format.getTitle())) == wanted;
                    }),
                    forExport);
}

Matches byPrefix(const std::string& wanted) {
  return formatsWhere([&wanted](const DexFormat& format) {
    return lowerCase(plainName(format)).rfind(wanted, 0) == 0 ||
           lowerCase(utf8(format.getTitle())).rfind(wanted, 0) == 0;
  });
}

Matches byIndex(const std::string& digits) {
  const unsigned int count = vyn::ie::getIEFormatsData().getNumberOfFormats();
  if (digits.size() > 6) return {};
  const auto index = static_cast<unsigned int>(std::stoul(digits));
  return index < count ? Matches{{index, vyn::ie::getIEFormatsData().getFormatByIndex(index)}} : Matches{};
}

Matches byGuid(const std::string& guid) {
  const DexFormat* format = vyn::ie::getIEFormatsData().getFormatById(wide(guid).GetString());
  if (format == nullptr) return {};
  return formatsWhere([format](const DexFormat& candidate) { return &candidate == format; });
}

std::string candidatesText(const std::string& spec, const Matches& matches) {
  std::string text = "\"" + spec + "\" fits " + std::to_string(matches.size()) + " formats: ";
  for (std::size_t i = 0; i < matches.size() && i < kShownCandidates; ++i)
    text +=
        (i == 0 ? "" : ", ") + std::to_string(matches[i].index) + " " + utf8(matches[i].format->getName());
  if (matches.size() > kShownCandidates)
    text += " and " + std::to_string(matches.size() - kShownCandidates) + " more";
  return text + "; give more of its name, its index or its GUID";
}

// The one format spec names; none with error.
Matches lookUp(const std::string& spec, const std::string& path, bool forExport, std::string& error) {
  if (spec.empty()) {
    const std::string extension = lowerCase(extensionOf(path));
    if (extension.empty()) {
      error = "cannot tell the format of " + path + " (no extension): name it with " +
              (forExport ? "--to" : "--from");
      return {};
    }
    Matches found = byExtension(extension, forExport);
    if (found.empty()) error = "no format for the extension ." + extension + " of " + path;
    return found;
  }
  if (spec.front() == '{') {
    Matches found = byGuid(spec);
    if (found.empty()) error = "no format with the GUID " + spec;
    return found;
  }
  if (std::all_of(spec.begin(), spec.end(), [](unsigned char ch) { return std::isdigit(ch) != 0; })) {
    Matches found = byIndex(spec);
    if (found.empty()) {
      error = "no format with the index " + spec + " (see dexchange formats: 0 to " +
              std::to_string(vyn::ie::getIEFormatsData().getNumberOfFormats() - 1) + ")";
    }
    return found;
  }
  const std::string wanted = lowerCase(spec);
  Matches found = byName(wanted, forExport);
  if (found.empty()) found = byExtension(wanted.front() == '.' ? wanted.substr(1) : wanted, forExport);
  if (found.empty()) found = byPrefix(wanted);
  if (found.empty()) error = "no format named " + spec;
  if (found.size() > 1) {
    error = candidatesText(spec, found);
    return {};
  }
  return found;
}

// A copy of a shipped format that names the shipped library for the direction the registry lacks.
std::unique_ptr<DexFormat> completedFormat(const DexFormat& format) {
  const WideString exportLibrary = format.getDllName(true);
  const WideString importLibrary = format.getDllName(false);
  return std::make_unique<DexFormat>(
      format.getGuid(), format.getName(), DexFormat::IMPORT_AND_EXPORT,
      exportLibrary.IsEmpty() ? WideString(kShippedExportLibrary) : exportLibrary,
      importLibrary.IsEmpty() ? WideString(kShippedImportLibrary) : importLibrary, format.getTitle(),
      format.getExtension(false), format.getFilterExtension(), format.getConfigurations(),
      format.getUsingModes(), format.getDataTypes(), format.getDistanceUnits(), format.getAngleUnits(),
      format.getParameters());
}

}  // namespace

std::unique_ptr<FormatChoice> FormatChoice::find(const std::string& spec, const std::string& path,
                                                 bool forExport, std::string& error) {
  const Matches found = lookUp(spec, path, forExport, error);
  if (found.empty()) return nullptr;
  const DexFormat& format = *found.front().format;
  std::unique_ptr<FormatChoice> choice(new FormatChoice(&format, found.front().index));
  if (format.getDllName(forExport).IsEmpty()) {
    if (service(format, forExport) < 2) {
      error = "the format " + utf8(format.getName()) + " cannot be " + (forExport ? "exported" : "imported");
      return nullptr;
    }
    choice->completed_ = completedFormat(format);
    choice->format_ = choice->completed_.get();
  }
  return choice;
}

std::string FormatChoice::name() const {
  return utf8(format_->getName());
}

}  // namespace dexchange_tool
