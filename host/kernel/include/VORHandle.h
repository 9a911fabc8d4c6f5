// Typed reference-counted handle. Built from another handle or a raw object it queries the
// interface and is null when the object does not answer it; callers test and skip.
#pragma once

#include <cstddef>
#include <functional>
#include <utility>

#include "VORBaseUnknown.h"

struct VORNullVarType {};
inline constexpr VORNullVarType NULL_var{};

template <class T>
class VORHandle {
 public:
  VORHandle() = default;
  VORHandle(std::nullptr_t) {}
  VORHandle(VORNullVarType) {}
  // Same interface: shares the reference.
  VORHandle(T* object) : _p(object) {
    if (_p)
      _p->AddRef();
  }
  VORHandle(const VORHandle& other) : VORHandle(other._p) {}
  VORHandle(VORHandle&& other) noexcept : _p(std::exchange(other._p, nullptr)) {}
  // Other interface: casts through QueryInterface.
  template <class U, class = std::enable_if_t<!std::is_same_v<U, T>>>
  VORHandle(const VORHandle<U>& other) {
    Query(other.get());
  }
  template <class U, class = std::enable_if_t<!std::is_same_v<U, T> && !std::is_base_of_v<T, U>>>
  explicit VORHandle(U* object) {
    Query(object);
  }
  ~VORHandle() { Reset(); }

  VORHandle& operator=(const VORHandle& other) {
    VORHandle(other).Swap(*this);
    return *this;
  }
  VORHandle& operator=(VORHandle&& other) noexcept {
    VORHandle(std::move(other)).Swap(*this);
    return *this;
  }
  VORHandle& operator=(T* object) {
    VORHandle(object).Swap(*this);
    return *this;
  }
  VORHandle& operator=(VORNullVarType) {
    Reset();
    return *this;
  }

  // Takes over the creator's reference of a new object instead of adding one.
  static VORHandle Adopt(T* object) {
    VORHandle h;
    h._p = object;
    return h;
  }

  T* operator->() const { return _p; }
  T& operator*() const { return *_p; }
  T* get() const { return _p; }
  operator T*() const { return _p; }
  explicit operator bool() const { return _p != nullptr; }

  // Gives up the reference without releasing it.
  T* Detach() { return std::exchange(_p, nullptr); }
  void Reset() {
    if (_p)
      std::exchange(_p, nullptr)->Release();
  }
  void Swap(VORHandle& other) noexcept { std::swap(_p, other._p); }

  // The object this handle stands for, whatever interface it is seen through.
  VORBaseUnknown* Identity() const {
    return _p ? static_cast<VORBaseUnknown*>(_p)->GetIdentity() : nullptr;
  }

 private:
  void Query(VORBaseUnknown* object) {
    if (object == nullptr)
      return;
    void* out = nullptr;
    if (SUCCEEDED(object->QueryInterface(T::IID(), &out)))
      _p = static_cast<T*>(out);
  }

  T* _p = nullptr;
};

// Handles compare by object identity, so two interfaces of one object are equal.
template <class T, class U>
bool operator==(const VORHandle<T>& a, const VORHandle<U>& b) {
  return a.Identity() == b.Identity();
}
template <class T>
bool operator==(const VORHandle<T>& a, VORNullVarType) {
  return a.get() == nullptr;
}
template <class T>
bool operator==(const VORHandle<T>& a, std::nullptr_t) {
  return a.get() == nullptr;
}

using VORBaseUnknown_var = VORHandle<VORBaseUnknown>;

// Declares Interface_var for an interface or class.
#define VOR_DECLARE_HANDLE(Interface) using Interface##_var = VORHandle<Interface>

template <class T>
struct std::hash<VORHandle<T>> {
  size_t operator()(const VORHandle<T>& h) const noexcept {
    return std::hash<const void*>()(h.Identity());
  }
};
