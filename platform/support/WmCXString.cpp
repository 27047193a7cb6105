#include "platform/support/WmCXString.h"

#include <cctype>
#include <cstdio>

WmCXString::WmCXString(const char* text) {
  if (text)
    value = text;
}

WmCXString::WmCXString(long long number, bool isUnsigned, bool asHex) {
  char buffer[32];
  const auto bits = static_cast<unsigned long long>(number);
  if (asHex)
    std::snprintf(buffer, sizeof buffer, "0x%llx", bits);
  else if (isUnsigned)
    std::snprintf(buffer, sizeof buffer, "%llu", bits);
  else
    std::snprintf(buffer, sizeof buffer, "%lld", number);
  value = buffer;
}

int WmCXString::compareWith(const WmCXString& other) const {
  const int c = value.compare(other.value);
  return c < 0 ? -1 : (c > 0 ? 1 : 0);
}

int WmCXString::compareWithNoCase(const WmCXString& other) const {
  const std::size_t n = std::min(value.size(), other.value.size());
  for (std::size_t i = 0; i < n; ++i) {
    const int a = std::tolower(static_cast<unsigned char>(value[i]));
    const int b = std::tolower(static_cast<unsigned char>(other.value[i]));
    if (a != b)
      return a < b ? -1 : 1;
  }
  if (value.size() == other.value.size())
    return 0;
  return value.size() < other.value.size() ? -1 : 1;
}

bool WmCXString::startsWith(const WmCXString& prefix) const {
  return value.compare(0, prefix.value.size(), prefix.value) == 0;
}

int WmCXString::replaceAll(const WmCXString& from, const WmCXString& to) {
  if (from.value.empty())
    return 0;
  int count = 0;
  std::string result;
  std::size_t pos = 0;
  for (std::size_t hit = value.find(from.value); hit != std::string::npos;
       hit = value.find(from.value, pos)) {
    result.append(value, pos, hit - pos);
    result += to.value;
    pos = hit + from.value.size();
    ++count;
  }
  result.append(value, pos, std::string::npos);
  value = std::move(result);
  return count;
}
