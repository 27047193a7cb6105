#include "platform/support/KvCNames.h"

#include "platform/support/KvCCIdentifier.h"

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

int KvCNames::replaceMultirateCtrName(KvCCIdentifier& form, const KvCCIdentifier& counterName) {
  WmCXString text = form.getRawName();
  const int replaced = text.replaceAll(kMultirateCtrNameMacro, counterName.getRawName());
  form = text;
  return replaced;
}

bool KvCNames::createNameFromForm(KvCCIdentifier& form, KV_DataType* /*type*/,
                                  unsigned int maxLength, unsigned int /*nameFlags*/,
                                  bool /*unique*/, const WmCXString& prefix) {
  std::string text = form.getRawName().str();
  for (std::size_t start = text.find("$("); start != std::string::npos;
       start = text.find("$(", start)) {
    const std::size_t end = text.find(')', start);
    text.erase(start, end == std::string::npos ? std::string::npos : end - start + 1);
  }
  text = prefix.str() + text;
  if (maxLength > 0 && text.size() > maxLength)
    text.resize(maxLength);
  form = WmCXString(text);
  return !text.empty();
}
