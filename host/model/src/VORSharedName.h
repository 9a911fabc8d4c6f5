// A name that many model objects carry (a late type, a link type). Each distinct spelling is kept
// once for the whole process: an object holds a pointer to it, names compare by address, and the
// decoded form the type-name queries return is made once per spelling, not once per call.
#pragma once

#include <string>
#include <string_view>

#include "VORUnicodeString.h"

class VORSharedName {
 public:
  VORSharedName();  // the empty name
  // Implicit: links and objects are built from the spellings documents and callers carry.
  VORSharedName(std::string_view name);  // NOLINT(google-explicit-constructor)
  VORSharedName(const char* name) : VORSharedName(std::string_view(name)) {}         // NOLINT
  VORSharedName(const std::string& name) : VORSharedName(std::string_view(name)) {}  // NOLINT

  const std::string& str() const { return _entry->name; }
  const char* c_str() const { return _entry->name.c_str(); }
  const VORUnicodeString& Decoded() const { return _entry->decoded; }
  operator const std::string&() const { return _entry->name; }  // NOLINT

  friend bool operator==(const VORSharedName& a, const VORSharedName& b) {
    return a._entry == b._entry;
  }
  friend bool operator==(const VORSharedName& a, const char* b) { return a._entry->name == b; }
  friend bool operator==(const VORSharedName& a, const std::string& b) {
    return a._entry->name == b;
  }
  friend bool operator==(const VORSharedName& a, std::string_view b) { return a._entry->name == b; }

  struct Entry {
    std::string name;
    VORUnicodeString decoded;
  };

 private:
  const Entry* _entry;
};
