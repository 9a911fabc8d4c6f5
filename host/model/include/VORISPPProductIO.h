// A product input ("ProductInput") or product output ("ProductOutput") of an activity.
#pragma once

#include "VORHandle.h"

class VORISPPProductIO : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(VORISPPProductIO)
 public:
  virtual bool IsInput() = 0;
  // The item consumed (input) or produced (output); null handle when there is none.
  virtual HRESULT GetItem(VORBaseUnknown_var& item) = 0;
  // Direction-specific accessors: null handle (S_FALSE) for the other direction.
  virtual HRESULT GetConsumedItem(VORBaseUnknown_var& item) = 0;
  virtual HRESULT GetProducedItem(VORBaseUnknown_var& item) = 0;
  // The product behind the item (the product itself, or the manufacturing assembly).
  virtual HRESULT GetProduct(VORBaseUnknown_var& product) = 0;
  // The activity that owns this input or output (null once removed).
  virtual HRESULT GetActivity(VORBaseUnknown_var& activity) = 0;
  // Replaces the item (and product). On an output emits kind 39, on an input kind 29.
  virtual HRESULT SetItem(VORBaseUnknown* item) = 0;
};
VOR_DECLARE_HANDLE(VORISPPProductIO);
