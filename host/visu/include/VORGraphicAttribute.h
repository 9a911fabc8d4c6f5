// Colours and the packed graphic attribute word of custom-rep primitives.
//
// Colour indexes (0..255) name entries of one fixed palette: 0 black, 1 white, 2 red, 3 green,
// 4 blue, 5 yellow, 6 magenta, 7 cyan, 8 grey, 9 dark grey, 10 light grey, 11 orange, 12..15 the
// chart colours (node fill, node border, link, grid); 16..231 a 6x6x6 colour cube
// (index 16 + 36r + 6g + b, each step 0, 95, 135, 175, 215, 255); 232..255 a grey ramp from
// 8 to 238 in steps of 10 (so 247 and 249, the item-link codes, are mid greys).
//
// Packed attribute word (32 bits), as the module builds it:
//   bits 24..31  colour index
//   bits 16..23  line thickness index (drawn width = index / 4 pixels; 0x04 is one pixel)
//   bits 12..15  cap and join: 0 butt ends and mitred joins, 1 round ends and round joins
//   bits  8..11  line type: 0 or 4 solid, 1 dashed, 2 dotted, 3 dash-dot
//   bit   0      filled (a closed primitive is filled with the colour)
//   bit   1      not pickable (the primitive is drawn but ignored by picking)
//   bits  2..7   reserved, zero
// So 0x041400 below the colour byte means: one-pixel solid line with round ends, not filled,
// pickable.
#pragma once

#include <cstdint>

struct VORColorRGB {
  std::uint8_t r = 0;
  std::uint8_t g = 0;
  std::uint8_t b = 0;
  friend bool operator==(const VORColorRGB&, const VORColorRGB&) = default;
};

// Palette entry of index (clamped to 0..255).
VORColorRGB VORColorFromIndex(int index);

enum VORLineType { VORLineSolid = 0, VORLineDashed = 1, VORLineDotted = 2, VORLineDashDot = 3 };

struct VOR2DGraphicAttribute {
  std::uint32_t word = 0;
  std::uint8_t alpha = 255;

  VOR2DGraphicAttribute() = default;
  VOR2DGraphicAttribute(std::uint32_t packed, std::uint8_t a) : word(packed), alpha(a) {}

  int ColorIndex() const { return static_cast<int>(word >> 24); }
  int ThicknessIndex() const { return static_cast<int>((word >> 16) & 0xFFu); }
  double ThicknessPixels() const { return ThicknessIndex() / 4.0; }
  bool RoundEnds() const { return ((word >> 12) & 0xFu) == 1u; }
  // Line type with 4 folded into solid.
  VORLineType LineType() const {
    const unsigned t = (word >> 8) & 0xFu;
    return (t >= 1 && t <= 3) ? static_cast<VORLineType>(t) : VORLineSolid;
  }
  bool Filled() const { return (word & 0x1u) != 0; }
  bool Pickable() const { return (word & 0x2u) == 0; }

  static std::uint32_t Pack(int colorIndex, int thicknessIndex, int capJoin, int lineType,
                            bool filled, bool pickable) {
    return (static_cast<std::uint32_t>(colorIndex & 0xFF) << 24) |
           (static_cast<std::uint32_t>(thicknessIndex & 0xFF) << 16) |
           (static_cast<std::uint32_t>(capJoin & 0xF) << 12) |
           (static_cast<std::uint32_t>(lineType & 0xF) << 8) | (filled ? 0x1u : 0u) |
           (pickable ? 0u : 0x2u);
  }
};
