#include "QELArrowRepAdapter.h"

#include <new>

#include "VOR3x3Matrix.h"

namespace {
// The barbs leave the tip at pi - 2.82744 rad (about 18 degrees) from the shaft.
constexpr double kBarbAngle = 2.82744;
constexpr float kBarbLength = 2.0f;
}  // namespace

VOR2DPolylineGP* QELArrowRepAdapter::CreateOrthogonalLink(const VORMathPoint2Df& from,
                                                          const VORMathPoint2Df& to) {
  // The sum is single precision, the halving double, the result stored as float.
  const float sum = from.x + to.x;
  const auto middle = static_cast<float>(sum * 0.5);
  const VORMathPoint2Df points[4] = {
      {from.x, from.y}, {middle, from.y}, {middle, to.y}, {to.x, to.y}};
  return new (std::nothrow) VOR2DPolylineGP(points, 4, 1);
}

VOR2DPolylineGP* QELArrowRepAdapter::CreateArrow(const VORMathPoint2Df& from,
                                                 const VORMathPoint2Df& to) {
  // Only the x direction matters: the head points along the link's last horizontal segment.
  const auto dx = static_cast<float>(to.x - (from.x + to.x) * 0.5);
  const VORMathVector2Df d = VORMathVector2Df(dx, 0.0f).Normalized();
  const VORMathPoint2D a = VOR3x3Matrix::Rotation(kBarbAngle).Transform(d.x, d.y);
  const VORMathPoint2D b = VOR3x3Matrix::Rotation(-kBarbAngle).Transform(d.x, d.y);
  const VORMathPoint2Df points[3] = {
      {to.x + kBarbLength * static_cast<float>(b.x), to.y + kBarbLength * static_cast<float>(b.y)},
      {to.x, to.y},
      {to.x + kBarbLength * static_cast<float>(a.x), to.y + kBarbLength * static_cast<float>(a.y)}};
  return new (std::nothrow) VOR2DPolylineGP(points, 3, 1);
}
