// Conversions between the platform's strings and QString.
#pragma once

#include <QString>
#include <string>

#include "VORString.h"
#include "VORUnicodeString.h"

inline QString VORQtString(const VORUnicodeString& text) {
  const std::u32string_view s = text.CodePoints();
  return QString::fromUcs4(s.data(), static_cast<qsizetype>(s.size()));
}
inline QString VORQtString(const std::string& utf8) {
  return QString::fromUtf8(utf8.data(), static_cast<qsizetype>(utf8.size()));
}
inline QString VORQtString(const VORString& text) {
  return VORQtString(text.str());
}
inline VORUnicodeString VORQtUnicode(const QString& text) {
  return VORUnicodeString(text.toStdString());
}
