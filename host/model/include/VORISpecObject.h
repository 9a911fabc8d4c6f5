// The "feature" side of a model object: its type name (the late type) and its document id.
#pragma once

#include "VORHandle.h"
#include "VORString.h"

class VORProcess;

class VORISpecObject : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(VORISpecObject)
 public:
  // The late type, e.g. "BIWActivityStation", "ProductInput", "ASMPRODUCT", "QELMfgAssy".
  virtual HRESULT GetTypeName(VORUnicodeString& typeName) = 0;
  // Identifier unique in the document ("A12", "P3"...).
  virtual VORString GetId() = 0;
  // The document that holds the object; null once it was removed.
  virtual VORProcess* GetDocument() = 0;
};
VOR_DECLARE_HANDLE(VORISpecObject);
