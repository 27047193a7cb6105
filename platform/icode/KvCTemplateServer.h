// KvCTemplateServer: the templates of the run (owned by the code view data). Today it
// holds the function template server.
#ifndef HUL_PLATFORM_ICODE_KVCTEMPLATESERVER_H
#define HUL_PLATFORM_ICODE_KVCTEMPLATESERVER_H

#include "platform/icode/KvCFunctionTemplate.h"

class HUL_PLATFORM_API KvCTemplateServer {
public:
  KvCTemplateServer() = default;
  KvCTemplateServer(const KvCTemplateServer&) = delete;
  KvCTemplateServer& operator=(const KvCTemplateServer&) = delete;

  KvCFunctionTemplateServer* getFunctionTemplateServer() { return &functionTemplates; }

private:
  KvCFunctionTemplateServer functionTemplates;
};

#endif
