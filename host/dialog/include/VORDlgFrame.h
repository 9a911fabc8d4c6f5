// A titled group of controls laid out on a grid; can attach a child to its four sides.
#pragma once

#include "VORDlgControl.h"

class VORDlgFrame : public VORDlgControl {
  VOR_DECLARE_CLASS(VORDlgFrame, VORDlgControl)
 public:
  VORDlgFrame(VORCommand* parent, const VORString& name, int style = 0);
  const char* GetKind() const override { return "Frame"; }
  // The child fills the frame (attachment on all four sides) / loses its attachment. The child
  // may be any command (a viewer); it is not held.
  void Attach4Sides(VORCommand* child);
  void ResetAttachment(VORCommand* child);
  bool IsAttached4Sides(VORCommand* child) const;

 private:
  std::vector<VORCommand*> _attached;
};

// A text that the user cannot change.
class VORDlgLabel : public VORDlgControl {
  VOR_DECLARE_CLASS(VORDlgLabel, VORDlgControl)
 public:
  VORDlgLabel(VORCommand* parent, const VORString& name, int style = 0);
  const char* GetKind() const override { return "Label"; }
  VORUnicodeString GetValueText() const override { return GetTitle(); }
};

VOR_DECLARE_HANDLE(VORDlgFrame);
