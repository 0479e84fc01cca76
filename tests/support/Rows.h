#pragma once

#include <gtest/gtest.h>

#include <cstddef>
#include <utility>

namespace dex_test {

// Checks a table of {actual, expected} rows, naming the row of a mismatch. The rows are computed
// where the table is written, in order, so one table can follow a value through several edits:
//
//   String text(L"abc");
//   const std::pair<int, int> rows[] = {{text.Find(L'b'), 1}, {text.Delete(0), 2}};
//   dex_test::expectRows(rows);
template <class Actual, class Expected, std::size_t N>
void expectRows(const std::pair<Actual, Expected> (&rows)[N]) {
  for (std::size_t i = 0; i < N; ++i)
    EXPECT_EQ(rows[i].first, rows[i].second) << "row " << i;
}

}  // namespace dex_test
