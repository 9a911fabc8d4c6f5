#include "VORGraphicAttribute.h"

#include <algorithm>

VORColorRGB VORColorFromIndex(int index) {
  static const VORColorRGB base[16] = {
      {0, 0, 0},       {255, 255, 255}, {220, 30, 30},   {30, 160, 60},
      {40, 80, 210},   {235, 200, 20},  {200, 40, 180},  {20, 180, 200},
      {128, 128, 128}, {64, 64, 64},    {200, 200, 200}, {240, 140, 20},
      {250, 250, 240}, {40, 40, 60},    {70, 90, 120},   {225, 228, 235}};
  index = std::clamp(index, 0, 255);
  if (index < 16)
    return base[index];
  if (index < 232) {
    static const std::uint8_t step[6] = {0, 95, 135, 175, 215, 255};
    const int i = index - 16;
    return {step[i / 36], step[(i / 6) % 6], step[i % 6]};
  }
  const auto grey = static_cast<std::uint8_t>(8 + 10 * (index - 232));
  return {grey, grey, grey};
}
