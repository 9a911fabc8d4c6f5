// What a ZitBlt list asks of every object it shows: the text of its line and, for objects that
// know it, the activity they are listed for. Answered by product inputs, product outputs,
// manufacturing assemblies and products (module QELZitBltModel).
#pragma once

#include "VORHandle.h"
#include "VORUnicodeString.h"

class QELIListZitBltItem : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(QELIListZitBltItem)
 public:
  // The activity the object is listed for (not held for the caller). Model objects do not know
  // it: they leave activity untouched and return at once (0 for inputs and outputs, 1 for
  // products).
  virtual HRESULT GetActivity(VORBaseUnknown*& activity) = 0;
  // The text of the object's line. 0 when found; otherwise a non-zero code and name untouched.
  // Callers test for a negative code only: an output without an item answers 1 (a success
  // with an unchanged name), an input without an item E_FAIL.
  virtual HRESULT GetItemName(VORUnicodeString& name) = 0;
};
VOR_DECLARE_HANDLE(QELIListZitBltItem);
