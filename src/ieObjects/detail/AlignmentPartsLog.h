#pragma once

// Error-log records of the alignment parts, their elements and the parts dictionary (source
// ieObjects\IEAlignmentPartsDictionary, empty message).
namespace vyn::ie::detail {

inline constexpr const wchar_t* kAlignmentPartsLogSource = L"ieObjects\\IEAlignmentPartsDictionary";

// DexAlignmentPartsDictionary::addAlignmentPart() was given a null part.
inline constexpr int kPartsNullPartLine = 801;
// A part kind outside 0 to 3 was given to the dictionary (as an argument, or as a part's getType()).
inline constexpr int kPartsUnknownKindLine = 802;

// getPosition() of a horizontal element was asked for a position kind outside its range.
inline constexpr int kLinePositionKindLine = 811;
inline constexpr int kCurvePositionKindLine = 812;
inline constexpr int kSpiralPositionKindLine = 813;
// DexSpiral::getSpiralTypeAsString() met a stored type outside 0 to 15.
inline constexpr int kUnknownSpiralTypeLine = 814;
// DexSpiral::createSegment() met a math spiral type other than clothoid and cubic parabola.
inline constexpr int kUnknownSpiralMathTypeLine = 815;

// DexVerticalElement::getData() was asked for datum 8 of an element of type 0, which has none.
inline constexpr int kVerticalElementDatumLine = 821;

}  // namespace vyn::ie::detail
