#pragma once

#include "hostlibs/DexApi.h"
#include "hostlibs/VynArray.h"
#include "hostlibs/VynString.h"
#include "hostlibs/winport.h"
#include "ieUtils/IEUtilsStringArray.h"

// Colours, file names, folder listings, the assist-data folder, and the list and column helpers of
// report writers. Nothing here throws or logs.
namespace vyn::ie::utils {

// Colours. A colour is a 32-bit value with red in the lowest byte, then green, then blue.
// html2Rgb answers false unless html has exactly 7 characters and begins with "#"; otherwise it reads
// three two-digit hexadecimal numbers ("%2X%2X%2X"; a number that cannot be read counts as 0), sets rgb
// and answers true. rgb2Html gives "#RRGGBB" in upper case.
DEX_API bool html2Rgb(const CVynStringT<wchar_t>& html, unsigned long& rgb);
DEX_API CVynStringT<wchar_t> rgb2Html(const unsigned long& rgb);

// File names; "/" and "\\" both separate folders. With placeIsFolder, place is a folder and the result
// is place, a "/" unless place already ends in "/" or "\\", and name; otherwise the result is the
// folder of the path place, with its trailing separator (nothing when place has no folder), and name.
DEX_API CVynStringT<wchar_t> createFileName(const CVynStringT<wchar_t>& place,
                                            const CVynStringT<wchar_t>& name, bool placeIsFolder);
// The file name of path without folder and extension ("/jobs/road.hal" gives "road"); the extension
// follows the name's last dot unless that dot is its first character (".profile" stays ".profile").
DEX_API CVynStringT<wchar_t> createNameFromFile(const CVynStringT<wchar_t>& path);
DEX_API CVynStringT<wchar_t> getNameFromFileName(const CVynStringT<wchar_t>& path);
// 1 for "." and "..", else 0 (null included).
DEX_API int isDots(const wchar_t* name);

// What findAllFilesInFolder lists (flags; 3 lists both).
enum EFindFolder : int {
  FIND_FILES = 1,
  FIND_FOLDERS = 2,
  FIND_FILES_AND_FOLDERS = FIND_FILES | FIND_FOLDERS,
};

// Clears found, then adds the entries of folder, in the order the file system gives, whose names match
// "*" followed by mask (a null mask matches every name; ".txt" matches the names ending in ".txt"):
// files when what holds FIND_FILES, folders other than "." and ".." when it holds FIND_FOLDERS. As in
// the host system's search, names are matched regardless of case and "*.*" matches every name. An entry
// that is a link counts as what it points to. Each entry gives its name (cut to MAX_PATH - 1
// characters), its attributes (FILE_ATTRIBUTE_DIRECTORY, FILE_ATTRIBUTE_READONLY when its owner may
// not write it, otherwise FILE_ATTRIBUTE_NORMAL), its size (0 for a folder) and its times (the creation
// time is the time of the last status change, which is the oldest time the system keeps). A null
// folder, a missing folder or one that cannot be read leaves found empty; the folder read is folder
// followed by "/", so an empty folder is the root folder.
DEX_API void findAllFilesInFolder(vyn_vector<WIN32_FIND_DATAW>& found, EFindFolder what,
                                  const wchar_t* folder, const wchar_t* mask);

// The assist-data folder: the folder last set when it is not empty, otherwise the folder of the host
// program followed by "/vyndata/ie_assist". It is one process-wide value without a lock: set it before
// any run starts in a thread of its own.
DEX_API CVynStringT<wchar_t> getIEAssistDataPath();
DEX_API void setIEAssistDataPath(CVynStringT<wchar_t> path);

// Lists and columns. stringArrayToString joins the values with "," and no blanks. isStringInStringArray
// compares exactly and case-sensitively. getStringOfSpaces gives n blanks (nothing for n below 1).
DEX_API CVynStringT<wchar_t> stringArrayToString(const StringArray& values);
DEX_API bool isStringInStringArray(const StringArray& values, const CVynStringT<wchar_t>& text);
DEX_API CVynStringT<wchar_t> getStringOfSpaces(int n);

// text in a column of width characters filled with fill: a width of 0 or less gives an empty text. A
// text of width characters or more is cut to width characters, one fewer with keepGap, so that a fill
// character stays between it and the next column. The fill goes in front with alignRight, else after.
DEX_API CVynStringT<wchar_t> getReportString(wchar_t fill, int width, bool alignRight,
                                             const CVynStringT<wchar_t>& text, bool keepGap);

}  // namespace vyn::ie::utils
