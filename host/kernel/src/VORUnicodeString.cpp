#include "VORUnicodeString.h"

#include <algorithm>
#include <atomic>
#include <new>

namespace {
constexpr char32_t kReplacement = 0xFFFD;

// Decodes UTF-8 into out (room for in.size() code points); returns the count written. Malformed
// sequences become U+FFFD so that no input is ever rejected.
size_t DecodeUTF8(std::string_view in, char32_t* out) {
  size_t n = 0;
  size_t i = 0;
  while (i < in.size()) {
    const auto c = static_cast<unsigned char>(in[i]);
    int extra = 0;
    char32_t cp = 0;
    if (c < 0x80) {
      cp = c;
    } else if ((c & 0xE0) == 0xC0) {
      extra = 1, cp = c & 0x1F;
    } else if ((c & 0xF0) == 0xE0) {
      extra = 2, cp = c & 0x0F;
    } else if ((c & 0xF8) == 0xF0) {
      extra = 3, cp = c & 0x07;
    } else {
      out[n++] = kReplacement;
      ++i;
      continue;
    }
    if (i + static_cast<size_t>(extra) >= in.size()) {  // truncated at the end
      out[n++] = kReplacement;
      break;
    }
    bool ok = true;
    for (int k = 1; k <= extra; ++k) {
      const auto cc = static_cast<unsigned char>(in[i + static_cast<size_t>(k)]);
      if ((cc & 0xC0) != 0x80) {
        ok = false;
        break;
      }
      cp = (cp << 6) | (cc & 0x3F);
    }
    if (!ok || cp > 0x10FFFF || (cp >= 0xD800 && cp <= 0xDFFF)) {
      out[n++] = kReplacement;
      ++i;
      continue;
    }
    out[n++] = cp;
    i += static_cast<size_t>(extra) + 1;
  }
  return n;
}

// Decodes UTF-16 into out (room for in.size() code points); returns the count written. Lone
// surrogates become U+FFFD.
size_t DecodeUTF16(std::u16string_view text, char32_t* out) {
  size_t n = 0;
  for (size_t i = 0; i < text.size(); ++i) {
    char32_t c = text[i];
    if (c >= 0xD800 && c <= 0xDBFF && i + 1 < text.size() && text[i + 1] >= 0xDC00 &&
        text[i + 1] <= 0xDFFF) {
      c = 0x10000 + ((c - 0xD800) << 10) + (text[i + 1] - 0xDC00);
      ++i;
    } else if (c >= 0xD800 && c <= 0xDFFF) {
      c = kReplacement;
    }
    out[n++] = c;
  }
  return n;
}
}  // namespace

VORUnicodeString::Block* VORUnicodeString::Block::Make(size_t capacity) {
  void* memory = ::operator new(sizeof(Block) + capacity * sizeof(char32_t));
  return ::new (memory) Block{{1}, static_cast<uint32_t>(capacity)};
}

void VORUnicodeString::Block::Drop() noexcept {
  if (references.fetch_sub(1, std::memory_order_acq_rel) == 1) {
    this->~Block();
    ::operator delete(this);
  }
}

char32_t* VORUnicodeString::Prepare(size_t capacity) {
  if (capacity <= kInline) {
    _size = static_cast<uint32_t>(capacity);
    return _inline;
  }
  Block* block = Block::Make(capacity);
  SetBlock(block);
  _size = static_cast<uint32_t>(capacity);
  return block->Chars();
}

void VORUnicodeString::Shrink(size_t size) noexcept {
  if (!OnHeap() || size > kInline) {
    _size = static_cast<uint32_t>(size);
    return;
  }
  // Few enough to live inline after all (several bytes per code point).
  Block* block = GetBlock();
  char32_t kept[kInline] = {};
  std::copy_n(block->Chars(), size, kept);
  block->Drop();
  std::copy_n(kept, kInline, _inline);
  _size = static_cast<uint32_t>(size);
}

VORUnicodeString::VORUnicodeString(const VORUnicodeString& other) noexcept : _size(other._size) {
  std::copy_n(other._inline, kInline, _inline);
  if (OnHeap())
    GetBlock()->references.fetch_add(1, std::memory_order_relaxed);
}

VORUnicodeString::VORUnicodeString(VORUnicodeString&& other) noexcept : _size(other._size) {
  std::copy_n(other._inline, kInline, _inline);
  other._size = 0;
}

VORUnicodeString& VORUnicodeString::operator=(const VORUnicodeString& other) noexcept {
  if (this != &other) {
    if (other.OnHeap())
      other.GetBlock()->references.fetch_add(1, std::memory_order_relaxed);
    Release();
    std::copy_n(other._inline, kInline, _inline);
    _size = other._size;
  }
  return *this;
}

VORUnicodeString& VORUnicodeString::operator=(VORUnicodeString&& other) noexcept {
  if (this != &other) {
    Release();
    std::copy_n(other._inline, kInline, _inline);
    _size = other._size;
    other._size = 0;
  }
  return *this;
}

VORUnicodeString::VORUnicodeString(const char* utf8)
    : VORUnicodeString(utf8 ? std::string_view(utf8) : std::string_view()) {}

VORUnicodeString::VORUnicodeString(std::string_view utf8) {
  Shrink(DecodeUTF8(utf8, Prepare(utf8.size())));
}

VORUnicodeString::VORUnicodeString(std::u32string_view codePoints) {
  std::copy(codePoints.begin(), codePoints.end(), Prepare(codePoints.size()));
}

VORUnicodeString VORUnicodeString::FromUTF16(const char16_t* text) {
  return text ? FromUTF16(std::u16string_view(text)) : VORUnicodeString();
}

VORUnicodeString VORUnicodeString::FromUTF16(std::u16string_view text) {
  VORUnicodeString result;
  result.Shrink(DecodeUTF16(text, result.Prepare(text.size())));
  return result;
}

void VORUnicodeString::Append(std::u32string_view tail) {
  if (tail.empty())
    return;
  const size_t size = _size + tail.size();
  if (size <= kInline) {
    std::memmove(_inline + _size, tail.data(), tail.size() * sizeof(char32_t));
    _size = static_cast<uint32_t>(size);
    return;
  }
  if (OnHeap()) {
    Block* block = GetBlock();
    // A block no other string shares may grow in place (tail cannot overlap what is added).
    if (block->references.load(std::memory_order_acquire) == 1 && block->capacity >= size) {
      std::copy(tail.begin(), tail.end(), block->Chars() + _size);
      _size = static_cast<uint32_t>(size);
      return;
    }
  }
  // A string appended to again and again grows by doubling; a first append takes what it needs.
  const size_t capacity = OnHeap() ? std::max(size, 2 * static_cast<size_t>(_size)) : size;
  Block* grown = Block::Make(capacity);
  const std::u32string_view head = CodePoints();
  std::copy(head.begin(), head.end(), grown->Chars());
  std::copy(tail.begin(), tail.end(), grown->Chars() + head.size());
  Release();
  SetBlock(grown);
  _size = static_cast<uint32_t>(size);
}

std::string VORUnicodeString::ConvertToUTF8() const {
  std::string out;
  out.reserve(_size);
  for (char32_t c : CodePoints()) {
    if (c < 0x80) {
      out.push_back(static_cast<char>(c));
    } else if (c < 0x800) {
      out.push_back(static_cast<char>(0xC0 | (c >> 6)));
      out.push_back(static_cast<char>(0x80 | (c & 0x3F)));
    } else if (c < 0x10000) {
      out.push_back(static_cast<char>(0xE0 | (c >> 12)));
      out.push_back(static_cast<char>(0x80 | ((c >> 6) & 0x3F)));
      out.push_back(static_cast<char>(0x80 | (c & 0x3F)));
    } else {
      out.push_back(static_cast<char>(0xF0 | (c >> 18)));
      out.push_back(static_cast<char>(0x80 | ((c >> 12) & 0x3F)));
      out.push_back(static_cast<char>(0x80 | ((c >> 6) & 0x3F)));
      out.push_back(static_cast<char>(0x80 | (c & 0x3F)));
    }
  }
  return out;
}

std::u16string VORUnicodeString::ConvertToUTF16() const {
  std::u16string out;
  out.reserve(_size);
  for (char32_t c : CodePoints()) {
    if (c < 0x10000) {
      out.push_back(static_cast<char16_t>(c));
    } else {
      c -= 0x10000;
      out.push_back(static_cast<char16_t>(0xD800 + (c >> 10)));
      out.push_back(static_cast<char16_t>(0xDC00 + (c & 0x3FF)));
    }
  }
  return out;
}

int VORUnicodeString::Find(const VORUnicodeString& sub, int from) const {
  if (from < 0)
    from = 0;
  if (static_cast<size_t>(from) > _size)
    return -1;
  size_t at = CodePoints().find(sub.CodePoints(), static_cast<size_t>(from));
  return at == std::u32string_view::npos ? -1 : static_cast<int>(at);
}

int VORUnicodeString::ReverseFind(const VORUnicodeString& sub, int from) const {
  size_t start = from < 0 ? std::u32string_view::npos : static_cast<size_t>(from);
  size_t at = CodePoints().rfind(sub.CodePoints(), start);
  return at == std::u32string_view::npos ? -1 : static_cast<int>(at);
}

VORUnicodeString VORUnicodeString::SubString(int start, int length) const {
  if (start < 0)
    start = 0;
  if (length <= 0 || static_cast<size_t>(start) >= _size)
    return {};
  return VORUnicodeString(
      CodePoints().substr(static_cast<size_t>(start), static_cast<size_t>(length)));
}

std::ostream& operator<<(std::ostream& os, const VORUnicodeString& s) {
  return os << s.ConvertToUTF8();
}
