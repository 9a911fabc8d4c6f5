// One application for every shell test (offscreen platform, set by the test environment).
#include <gtest/gtest.h>

#include "VORQtApplication.h"

namespace {
class QtEnvironment : public ::testing::Environment {
 public:
  void SetUp() override {
    static int argc = 1;
    static char name[] = "qt_tests";
    static char* argv[] = {name, nullptr};
    _app = new VORQtApplication(argc, argv);
  }
  void TearDown() override { delete _app; }

 private:
  VORQtApplication* _app = nullptr;
};
[[maybe_unused]] ::testing::Environment* const kEnvironment =
    ::testing::AddGlobalTestEnvironment(new QtEnvironment);
}  // namespace
