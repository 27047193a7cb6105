// KvCOptionNameCodec: the encoding of option names between a library and the option
// value storage: ROT13 on ASCII letters, ROT5 on digits, every other byte unchanged (the
// encoding is its own inverse). Usable at compile time, so that libraries keep only
// encoded names in their binaries.
#ifndef HUL_PLATFORM_SUPPORT_KVCOPTIONNAMECODEC_H
#define HUL_PLATFORM_SUPPORT_KVCOPTIONNAMECODEC_H

#include <cstddef>
#include <string>

class KvCOptionNameCodec {
public:
  static constexpr char encodeChar(char c) {
    if (c >= 'a' && c <= 'z')
      return static_cast<char>('a' + (c - 'a' + 13) % 26);
    if (c >= 'A' && c <= 'Z')
      return static_cast<char>('A' + (c - 'A' + 13) % 26);
    if (c >= '0' && c <= '9')
      return static_cast<char>('0' + (c - '0' + 5) % 10);
    return c;
  }
  static constexpr char decodeChar(char c) { return encodeChar(c); }

  static std::string encode(const char* name) { return transform(name); }
  static std::string decode(const char* encoded) { return transform(encoded); }

private:
  static std::string transform(const char* text) {
    std::string result;
    for (const char* p = text; p && *p; ++p)
      result += encodeChar(*p);
    return result;
  }
};

// An encoded name held as a fixed array, made at compile time from a string literal.
template <std::size_t N> struct KvCEncodedOptionName {
  consteval KvCEncodedOptionName(const char (&name)[N]) { // NOLINT: literal conversion
    for (std::size_t i = 0; i < N; ++i)
      text[i] = KvCOptionNameCodec::encodeChar(name[i]);
  }
  char text[N];
};

#endif
