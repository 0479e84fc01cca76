#pragma once

#include "hostlibs/DexApi.h"
#include "hostlibs/VynString.h"
#include "hostlibs/winport.h"

// File operations of the host utility library. Paths use "/" as separator; where a path is taken
// apart, "\\" counts as a separator too. A null path counts as empty.
namespace FileFuncs {

// Deletes the file at path; true when it was deleted. A file without write permission for its owner
// (read-only) is deleted only when force is set, which first makes it writable. Folders, missing files
// and null or empty paths answer false.
DEX_API bool DelFile(const wchar_t* path, bool force);

// name with every character that a file name may not hold on any system the exchange files travel to
// replaced by "_": \ / : * ? " < > | and the control characters U+0000 to U+001F. Nothing else is
// changed; an empty name stays empty.
DEX_API CVynStringT<wchar_t> MakeFileNameValid(const wchar_t* name);

// The longest path, in characters, that CompactPath leaves as it is.
inline constexpr int kCompactPathLength = 60;

// path shortened for display in a message: a path of at most kCompactPathLength characters is returned
// unchanged. Otherwise, with keepFileName, the start of the folder part that fits is kept (cut after a
// separator when that keeps at least half of it), followed by "..." and the last separator with the
// file name, e.g. "/home/surveyor/.../job.xml"; the file name is never cut, so the result may exceed the
// limit when the file name alone does ("..." + separator + file name). Without keepFileName the first
// kCompactPathLength - 3 characters are followed by "...". parent is not used (there is no window to
// measure); it is kept for the callers' sake.
DEX_API CVynStringT<wchar_t> CompactPath(HWND parent, const wchar_t* path, bool keepFileName);

}  // namespace FileFuncs

// Taking paths apart. The file name is what follows the last "/" or "\\"; its extension is what follows
// its last ".", unless that dot is the name's first character (".profile" has no extension).
namespace vyn::file_names {

// "C:/jobs/road.hal" gives "road.hal".
DEX_API CVynStringT<wchar_t> extractFileNameFromPathName(const wchar_t* path);

// "C:/jobs/road.hal" gives "road"; "C:/jobs/road" gives "road".
DEX_API CVynStringT<wchar_t> extractFileNameWithoutExtFromPathName(const wchar_t* path);

// "C:/jobs/road.hal" gives "hal" (no dot); a name without extension gives "".
DEX_API CVynStringT<wchar_t> extractExtFromPathName(const wchar_t* path);

// "C:/jobs/road.hal" gives "C:/jobs/"; a path without separator gives "".
DEX_API CVynStringT<wchar_t> extractDirNameWithSlashFromPathName(const wchar_t* path);

}  // namespace vyn::file_names

namespace vyn::folders {

// The folder of the running program, without a trailing "/" (from /proc/self/exe, links resolved);
// empty when the system does not tell. Bytes of the path that are not UTF-8 are taken as Latin-1.
DEX_API CVynStringT<wchar_t> getExeDir();

}  // namespace vyn::folders
