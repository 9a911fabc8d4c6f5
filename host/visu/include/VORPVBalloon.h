// Balloon help of a viewer: a short text shown beside the pointer while it rests on something.
// The viewer keeps its balloons for the painter; headless tests read them back.
#pragma once

#include "VORBaseUnknown.h"
#include "VORHandle.h"
#include "VORMath2D.h"
#include "VORUnicodeString.h"

class VORViewer;

class VORPVBalloon : public VORBaseUnknown {
  VOR_DECLARE_CLASS(VORPVBalloon, VORBaseUnknown)
 public:
  // Registers with viewer (not held); a null viewer gives a balloon that is never shown.
  explicit VORPVBalloon(VORViewer* viewer);

  // A balloon shows only after its visibility was allowed (1); 0 forbids and hides it.
  void SetVisibility(int allowed);
  // Shows text at the viewer's current pointer position (when allowed).
  void Show(const VORUnicodeString& text);
  void Show(const VORUnicodeString& text, const VORMathPoint2D& at);
  // Hides the balloon; the argument is accepted for the module's calls (1 = at once).
  void Hide(int immediately = 1);

  bool IsVisible() const { return _visible; }
  const VORUnicodeString& GetText() const { return _text; }
  const VORMathPoint2D& GetPosition() const { return _at; }
  VORViewer* GetViewer() const { return _viewer; }

 protected:
  ~VORPVBalloon() override;

 private:
  friend class VORViewer;
  VORViewer* _viewer;
  bool _allowed = false;
  bool _visible = false;
  VORUnicodeString _text;
  VORMathPoint2D _at;
};
VOR_DECLARE_HANDLE(VORPVBalloon);
