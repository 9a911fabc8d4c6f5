// Shared by the list visualisation tests: list items that only know their name, and scroll
// lists built on a viewer without a document.
#pragma once

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "QELBaseScrollListZitBltRep.h"
#include "QELIListZitBltItem.h"
#include "VORDeferredDeletion.h"
#include "VORViewer.h"

// A list item with a name (or none: GetItemName fails).
class FakeListItem : public QELIListZitBltItem {
 public:
  explicit FakeListItem(std::string name, bool named = true)
      : _name(std::move(name)), _named(named) {}
  HRESULT GetActivity(VORBaseUnknown*&) override { return 0; }
  HRESULT GetItemName(VORUnicodeString& name) override {
    if (!_named)
      return E_FAIL;
    name = VORUnicodeString(_name.c_str());
    return 0;
  }

 private:
  std::string _name;
  bool _named;
};

inline VORBaseUnknown_var MakeItem(const std::string& name) {
  return VORBaseUnknown_var::Adopt(new FakeListItem(name));
}

// The translation of a bag's child at position (1-based).
inline VORMathPoint2D ChildTranslation(VOR2DRep* rep, int position) {
  auto* bag = dynamic_cast<VOR2DBagRep*>(rep);
  auto* child = bag != nullptr ? dynamic_cast<VOR2DBagRep*>(bag->GetChild(position)) : nullptr;
  VORMathPoint2D t;
  if (child != nullptr)
    child->GetMatrix()->GetTranslation(t.x, t.y);
  return t;
}
