// Function templates of the ICode: how the user wants a special function of the generated
// code to be named, classed and placed. Each template has a key; the user's settings for
// it are its user default description, which is absent while the user has not defined
// the template.
//
// KvCFunctionTemplateServer makes one template per key on first demand and owns it; it is
// owned by the template server (KvCTemplateServer), which the code view data owns.
#ifndef HUL_PLATFORM_ICODE_KVCFUNCTIONTEMPLATE_H
#define HUL_PLATFORM_ICODE_KVCFUNCTIONTEMPLATE_H

#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

#include <map>
#include <memory>
#include <optional>

class KvCFcnClassId;

// The keys of the function templates the RTOS servers use. The numbers are the model's;
// keys not listed here belong to templates of other kinds.
enum tagKvEFunctionTplKey : int {
  KV_FCN_TPL_ENTER_CRITICAL_SECTION = 0,
  KV_FCN_TPL_INIT_ALARMS = 2,
  KV_FCN_TPL_LEAVE_CRITICAL_SECTION = 3,
  KV_FCN_TPL_LOCK_MESSAGE = 4,
  KV_FCN_TPL_TRIGGER_TASK = 15,
  KV_FCN_TPL_UNLOCK_MESSAGE = 16
};

// The user's settings of a template: the function's name, its function class (may be
// null) and the name of the code file that holds the function (may be empty).
class HUL_PLATFORM_API KvCFunctionTemplateDescr {
public:
  KvCFunctionTemplateDescr(WmCXString functionName, KvCFcnClassId* fcnClass,
                           WmCXString codeFileName)
      : name(std::move(functionName)), functionClass(fcnClass), codeFile(std::move(codeFileName)) {}

  const WmCXString& getFunctionName() const { return name; }
  KvCFcnClassId* getFunctionClass() const { return functionClass; }
  const WmCXString& getCodeFile() const { return codeFile; }

private:
  WmCXString name;
  KvCFcnClassId* functionClass;
  WmCXString codeFile;
};

class HUL_PLATFORM_API KvCFunctionTemplate {
public:
  explicit KvCFunctionTemplate(tagKvEFunctionTplKey templateKey) : key(templateKey) {}
  KvCFunctionTemplate(const KvCFunctionTemplate&) = delete;
  KvCFunctionTemplate& operator=(const KvCFunctionTemplate&) = delete;

  tagKvEFunctionTplKey getKey() const { return key; }
  // The user's settings, or null while the user has not defined the template. The object
  // lives until the settings are set or removed again.
  const KvCFunctionTemplateDescr* getUserDefault() const {
    return userDefault ? &*userDefault : nullptr;
  }
  // Read from the user's configuration by the code generator; fixtures set it directly.
  void setUserDefault(const WmCXString& functionName, KvCFcnClassId* fcnClass,
                      const WmCXString& codeFileName) {
    userDefault.emplace(functionName, fcnClass, codeFileName);
  }
  void removeUserDefault() { userDefault.reset(); }

private:
  tagKvEFunctionTplKey key;
  std::optional<KvCFunctionTemplateDescr> userDefault;
};

class HUL_PLATFORM_API KvCFunctionTemplateServer {
public:
  KvCFunctionTemplateServer() = default;
  KvCFunctionTemplateServer(const KvCFunctionTemplateServer&) = delete;
  KvCFunctionTemplateServer& operator=(const KvCFunctionTemplateServer&) = delete;

  // The template of `key`, made (without user settings) on first demand; never null.
  KvCFunctionTemplate* demandTemplate(tagKvEFunctionTplKey key);
  // The number of demandTemplate calls so far.
  int getNumberOfDemands() const { return demands; }

private:
  std::map<int, std::unique_ptr<KvCFunctionTemplate>> templates;
  int demands = 0;
};

#endif
