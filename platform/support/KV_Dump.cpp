#include "platform/support/KV_Dump.h"

void KV_Dump::indent() { text.append(static_cast<std::size_t>(2 * depth), ' '); }

void KV_Dump::beginObject(const WmCXString& name, const WmCXString& typeName) {
  indent();
  text += name.str() + " : " + typeName.str() + " {\n";
  ++depth;
}

void KV_Dump::endObject() {
  if (depth == 0)
    return;
  --depth;
  indent();
  text += "}\n";
}

void KV_Dump::writeValue(const WmCXString& key, const WmCXString& value) {
  indent();
  text += key.str() + " = " + value.str() + "\n";
}

void KV_Dump::writeLine(const WmCXString& line) {
  indent();
  text += line.str() + "\n";
}
