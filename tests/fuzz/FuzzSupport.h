// What the fuzz targets share: a scratch directory for the readers that take files, and a
// failure that every fuzzing engine and the corpus replay report as a crash.
#pragma once

#include <unistd.h>

#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <string>

namespace pfvfuzz {

// A property the target checks was broken: print why and abort, so the input is kept.
[[noreturn]] inline void Broken(const std::string& why) {
  std::fprintf(stderr, "property broken: %s\n", why.c_str());
  std::abort();
}

// One directory per process, created on first use and reused by every input.
inline const std::string& Scratch() {
  static const std::string dir = [] {
    std::string pattern = (std::filesystem::temp_directory_path() / "pfv-fuzz-XXXXXX").string();
    return std::string(::mkdtemp(pattern.data()));
  }();
  return dir;
}

inline std::string WriteScratch(const std::string& name, const char* data, size_t size) {
  const std::string path = Scratch() + "/" + name;
  std::ofstream(path, std::ios::binary | std::ios::trunc).write(data, static_cast<long>(size));
  return path;
}

}  // namespace pfvfuzz
