// WmCXString: the code generator's string class. A value class over std::string that
// carries every name and text across the model interfaces. A null `const char*` makes an
// empty string.
#ifndef HUL_PLATFORM_SUPPORT_WMCXSTRING_H
#define HUL_PLATFORM_SUPPORT_WMCXSTRING_H

#include "platform/support/HulPlatformExport.h"

#include <cstddef>
#include <functional>
#include <string>

class HUL_PLATFORM_API WmCXString {
public:
  WmCXString() = default;
  WmCXString(const char* text); // NOLINT(google-explicit-constructor): strings convert freely
  WmCXString(std::string text) : value(std::move(text)) {} // NOLINT(google-explicit-constructor)
  // Decimal text of `number`; `isUnsigned` reads the bits as unsigned, `asHex` writes
  // "0x" and lower-case hexadecimal digits of the unsigned value instead.
  WmCXString(long long number, bool isUnsigned, bool asHex);

  const char* c_str() const { return value.c_str(); }
  const std::string& str() const { return value; }
  std::size_t getLength() const { return value.size(); }
  bool isEmpty() const { return value.empty(); }

  // Negative, zero or positive as this string orders before, equal to or after `other`
  // (byte-wise).
  int compareWith(const WmCXString& other) const;
  int compareWithNoCase(const WmCXString& other) const;

  bool startsWith(const WmCXString& prefix) const;
  // Replaces every occurrence of `from` (not empty) by `to`; returns the number replaced.
  int replaceAll(const WmCXString& from, const WmCXString& to);

  WmCXString& operator+=(const WmCXString& other) {
    value += other.value;
    return *this;
  }
  friend WmCXString operator+(WmCXString lhs, const WmCXString& rhs) { return lhs += rhs; }
  friend bool operator==(const WmCXString& a, const WmCXString& b) { return a.value == b.value; }
  friend bool operator<(const WmCXString& a, const WmCXString& b) { return a.value < b.value; }

private:
  std::string value;
};

template <> struct std::hash<WmCXString> {
  std::size_t operator()(const WmCXString& s) const noexcept {
    return std::hash<std::string>()(s.str());
  }
};

#endif
