// Unicode string of code points: names, labels and file names. Converts to and from UTF-8
// and to and from UTF-16 (the parser's XMLCh is char16_t).
//
// Copies share one immutable block of code points (reference counted), and up to three code
// points live inside the string itself: a name handed from a configuration to every ZitBlt of a
// large level is one block, not one per copy.
#pragma once

#include <atomic>
#include <compare>
#include <cstddef>
#include <cstdint>
#include <cstring>
#include <functional>
#include <ostream>
#include <string>
#include <string_view>

class VORUnicodeString {
 public:
  VORUnicodeString() noexcept = default;
  VORUnicodeString(const char* utf8);
  VORUnicodeString(std::string_view utf8);
  VORUnicodeString(const std::string& utf8) : VORUnicodeString(std::string_view(utf8)) {}
  explicit VORUnicodeString(std::u32string_view codePoints);

  VORUnicodeString(const VORUnicodeString& other) noexcept;
  VORUnicodeString(VORUnicodeString&& other) noexcept;
  VORUnicodeString& operator=(const VORUnicodeString& other) noexcept;
  VORUnicodeString& operator=(VORUnicodeString&& other) noexcept;
  ~VORUnicodeString() { Release(); }

  static VORUnicodeString FromUTF16(const char16_t* text);
  static VORUnicodeString FromUTF16(std::u16string_view text);

  std::string ConvertToUTF8() const;
  std::u16string ConvertToUTF16() const;
  std::u32string_view CodePoints() const noexcept { return {Data(), _size}; }

  int GetLengthInChar() const { return static_cast<int>(_size); }
  bool IsEmpty() const { return _size == 0; }
  char32_t operator[](int i) const { return Data()[i]; }

  // 0-based index of the first occurrence at or after from, or -1.
  int Find(const VORUnicodeString& sub, int from = 0) const;
  // 0-based index of the last occurrence starting at or before from (default: the end), or -1.
  int ReverseFind(const VORUnicodeString& sub, int from = -1) const;
  // Up to length code points from start (0-based); clamped to the string.
  VORUnicodeString SubString(int start, int length) const;

  void Append(const VORUnicodeString& other) { Append(other.CodePoints()); }
  VORUnicodeString& operator+=(const VORUnicodeString& other) {
    Append(other.CodePoints());
    return *this;
  }
  friend VORUnicodeString operator+(VORUnicodeString a, const VORUnicodeString& b) {
    a.Append(b.CodePoints());
    return a;
  }
  friend bool operator==(const VORUnicodeString& a, const VORUnicodeString& b) noexcept {
    return a.CodePoints() == b.CodePoints();
  }
  friend std::strong_ordering operator<=>(const VORUnicodeString& a,
                                          const VORUnicodeString& b) noexcept {
    return a.CodePoints() <=> b.CodePoints();
  }

 private:
  // Reference count and capacity, followed by the code points.
  struct Block {
    std::atomic<uint32_t> references;
    uint32_t capacity;
    char32_t* Chars() noexcept { return reinterpret_cast<char32_t*>(this + 1); }
    static Block* Make(size_t capacity);
    void Drop() noexcept;
  };
  static constexpr uint32_t kInline = 3;

  bool OnHeap() const noexcept { return _size > kInline; }
  Block* GetBlock() const noexcept {
    Block* block;
    std::memcpy(&block, _inline, sizeof block);
    return block;
  }
  void SetBlock(Block* block) noexcept { std::memcpy(_inline, &block, sizeof block); }
  const char32_t* Data() const noexcept { return OnHeap() ? GetBlock()->Chars() : _inline; }
  // Room for up to capacity code points in a string that holds none; the caller writes them and
  // then calls Shrink with the count written.
  char32_t* Prepare(size_t capacity);
  void Shrink(size_t size) noexcept;
  void Append(std::u32string_view tail);
  void Release() noexcept {
    if (OnHeap())
      GetBlock()->Drop();
    _size = 0;
  }

  // The code points themselves while there are at most kInline, else the block's address.
  alignas(8) char32_t _inline[kInline] = {};
  uint32_t _size = 0;
};

std::ostream& operator<<(std::ostream& os, const VORUnicodeString& s);

template <>
struct std::hash<VORUnicodeString> {
  size_t operator()(const VORUnicodeString& s) const noexcept {
    return std::hash<std::u32string_view>()(s.CodePoints());
  }
};
