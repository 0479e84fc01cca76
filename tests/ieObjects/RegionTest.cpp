#include "ieObjects/IERegion.h"

#include <gtest/gtest.h>

#include <string>

#include "ObjectsTestHelpers.h"
#include "ieObjects/IELayers.h"
#include "ieObjects/detail/RegionLog.h"
#include "support/LogCapture.h"

namespace {

using objects_test::CountedAreaProperties;
using vyn::ie::DexDrawAreaProperties;
using vyn::ie::DexPositionWithBulge;
using vyn::ie::DexRegion;
namespace detail = vyn::ie::detail;

const std::wstring kSource = detail::kRegionLogSource;

TEST(DexRegion, NewRegionIsKindThirteenAndEmpty) {
  DexRegion region;
  EXPECT_EQ(13, region.getType());
  EXPECT_EQ(0u, region.getVerticesCount());
  EXPECT_EQ(0, region.getRegionType());
  EXPECT_EQ(nullptr, region.getLayer());
  EXPECT_EQ(nullptr, region.getAreaDrawProperties());
}

TEST(DexRegion, KeepsVerticesWithTheirBulgesInOrder) {
  DexRegion region;
  region.addVertex(DexPositionWithBulge(1, 2, 3, 0.5));
  region.addVertex(DexPositionWithBulge(4, 5, 6, 0.0));
  ASSERT_EQ(2u, region.getVerticesCount());
  EXPECT_EQ(vyn::ie::DexPosition3D(1, 2, 3), region.getVertexAt(0));
  EXPECT_EQ(0.5, region.getVertexAt(0).getBulge());
  EXPECT_EQ(4.0, region.getVertexAt(1).x);
}

TEST(DexRegion, VertexPastTheEndIsReportedAndTheOrigin) {
  const dex_test::LogCapture log;
  DexRegion region;
  region.addVertex(DexPositionWithBulge(1, 2, 3, 0.5));
  region.addVertex(DexPositionWithBulge(4, 5, 6, 0.25));

  const DexPositionWithBulge& vertex = region.getVertexAt(5);
  EXPECT_EQ(vyn::ie::DexPosition3D(0, 0, 0), vertex);
  EXPECT_EQ(0.0, vertex.getBulge());
  region.getVertexAt(2);
  EXPECT_EQ(2, log.count(kSource, detail::kRegionVertexIndexLine));
}

TEST(DexRegion, StoresAnyRegionTypeNumber) {
  DexRegion region;
  region.setRegionType(42);
  EXPECT_EQ(42, region.getRegionType());
}

TEST(DexRegion, ReplacingAreaPropertiesDeletesTheOldOnesUnlessTheSame) {
  int deletions = 0;
  auto* const first = new CountedAreaProperties(deletions);
  {
    DexRegion region;
    region.setAreaDrawProperties(first);
    region.setAreaDrawProperties(first);
    EXPECT_EQ(0, deletions);
    region.setAreaDrawProperties(new DexDrawAreaProperties());
    EXPECT_EQ(1, deletions);
    region.setAreaDrawProperties(new CountedAreaProperties(deletions));
  }
  EXPECT_EQ(2, deletions);
}

TEST(DexRegion, CopyDuplicatesAreaPropertiesAndSharesTheLayer) {
  const vyn::ie::DexLayer layer;
  DexRegion region;
  region.setName(L"R");
  region.setLayer(&layer);
  region.setRegionType(3);
  region.addVertex(DexPositionWithBulge(1, 1, 1, 0));
  auto* const properties = new DexDrawAreaProperties();
  properties->setColor(0x123);
  region.setAreaDrawProperties(properties);

  const DexRegion copy(region);
  EXPECT_EQ(L"R", copy.getName());
  EXPECT_EQ(&layer, copy.getLayer());
  EXPECT_EQ(3, copy.getRegionType());
  EXPECT_EQ(1u, copy.getVerticesCount());
  ASSERT_NE(nullptr, copy.getAreaDrawProperties());
  EXPECT_NE(properties, copy.getAreaDrawProperties());
  EXPECT_EQ(0x123u, objects_test::colorOf(copy.getAreaDrawProperties()));

  DexRegion assigned;
  assigned = region;
  EXPECT_NE(properties, assigned.getAreaDrawProperties());
  EXPECT_EQ(1u, assigned.getVerticesCount());
}

}  // namespace
