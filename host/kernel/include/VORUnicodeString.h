// Unicode string of code points: names, labels and file names. Converts to and from UTF-8
// and to and from UTF-16 (the parser's XMLCh is char16_t).
#pragma once

#include <cstddef>
#include <functional>
#include <ostream>
#include <string>
#include <string_view>

class VORUnicodeString {
 public:
  VORUnicodeString() = default;
  VORUnicodeString(const char* utf8);
  VORUnicodeString(std::string_view utf8);
  VORUnicodeString(const std::string& utf8) : VORUnicodeString(std::string_view(utf8)) {}
  explicit VORUnicodeString(std::u32string codePoints) : _s(std::move(codePoints)) {}

  static VORUnicodeString FromUTF16(const char16_t* text);
  static VORUnicodeString FromUTF16(std::u16string_view text);

  std::string ConvertToUTF8() const;
  std::u16string ConvertToUTF16() const;
  const std::u32string& CodePoints() const { return _s; }

  int GetLengthInChar() const { return static_cast<int>(_s.size()); }
  bool IsEmpty() const { return _s.empty(); }
  char32_t operator[](int i) const { return _s[static_cast<size_t>(i)]; }

  // 0-based index of the first occurrence at or after from, or -1.
  int Find(const VORUnicodeString& sub, int from = 0) const;
  // 0-based index of the last occurrence starting at or before from (default: the end), or -1.
  int ReverseFind(const VORUnicodeString& sub, int from = -1) const;
  // Up to length code points from start (0-based); clamped to the string.
  VORUnicodeString SubString(int start, int length) const;

  void Append(const VORUnicodeString& other) { _s += other._s; }
  VORUnicodeString& operator+=(const VORUnicodeString& other) {
    _s += other._s;
    return *this;
  }
  friend VORUnicodeString operator+(VORUnicodeString a, const VORUnicodeString& b) {
    a._s += b._s;
    return a;
  }
  friend bool operator==(const VORUnicodeString& a, const VORUnicodeString& b) = default;
  friend auto operator<=>(const VORUnicodeString& a, const VORUnicodeString& b) = default;

 private:
  std::u32string _s;
};

std::ostream& operator<<(std::ostream& os, const VORUnicodeString& s);

template <>
struct std::hash<VORUnicodeString> {
  size_t operator()(const VORUnicodeString& s) const noexcept {
    return std::hash<std::u32string>()(s.CodePoints());
  }
};
