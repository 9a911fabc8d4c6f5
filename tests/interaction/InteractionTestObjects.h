// Small objects for the interaction tests: a pickable "station" interface and its objects.
#pragma once

#include <string>

#include "VORHandle.h"
#include "VORInterfaceId.h"

class ITestStation : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(ITestStation)
 public:
  virtual std::string Kind() const = 0;
};
VOR_DECLARE_HANDLE(ITestStation);

class TestStation : public ITestStation {
  VOR_DECLARE_CLASS(TestStation, VORBaseUnknown)
 public:
  explicit TestStation(std::string kind) : _kind(std::move(kind)) {}
  std::string Kind() const override { return _kind; }

 private:
  std::string _kind;
};

class TestThing : public VORBaseUnknown {
  VOR_DECLARE_CLASS(TestThing, VORBaseUnknown)
};

template <class T, class... Args>
VORHandle<T> Make(Args&&... args) {
  return VORHandle<T>::Adopt(new T(std::forward<Args>(args)...));
}
