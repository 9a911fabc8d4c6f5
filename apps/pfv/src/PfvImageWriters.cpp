#include "PfvImageWriters.h"

#include <algorithm>
#include <cctype>
#include <map>

namespace {
std::map<std::string, PfvImageWriter>& Writers() {
  static std::map<std::string, PfvImageWriter> writers;
  return writers;
}

std::map<std::string, PfvBookWriterFactory>& BookWriters() {
  static std::map<std::string, PfvBookWriterFactory> writers;
  return writers;
}

std::string Lower(std::string s) {
  std::transform(s.begin(), s.end(), s.begin(),
                 [](unsigned char c) { return static_cast<char>(std::tolower(c)); });
  return s;
}

// The lower-case extension of path without the dot; empty when it has none.
std::string ExtensionOf(const std::string& path) {
  const size_t dot = path.find_last_of('.');
  const size_t slash = path.find_last_of('/');
  if (dot == std::string::npos || (slash != std::string::npos && dot < slash))
    return std::string();
  return Lower(path.substr(dot + 1));
}
}  // namespace

bool PfvRegisterImageWriter(const std::string& extension, PfvImageWriter writer) {
  Writers()[Lower(extension)] = std::move(writer);
  return true;
}

const PfvImageWriter* PfvFindImageWriter(const std::string& path) {
  auto it = Writers().find(ExtensionOf(path));
  return it == Writers().end() ? nullptr : &it->second;
}

bool PfvRegisterBookWriter(const std::string& extension, PfvBookWriterFactory factory) {
  BookWriters()[Lower(extension)] = std::move(factory);
  return true;
}

const PfvBookWriterFactory* PfvFindBookWriter(const std::string& path) {
  auto it = BookWriters().find(ExtensionOf(path));
  return it == BookWriters().end() ? nullptr : &it->second;
}

std::vector<std::string> PfvImageWriterExtensions() {
  std::vector<std::string> out;
  for (const auto& [extension, writer] : Writers())
    out.push_back(extension);
  return out;
}
