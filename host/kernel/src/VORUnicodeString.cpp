#include "VORUnicodeString.h"

#include <algorithm>

namespace {
constexpr char32_t kReplacement = 0xFFFD;

// Decodes UTF-8; malformed sequences become U+FFFD so that no input is ever rejected.
std::u32string DecodeUTF8(std::string_view in) {
  std::u32string out;
  out.reserve(in.size());
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
      out.push_back(kReplacement);
      ++i;
      continue;
    }
    if (i + static_cast<size_t>(extra) >= in.size()) {  // truncated at the end
      out.push_back(kReplacement);
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
      out.push_back(kReplacement);
      ++i;
      continue;
    }
    out.push_back(cp);
    i += static_cast<size_t>(extra) + 1;
  }
  return out;
}
}  // namespace

VORUnicodeString::VORUnicodeString(const char* utf8)
    : _s(utf8 ? DecodeUTF8(utf8) : std::u32string()) {}

VORUnicodeString::VORUnicodeString(std::string_view utf8) : _s(DecodeUTF8(utf8)) {}

VORUnicodeString VORUnicodeString::FromUTF16(const char16_t* text) {
  return text ? FromUTF16(std::u16string_view(text)) : VORUnicodeString();
}

VORUnicodeString VORUnicodeString::FromUTF16(std::u16string_view text) {
  std::u32string out;
  out.reserve(text.size());
  for (size_t i = 0; i < text.size(); ++i) {
    char32_t c = text[i];
    if (c >= 0xD800 && c <= 0xDBFF && i + 1 < text.size() && text[i + 1] >= 0xDC00 &&
        text[i + 1] <= 0xDFFF) {
      c = 0x10000 + ((c - 0xD800) << 10) + (text[i + 1] - 0xDC00);
      ++i;
    } else if (c >= 0xD800 && c <= 0xDFFF) {
      c = kReplacement;
    }
    out.push_back(c);
  }
  return VORUnicodeString(std::move(out));
}

std::string VORUnicodeString::ConvertToUTF8() const {
  std::string out;
  out.reserve(_s.size());
  for (char32_t c : _s) {
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
  out.reserve(_s.size());
  for (char32_t c : _s) {
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
  if (static_cast<size_t>(from) > _s.size())
    return -1;
  size_t at = _s.find(sub._s, static_cast<size_t>(from));
  return at == std::u32string::npos ? -1 : static_cast<int>(at);
}

int VORUnicodeString::ReverseFind(const VORUnicodeString& sub, int from) const {
  size_t start = from < 0 ? std::u32string::npos : static_cast<size_t>(from);
  size_t at = _s.rfind(sub._s, start);
  return at == std::u32string::npos ? -1 : static_cast<int>(at);
}

VORUnicodeString VORUnicodeString::SubString(int start, int length) const {
  if (start < 0)
    start = 0;
  if (length <= 0 || static_cast<size_t>(start) >= _s.size())
    return {};
  return VORUnicodeString(_s.substr(static_cast<size_t>(start), static_cast<size_t>(length)));
}

std::ostream& operator<<(std::ostream& os, const VORUnicodeString& s) {
  return os << s.ConvertToUTF8();
}
