// A single pass over the raw bytes that refuses what the parser would choke on or silently
// accept: NUL bytes, a DOCTYPE (unless the caller accepts one: configuration files, whose
// parse then refuses anything external), elements with a huge number of attributes (the
// parser's attribute handling is quadratic), and nesting beyond the depth limit. It follows
// only the lexical structure of well-formed XML; anything else is left to the parser to report.
#include <cstring>
#include <string_view>

#include "VORXercesPlatform.h"

namespace {

class RawChecker {
 public:
  RawChecker(std::string_view text, const std::string& name,
             const VORXercesPlatform::ParseLimits& limits)
      : _text(text), _name(name), _limits(limits) {}

  bool Run(std::string& error) {
    if (const void* nul = std::memchr(_text.data(), 0, _text.size())) {
      const size_t at = static_cast<size_t>(static_cast<const char*>(nul) - _text.data());
      return Fail(at, "a NUL byte, the file is damaged or not UTF-8 text", error);
    }
    int depth = 0;
    for (size_t i = 0; i < _text.size();) {
      const size_t open = _text.find('<', i);
      if (open == std::string_view::npos)
        break;
      const std::string_view rest = _text.substr(open);
      if (Starts(rest, "<!--")) {
        i = Skip(open + 4, "-->");
      } else if (Starts(rest, "<![CDATA[")) {
        i = Skip(open + 9, "]]>");
      } else if (Starts(rest, "<?")) {
        i = Skip(open + 2, "?>");
      } else if (Starts(rest, "<!DOCTYPE")) {
        if (!_limits.acceptInternalDoctype)
          return Fail(open, "a DOCTYPE is not allowed in this file", error);
        i = SkipDoctype(open + 9);
      } else if (Starts(rest, "</")) {
        --depth;
        i = Skip(open + 2, ">");
      } else {
        bool closed = false;
        int attributes = 0;
        i = StartTag(open + 1, attributes, closed);
        if (attributes > _limits.maxAttributes)
          return Fail(
              open,
              "an element with more than " + std::to_string(_limits.maxAttributes) + " attributes",
              error);
        if (!closed && ++depth > _limits.maxDepth)
          return Fail(open, "elements nested deeper than " + std::to_string(_limits.maxDepth),
                      error);
      }
    }
    return true;
  }

 private:
  static bool Starts(std::string_view s, std::string_view prefix) {
    return s.substr(0, prefix.size()) == prefix;
  }
  size_t Skip(size_t from, std::string_view end) const {
    const size_t at = _text.find(end, from);
    return at == std::string_view::npos ? _text.size() : at + end.size();
  }
  // Past the DOCTYPE declaration whose name starts at from: its quoted literals, comments and
  // internal subset may hold '>' and '<'.
  size_t SkipDoctype(size_t from) const {
    char quote = 0;
    bool subset = false;
    for (size_t i = from; i < _text.size(); ++i) {
      const char c = _text[i];
      if (quote != 0) {
        if (c == quote)
          quote = 0;
      } else if (c == '"' || c == '\'') {
        quote = c;
      } else if (subset && Starts(_text.substr(i), "<!--")) {
        i = Skip(i + 4, "-->") - 1;
      } else if (c == '[') {
        subset = true;
      } else if (c == ']') {
        subset = false;
      } else if (c == '>' && !subset) {
        return i + 1;
      }
    }
    return _text.size();
  }
  // Past the start tag beginning at from (after '<'): counts the '=' outside quoted values and
  // tells whether the tag closes itself.
  size_t StartTag(size_t from, int& attributes, bool& closed) const {
    char quote = 0;
    for (size_t i = from; i < _text.size(); ++i) {
      const char c = _text[i];
      if (quote != 0) {
        if (c == quote)
          quote = 0;
      } else if (c == '"' || c == '\'') {
        quote = c;
      } else if (c == '=') {
        ++attributes;
        if (attributes > _limits.maxAttributes)
          return i + 1;
      } else if (c == '>') {
        closed = i > from && _text[i - 1] == '/';
        return i + 1;
      } else if (c == '<') {
        return i;  // malformed: the parser reports it
      }
    }
    return _text.size();
  }
  bool Fail(size_t at, const std::string& what, std::string& error) const {
    long line = 1;
    size_t lineStart = 0;
    for (size_t i = 0; i < at; ++i) {
      if (_text[i] == '\n') {
        ++line;
        lineStart = i + 1;
      }
    }
    // Columns count characters: UTF-8 continuation bytes do not start one.
    long column = 1;
    for (size_t i = lineStart; i < at; ++i)
      column += (static_cast<unsigned char>(_text[i]) & 0xC0) != 0x80;
    error = _name + ":" + std::to_string(line) + ":" + std::to_string(column) + ": " + what;
    return false;
  }

  std::string_view _text;
  const std::string& _name;
  const VORXercesPlatform::ParseLimits& _limits;
};

}  // namespace

namespace VORXercesPlatform {

bool CheckRawText(const std::string& content, const std::string& name, std::string& error,
                  const ParseLimits& limits) {
  return RawChecker(content, name, limits).Run(error);
}

}  // namespace VORXercesPlatform
