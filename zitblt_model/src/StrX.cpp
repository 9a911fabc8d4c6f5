#include "StrX.h"

#include <cstring>

#include <xercesc/util/XMLString.hpp>

namespace {
char* Copy(const char* text) {
  if (text == nullptr)
    return nullptr;
  char* copy = new char[std::strlen(text) + 1];
  std::strcpy(copy, text);
  return copy;
}
}  // namespace

StrX::StrX(const XMLCh* text) {
  if (text == nullptr)
    return;
  // The parser allocates with its own memory manager: copy into our array and release its.
  char* transcoded = xercesc::XMLString::transcode(text);
  _localForm = Copy(transcoded);
  xercesc::XMLString::release(&transcoded);
}

StrX::StrX(const StrX& other) : _localForm(Copy(other._localForm)) {}

StrX& StrX::operator=(const StrX& other) {
  if (this != &other) {
    char* copy = Copy(other._localForm);
    delete[] _localForm;
    _localForm = copy;
  }
  return *this;
}

StrX::~StrX() {
  delete[] _localForm;
  _localForm = nullptr;
}
