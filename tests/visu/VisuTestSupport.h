// Helpers shared by the 2D layer tests: leak check fixture and small scene builders.
#pragma once

#include <gtest/gtest.h>

#include "VOR2DBagRep.h"
#include "VORDeferredDeletion.h"

class VisuTest : public ::testing::Test {
 protected:
  void SetUp() override { _live = VORBaseUnknown::LiveInstances(); }
  void TearDown() override {
    VORDeferredDeletion::Drain();
    EXPECT_EQ(VORBaseUnknown::LiveInstances(), _live) << "leaked objects";
  }
  long _live = 0;
};

// A model object the reps stand for.
class PickedThing : public VORBaseUnknown {
  VOR_DECLARE_CLASS(PickedThing, VORBaseUnknown)
 public:
  explicit PickedThing(int id) : _id(id) {}
  int Id() const { return _id; }

 private:
  int _id;
};

template <class T, class... Args>
VORHandle<T> Make(Args&&... args) {
  return VORHandle<T>::Adopt(new T(std::forward<Args>(args)...));
}
