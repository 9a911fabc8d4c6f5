// A product's alias (the root product of a document is aliased "PPRProduct").
#pragma once

#include "VORHandle.h"
#include "VORUnicodeString.h"

class VORIAlias : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(VORIAlias)
 public:
  virtual HRESULT GetAlias(VORUnicodeString& alias) = 0;
  virtual HRESULT SetAlias(const VORUnicodeString& alias) = 0;
};
VOR_DECLARE_HANDLE(VORIAlias);
