#include "VORMsgCatalog.h"

#include <map>
#include <optional>
#include <sstream>
#include <string>

#include "VOREnv.h"
#include "VORFileIO.h"

namespace {
using Catalogue = std::map<std::string, std::string>;

// Parses lines of the form Key = "text"; (the semicolon is optional). \" and \n are escapes.
Catalogue Parse(const std::string& content) {
  Catalogue entries;
  std::istringstream lines(content);
  for (std::string line; std::getline(lines, line);) {
    auto eq = line.find('=');
    auto firstQuote = line.find('"');
    if (eq == std::string::npos || firstQuote == std::string::npos || firstQuote < eq)
      continue;
    std::string key = line.substr(0, eq);
    key.erase(0, key.find_first_not_of(" \t"));
    key.erase(key.find_last_not_of(" \t") + 1);
    if (key.empty() || key[0] == '#')
      continue;
    std::string text;
    bool closed = false;
    for (size_t i = firstQuote + 1; i < line.size(); ++i) {
      if (line[i] == '\\' && i + 1 < line.size()) {
        char next = line[++i];
        text.push_back(next == 'n' ? '\n' : next);
      } else if (line[i] == '"') {
        closed = true;
        break;
      } else {
        text.push_back(line[i]);
      }
    }
    if (closed)
      entries[key] = text;
  }
  return entries;
}

std::map<std::string, std::optional<Catalogue>>& Cache() {
  static std::map<std::string, std::optional<Catalogue>> cache;
  return cache;
}

const Catalogue* Lookup(const std::string& name) {
  auto it = Cache().find(name);
  if (it == Cache().end()) {
    std::optional<Catalogue> loaded;
    VORUnicodeString path = VORFindResource(VORUnicodeString(name + ".msg"));
    std::string content, error;
    if (!path.IsEmpty() && VORReadFile(path.ConvertToUTF8(), content, error, 1 << 20)) {
      loaded = Parse(content);
    }
    it = Cache().emplace(name, std::move(loaded)).first;
  }
  return it->second ? &*it->second : nullptr;
}
}  // namespace

VORUnicodeString VORMsgCatalog::BuildMessage(const char* catalog, const char* key,
                                             const VORUnicodeString& defaultText,
                                             const VORListValVORUnicodeString* parameters) {
  std::string text = defaultText.ConvertToUTF8();
  if (catalog && key) {
    if (const Catalogue* entries = Lookup(catalog)) {
      if (auto it = entries->find(key); it != entries->end())
        text = it->second;
    }
  }
  if (parameters) {
    // Highest first, so that /p1 does not eat the start of /p10.
    for (int i = parameters->Size(); i >= 1; --i) {
      const std::string marker = "/p" + std::to_string(i);
      const std::string value = (*parameters)[i].ConvertToUTF8();
      for (size_t at = text.find(marker); at != std::string::npos;
           at = text.find(marker, at + value.size())) {
        text.replace(at, marker.size(), value);
      }
    }
  }
  return VORUnicodeString(text);
}

void VORMsgCatalog::ClearCache() {
  Cache().clear();
}
