// Class meta-object: a class name and the meta-object of the base class.
#pragma once

#include <cstring>

class VORMetaObject {
 public:
  constexpr VORMetaObject(const char* className, const VORMetaObject* base)
      : _className(className), _base(base) {}

  const char* ClassName() const { return _className; }
  const VORMetaObject* Base() const { return _base; }

  bool IsAKindOf(const char* className) const {
    for (const VORMetaObject* m = this; m != nullptr; m = m->_base) {
      if (std::strcmp(m->_className, className) == 0)
        return true;
    }
    return false;
  }

 private:
  const char* _className;
  const VORMetaObject* _base;
};

// Component-model boilerplate of a concrete class: ClassName and MetaObject statics,
// IsA / GetMetaObject virtuals. IsAKindOf comes from VORBaseUnknown through GetMetaObject.
#define VOR_DECLARE_CLASS(Class, Base)                           \
 public:                                                         \
  static const char* ClassName() {                               \
    return #Class;                                               \
  }                                                              \
  static const char* ClassId() {                                 \
    return #Class;                                               \
  }                                                              \
  static const VORMetaObject* MetaObject() {                     \
    static const VORMetaObject meta(#Class, Base::MetaObject()); \
    return &meta;                                                \
  }                                                              \
  const char* IsA() const override {                             \
    return #Class;                                               \
  }                                                              \
  const VORMetaObject* GetMetaObject() const override {          \
    return MetaObject();                                         \
  }
