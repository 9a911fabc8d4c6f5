// Products were added under a product: trees showing products add them.
#pragma once

#include "VORHandle.h"
#include "VORLists.h"
#include "VORNotification.h"

class VORPrdMultiImportNotif : public VORNotification {
  VOR_DECLARE_CLASS(VORPrdMultiImportNotif, VORNotification)
 public:
  explicit VORPrdMultiImportNotif(const VORListValVORBaseUnknown_var& products)
      : _products(products) {}
  const VORListValVORBaseUnknown_var& GetProducts() const { return _products; }

 private:
  VORListValVORBaseUnknown_var _products;
};
