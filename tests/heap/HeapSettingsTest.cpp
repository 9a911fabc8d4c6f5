// The programs allocate through jemalloc with the settings of VORHeapSettings.cpp: a link order
// that let the C library's malloc or the allocator's own defaults win would pass every other test
// and quietly lose the opening speed of large charts.
#include <jemalloc/jemalloc.h>

#include <gtest/gtest.h>

#include <cstdint>
#include <cstdlib>
#include <string>
#include <sys/types.h>

namespace {

std::string StringOption(const char* name) {
  const char* value = nullptr;
  size_t size = sizeof(value);
  if (mallctl(name, &value, &size, nullptr, 0) != 0 || value == nullptr)
    return "<unreadable>";
  return value;
}

TEST(HeapSettings, HugePagesForObjectsAndMetadata) {
  if (std::getenv("MALLOC_CONF") != nullptr)
    GTEST_SKIP() << "MALLOC_CONF overrides the built-in settings";
  EXPECT_EQ(StringOption("opt.thp"), "always");
  EXPECT_EQ(StringOption("opt.metadata_thp"), "always");
}

TEST(HeapSettings, FreedMemoryIsKeptForThirtySeconds) {
  if (std::getenv("MALLOC_CONF") != nullptr)
    GTEST_SKIP() << "MALLOC_CONF overrides the built-in settings";
  for (const char* name : {"opt.dirty_decay_ms", "opt.muzzy_decay_ms"}) {
    ssize_t decay = 0;
    size_t size = sizeof(decay);
    ASSERT_EQ(mallctl(name, &decay, &size, nullptr, 0), 0) << name;
    EXPECT_EQ(decay, 30000) << name;
  }
}

TEST(HeapSettings, OperatorNewGoesThroughTheAllocator) {
  uint64_t before = 0;
  size_t size = sizeof(before);
  ASSERT_EQ(mallctl("thread.allocated", &before, &size, nullptr, 0), 0);
  auto* block = new char[1 << 20];
  block[0] = 1;
  uint64_t after = 0;
  ASSERT_EQ(mallctl("thread.allocated", &after, &size, nullptr, 0), 0);
  delete[] block;
  EXPECT_GE(after - before, uint64_t{1} << 20);
}

}  // namespace
