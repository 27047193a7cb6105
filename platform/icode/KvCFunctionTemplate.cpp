#include "platform/icode/KvCFunctionTemplate.h"

KvCFunctionTemplate* KvCFunctionTemplateServer::demandTemplate(tagKvEFunctionTplKey key) {
  ++demands;
  std::unique_ptr<KvCFunctionTemplate>& slot = templates[static_cast<int>(key)];
  if (!slot)
    slot = std::make_unique<KvCFunctionTemplate>(key);
  return slot.get();
}
