// Copy, cut and paste of process activities on the current editor's CSO, built on the model's
// deep copy and removal. Types: 1 copy, 2 cut, 4 paste into. The clipboard is process-wide:
// Copy puts the CSO's activities on it, PasteInto copies them (deeply, with their flows, product
// inputs and outputs, items and resources) under each target and makes the copies the CSO, Cut
// removes the CSO's activities with their inner flows. Closing and re-opening the clipboard
// empties it.
#pragma once

#include "VORCSO.h"

class VORCCP_Actor : public VORBaseUnknown {
  VOR_DECLARE_CLASS(VORCCP_Actor, VORBaseUnknown)
 public:
  enum Type { CopyType = 1, CutType = 2, PasteIntoType = 4 };

  // Works on cso, or on the current editor's CSO when null.
  explicit VORCCP_Actor(VORCSO* cso = nullptr);

  // True when there is a CSO to work on.
  bool Initialize();
  void SetType(int type) { _type = type; }
  int GetType() const { return _type; }
  // Takes the CSO's leaves as the objects to copy or cut.
  void ReadCSO();
  const VORListValVORBaseUnknown_var& GetObjects() const { return _objects; }

  // Copy: every object is an activity below the root, of one document.
  bool CanCopy() const;
  bool Copy();
  // Paste into: the clipboard holds activities and each target (the leaf of each path) may
  // receive them. targets holds paths (or plain objects).
  bool CanPaste(const VORListValVORBaseUnknown_var& targets) const;
  bool Paste(const VORListValVORBaseUnknown_var& targets);
  bool CanCut() const;
  bool Cut();

  static void OpenClipboard();
  static void CloseClipboard();
  // What is on the clipboard (tests, the GUI's paste availability).
  static const VORListValVORBaseUnknown_var& GetClipboard();

 protected:
  ~VORCCP_Actor() override = default;

 private:
  VORCSO* CSO() const;
  bool AllActivities(const VORListValVORBaseUnknown_var& objects) const;

  VORCSO_var _cso;
  int _type = CopyType;
  VORListValVORBaseUnknown_var _objects;
};

VOR_DECLARE_HANDLE(VORCCP_Actor);
