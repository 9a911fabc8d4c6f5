// Narrow (UTF-8) string for identifiers and technical names.
#pragma once

#include <string>
#include <string_view>

#include "VORUnicodeString.h"

class VORString {
 public:
  VORString() = default;
  VORString(const char* s) : _s(s ? s : "") {}
  VORString(std::string s) : _s(std::move(s)) {}
  explicit VORString(const VORUnicodeString& u) : _s(u.ConvertToUTF8()) {}

  const char* CastToCharPtr() const { return _s.c_str(); }
  const char* c_str() const { return _s.c_str(); }
  const std::string& str() const { return _s; }
  int GetLengthInChar() const { return static_cast<int>(_s.size()); }
  bool IsEmpty() const { return _s.empty(); }
  VORUnicodeString ToUnicode() const { return VORUnicodeString(_s); }

  VORString& operator+=(const VORString& o) {
    _s += o._s;
    return *this;
  }
  friend VORString operator+(VORString a, const VORString& b) { return a += b; }
  friend bool operator==(const VORString& a, const VORString& b) = default;
  friend auto operator<=>(const VORString& a, const VORString& b) = default;

 private:
  std::string _s;
};
