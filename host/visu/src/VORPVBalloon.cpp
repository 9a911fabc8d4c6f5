#include "VORPVBalloon.h"

#include <algorithm>

#include "VORViewer.h"

VORPVBalloon::VORPVBalloon(VORViewer* viewer) : _viewer(viewer) {
  if (_viewer != nullptr)
    _viewer->_balloons.push_back(this);
}

VORPVBalloon::~VORPVBalloon() {
  if (_viewer != nullptr)
    std::erase(_viewer->_balloons, this);
}

void VORPVBalloon::SetVisibility(int allowed) {
  _allowed = allowed != 0;
  if (!_allowed)
    _visible = false;
}

void VORPVBalloon::Show(const VORUnicodeString& text) {
  Show(text, _viewer != nullptr ? _viewer->GetPointerModelPoint() : VORMathPoint2D());
}

void VORPVBalloon::Show(const VORUnicodeString& text, const VORMathPoint2D& at) {
  _text = text;
  _at = at;
  _visible = _allowed && _viewer != nullptr;
  if (_visible)
    _viewer->Draw();
}

void VORPVBalloon::Hide(int) {
  const bool was = _visible;
  _visible = false;
  if (was && _viewer != nullptr)
    _viewer->Draw();
}
