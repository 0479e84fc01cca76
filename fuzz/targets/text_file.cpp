// CTextFile line reading on raw bytes: every byte-order mark, odd byte counts, lone surrogates, NUL
// bytes and every kind of line end come straight from the input. The first byte picks the block size,
// small enough that lines and marks straddle blocks; the same file is then read again in one large
// block, and both readings must give the same lines.

#include <cstddef>
#include <cstdint>
#include <vector>

#include "hostlibs/TextFile.h"
#include "ieUtils/IEFileReaders.h"
#include "support/FuzzCheck.h"
#include "support/FuzzInput.h"
#include "support/ScratchFile.h"

namespace {

struct Reading {
  std::vector<CVynStringT<wchar_t>> lines;
  CTextFile::ETextEncoding encoding = CTextFile::ETextEncoding::Utf8;
};

Reading readAll(CTextFile& file, const std::wstring& path, std::size_t byteCount) {
  Reading reading;
  if (file.Open(path.c_str()) == 0) return reading;
  reading.encoding = file.GetEncoding();
  CVynStringT<wchar_t> line;
  while (file.ReadString(line)) {
    // A line never holds its line end, and there are never more lines than bytes (plus one).
    DEX_FUZZ_CHECK(line.Find(L'\n') < 0 && line.Find(L'\r') < 0);
    DEX_FUZZ_CHECK(reading.lines.size() <= byteCount);
    reading.lines.push_back(line);
    DEX_FUZZ_CHECK(file.GetLineNumber() == static_cast<int>(reading.lines.size()));
  }
  DEX_FUZZ_CHECK(line.IsEmpty());
  DEX_FUZZ_CHECK(!file.ReadString(line) && line.IsEmpty());
  file.Close();
  DEX_FUZZ_CHECK(!file.IsOpen() && !file.ReadString(line));
  return reading;
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  static const dex_fuzz::ScratchFile scratch("text-file");
  dex_fuzz::FuzzInput input(data, size);
  const int blockSize = 48 + input.takeByte();  // below the smallest block too, which counts as 64
  const auto bytes = input.takeRest();
  if (!scratch.write(bytes)) return 0;

  CTextFile small(blockSize);
  const Reading inBlocks = readAll(small, scratch.wpath(), bytes.size());
  vyn::ie::DexTextFile large(1 << 16);
  const Reading whole = readAll(large, scratch.wpath(), bytes.size());

  DEX_FUZZ_CHECK(inBlocks.encoding == whole.encoding);
  DEX_FUZZ_CHECK(inBlocks.lines == whole.lines);
  return 0;
}
