// KV_Dump: a plain text dump. Objects open a block with their name and type, write
// "key = value" lines into it and close it; blocks nest and are indented by two spaces a
// level. The dump owns its text; nothing else is written anywhere.
#ifndef HUL_PLATFORM_SUPPORT_KV_DUMP_H
#define HUL_PLATFORM_SUPPORT_KV_DUMP_H

#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

#include <string>

class HUL_PLATFORM_API KV_Dump {
public:
  // "name : typeName {"
  void beginObject(const WmCXString& name, const WmCXString& typeName);
  // "}" of the innermost open block; a close without an open block is ignored.
  void endObject();
  // "key = value"
  void writeValue(const WmCXString& key, const WmCXString& value);
  void writeLine(const WmCXString& line);

  const std::string& getText() const { return text; }
  int getDepth() const { return depth; }

private:
  void indent();

  std::string text;
  int depth = 0;
};

#endif
