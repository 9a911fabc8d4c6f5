// What the document reader and writer share: the format's version and cached UTF-16 names.
#pragma once

#include <string>
#include <unordered_map>

#include "VORXercesPlatform.h"

namespace VORDocumentFormat {

constexpr const char* kVersion = "1";

// Cached UTF-16 names, so that loops do not transcode the same tag names again. Keyed by the
// literal's address: the same text at two addresses is only cached twice.
struct Names {
  std::unordered_map<const char*, std::u16string> cache;
  const XMLCh* operator()(const char* name) {
    auto it = cache.find(name);
    if (it == cache.end())
      it = cache.emplace(name, VORXercesPlatform::FromUTF8(name)).first;
    return reinterpret_cast<const XMLCh*>(it->second.c_str());
  }
};

}  // namespace VORDocumentFormat
