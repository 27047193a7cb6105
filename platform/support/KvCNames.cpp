#include "platform/support/KvCNames.h"

namespace {
bool isIdentifierChar(char c) {
  return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || (c >= '0' && c <= '9') || c == '_';
}
bool isDigit(char c) { return c >= '0' && c <= '9'; }
} // namespace

bool KvCNames::isValidCIdentifier(const WmCXString& name) {
  const std::string& text = name.str();
  if (text.empty() || isDigit(text.front()))
    return false;
  for (char c : text)
    if (!isIdentifierChar(c))
      return false;
  return true;
}

WmCXString KvCNames::cookName(const WmCXString& name) {
  std::string text = name.str();
  for (char& c : text)
    if (!isIdentifierChar(c))
      c = '_';
  if (text.empty() || isDigit(text.front()))
    text.insert(text.begin(), '_');
  return text;
}
