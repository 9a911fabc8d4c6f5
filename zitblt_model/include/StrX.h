// Converts a parser string to narrow text for functions that take const char*. The conversion
// uses the parser's local code page, so the process locale must be UTF-8 (pfv sets it).
#pragma once

#include <xercesc/util/XercesDefs.hpp>

class StrX {
 public:
  explicit StrX(const XMLCh* text);
  StrX(const StrX& other);
  StrX& operator=(const StrX& other);
  ~StrX();

  const char* localForm() const { return _localForm ? _localForm : ""; }
  operator const char*() const { return localForm(); }

 private:
  char* _localForm = nullptr;
};
