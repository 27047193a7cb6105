// KvCSrcRef: where an object of the models came from (a block of the model, a line of a
// source file, ...). Source references are owned by the source reference server of the
// run; everyone else holds plain pointers to them.
#ifndef HUL_PLATFORM_SUPPORT_KVCSRCREF_H
#define HUL_PLATFORM_SUPPORT_KVCSRCREF_H

#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

class HUL_PLATFORM_API KvCSrcRef {
public:
  KvCSrcRef() = default;
  explicit KvCSrcRef(WmCXString origin) : origin(std::move(origin)) {}
  virtual ~KvCSrcRef();
  KvCSrcRef(const KvCSrcRef&) = delete;
  KvCSrcRef& operator=(const KvCSrcRef&) = delete;

  // A one-line description for messages and dumps.
  virtual WmCXString getText() const;

private:
  WmCXString origin;
};

#endif
