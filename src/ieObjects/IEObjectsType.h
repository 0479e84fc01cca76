#pragma once

// The kinds of the objects a dataset holds, as IDexObjInterface::getType() answers them. The numbers
// are part of the plug-in contract (sets of kinds travel as bit masks, value v being bit v); callers may
// pass any value cast from its number.
namespace vyn::ie {

enum EDexObjectsType : int {
  OBJECT_TYPE_ALL = -1,  // every kind; a query argument only, never an object's kind
  // 0 to 3 are the point kinds: a kind below OBJECT_TYPE_POLYLINE is a point.
  OBJECT_TYPE_DESIGN_POINT = 0,
  OBJECT_TYPE_PTL_POINT = 1,  // point given relative to a line of two reference points
  OBJECT_TYPE_GPS_RAW_POINT = 2,
  OBJECT_TYPE_SHEET_POINT = 3,
  OBJECT_TYPE_POLYLINE = 4,
  OBJECT_TYPE_AREA = 5,
  OBJECT_TYPE_BREAKLINE = 6,
  OBJECT_TYPE_ARC = 7,
  OBJECT_TYPE_SURFACE = 8,
  OBJECT_TYPE_ALIGNMENT = 9,
  OBJECT_TYPE_PARCEL = 10,
  OBJECT_TYPE_TEXT_LABEL = 11,
  OBJECT_TYPE_CIRCLE = 12,
  OBJECT_TYPE_REGION = 13,
};

}  // namespace vyn::ie
