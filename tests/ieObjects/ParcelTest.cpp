#include "ieObjects/IEParcel.h"

#include <gtest/gtest.h>

#include <string>

#include "ieObjects/IEHorizontalAlignment.h"
#include "ieObjects/IEPoints.h"
#include "ieObjects/detail/ParcelLog.h"
#include "support/LogCapture.h"
#include "support/VtableSlot.h"

namespace {

using vyn::ie::DexDesignPoint;
using vyn::ie::DexHorizontalAlignment;
using vyn::ie::DexParcel;
namespace detail = vyn::ie::detail;

TEST(DexParcel, NewParcelIsKindTenWithoutLinks) {
  DexParcel parcel;
  EXPECT_EQ(10, parcel.getType());
  EXPECT_EQ(nullptr, parcel.getHAlignment());
  EXPECT_EQ(nullptr, parcel.getCentralPoint());
  EXPECT_TRUE(parcel.getName().IsEmpty());
}

TEST(DexParcel, NullAlignmentIsReportedAndKeepsTheOneSetBefore) {
  const dex_test::LogCapture log;
  DexHorizontalAlignment alignment;
  DexParcel parcel;
  parcel.setHAlignment(&alignment);
  parcel.setHAlignment(nullptr);
  EXPECT_EQ(&alignment, parcel.getHAlignment());
  EXPECT_EQ(1, log.count(detail::kParcelLogSource, detail::kParcelNullAlignmentLine));
}

TEST(DexParcel, CopyKeepsTheSameLinksAndName) {
  DexHorizontalAlignment alignment;
  DexDesignPoint point;
  DexParcel parcel;
  parcel.setName(L"LOT 7");
  parcel.setHAlignment(&alignment);
  parcel.setCentralPoint(&point);

  const DexParcel copy(parcel);
  EXPECT_EQ(&alignment, copy.getHAlignment());
  EXPECT_EQ(&point, copy.getCentralPoint());
  EXPECT_EQ(L"LOT 7", copy.getName());

  DexParcel assigned;
  assigned = parcel;
  EXPECT_EQ(&point, assigned.getCentralPoint());
}

TEST(DexParcel, VirtualOperationsKeepTheirSlots) {
  if (!dex_test::vtableEntryOf(&DexParcel::getType)) GTEST_SKIP() << "virtual table layout unknown";
  EXPECT_EQ(2, dex_test::vtableEntryOf(&DexParcel::getType));
  EXPECT_EQ(3, dex_test::vtableEntryOf(&DexParcel::setCentralPoint));
  EXPECT_EQ(4, dex_test::vtableEntryOf(&DexParcel::getCentralPoint));
}

}  // namespace
