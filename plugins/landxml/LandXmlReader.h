#pragma once

#include <cstdint>
#include <map>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "LandXmlWords.h"
#include "hostlibs/VynString.h"
#include "hostlibs/XmlParser.h"
#include "pointfiles/LineValues.h"

// The streaming reader of a LandXML document: it walks the library's XML tokens once, keeps the path
// of open elements and hands every element inside a collection of the root (CgPoints, Surfaces, ...)
// to the handler registered for that collection. No document tree is built: each handler turns what
// it is handed into model objects as the elements end.
namespace vyn::ie {
class DexData;
class DexDataset;
class DexDesignPoint;
}  // namespace vyn::ie

namespace vyn::ie::landxml {

// The open elements from the root down, by name without namespace prefix.
class ElementPath {
 public:
  int depth() const noexcept { return depth_; }
  // The innermost element; levelsUp 1 its parent, and so on; empty above the root.
  std::wstring_view name(int levelsUp = 0) const noexcept;

  void push(std::wstring_view name);
  void pop() noexcept { depth_ = depth_ > 0 ? depth_ - 1 : 0; }

 private:
  std::vector<std::wstring> names_;  // names_[0, depth_); the strings beyond are kept for reuse
  int depth_ = 0;
};

// What one import shares between the collection handlers: the container and its current dataset,
// the file's units, the tallies of what the model cannot hold and of what was malformed, and the
// design points by name (for pntRef and Chain).
class ReadContext {
 public:
  ReadContext(DexData& data, const CVynStringT<wchar_t>& fileName);
  ~ReadContext();
  ReadContext(const ReadContext&) = delete;
  ReadContext& operator=(const ReadContext&) = delete;

  DexData& data() noexcept { return data_; }
  DexDataset& dataset() noexcept { return dataset_; }

  // ---- Units ---------------------------------------------------------------------------------
  FileUnits& units() noexcept { return units_; }
  // Reads the numbers of text (readNumbers) and converts them from the file's linear unit to meters.
  // Answers the count, or -1 when a word is not a number, there are more than capacity or a value
  // does not convert to a finite number of meters (other than the no-value marker).
  int readCoordinates(std::wstring_view text, double* meters, int capacity) const;
  // Converts values in place; false when one does not convert to a finite number of meters.
  bool toMeters(std::vector<double>& values) const;

  // ---- Tallies -------------------------------------------------------------------------------
  // An element the model cannot hold (with everything in it), counted by name.
  void notHeld(std::wstring_view element);
  // An attribute the model cannot hold, counted as "element@attribute"; derived attributes are not
  // counted (isDerivedAttribute).
  void notHeld(std::wstring_view element, std::wstring_view attribute);
  // Every attribute of a serialised list counted as not held.
  void notHeldAttributes(std::wstring_view element, std::wstring_view attributes);
  // A malformed part: counted by its kind, the first kTracedProblems traced with the detail.
  void malformed(std::wstring_view kind, std::wstring_view detail);
  // The result of the run: DEX_RESULT_OK or the highest remark that applies (see LandXmlWords.h).
  // Traces the counts.
  EDexResult finish(bool truncated);

  // ---- Points by name ------------------------------------------------------------------------
  // Makes a design point that was just added to the dataset known by its name (the first point of a
  // name stays the one found).
  void addPoint(DexDesignPoint* point);
  // The design point of that name that this run added to the dataset; null when there is none.
  DexDesignPoint* findPoint(std::wstring_view name);

  // ---- Scratch shared by the handlers (one run reads one element at a time) -------------------
  CVynStringT<wchar_t>& scratch() noexcept { return scratch_; }

 private:
  void indexPoints();

  DexData& data_;
  DexDataset& dataset_;
  const CVynStringT<wchar_t>& fileName_;
  FileUnits units_;
  std::map<std::wstring, std::int64_t, std::less<>> notHeld_;
  std::map<std::wstring, std::int64_t, std::less<>> malformed_;
  int tracedProblems_ = 0;
  // Built from the dataset's objects from firstObject_ on at the first look-up, so that a file without
  // references pays nothing for it.
  int firstObject_ = 0;
  std::unique_ptr<point_files::TextMap<DexDesignPoint*>> pointsByName_;
  CVynStringT<wchar_t> scratch_;
};

// Calls visit(name, value) for every attribute of a serialised attribute list.
template <class Visit>
void forEachAttribute(std::wstring_view attributes, Visit&& visit) {
  if (attributes.empty()) return;
  CXmlParserBase::ForEachAttrib(attributes, [&](std::wstring_view name, std::wstring_view value) {
    visit(name, value);
    return true;
  });
}

// What reads one collection of the root. The reader hands it the collection's start tag and then
// every element inside, with the path of open elements (the collection at path.depth() 2, under the
// root). It never sees the elements it declined (start() false), nor anything inside them.
class CollectionHandler {
 public:
  virtual ~CollectionHandler();

  // A start tag. False when the element is not read: it is counted as not held and read over with
  // all it holds.
  virtual bool start(const ElementPath& path, std::wstring_view attributes) = 0;
  // The text of the innermost element.
  virtual void text(const ElementPath& path, std::wstring_view text);
  // The end tag of the innermost element (path still holds it).
  virtual void end(const ElementPath& path);
  // After the document, also one that broke off: references still open are resolved or dropped.
  virtual void finish();
};

// Reads a document and dispatches its collections; collections without a handler are counted as not
// held, those registered as unwanted (not asked for by the settings) are read over without a remark.
class LandXmlReader {
 public:
  explicit LandXmlReader(ReadContext& context) : context_(context) {}

  // The handler of the collection of that name; not owned, it must outlive read().
  void addCollection(std::wstring_view name, CollectionHandler& handler);
  // A collection read over without a remark.
  void skipCollection(std::wstring_view name);

  // Reads every token of parser. DEX_RESULT_OK when the document read to its end, kResultTruncated
  // when it broke off after the root had started, DEX_RESULT_WRONG_FORMAT when it is not LandXML,
  // DEX_RESULT_STOPPED on a stop request. Every handler's finish() is called in every case but the
  // wrong format.
  EDexResult read(CXmlParserBase& parser);

 private:
  struct Collection {
    std::wstring name;
    CollectionHandler* handler;  // null: read over without a remark
  };

  const Collection* findCollection(std::wstring_view name) const;
  void startElement(std::wstring_view attributes);
  void endElement();

  ReadContext& context_;
  std::vector<Collection> collections_;
  ElementPath path_;
  const Collection* current_ = nullptr;  // the collection being read
  int skipDepth_ = 0;                    // above 0: reading over everything down from that depth
};

// The local name of a tag (after any namespace prefix).
std::wstring_view localName(std::wstring_view tag) noexcept;

}  // namespace vyn::ie::landxml
