// KvCSrcRefServer: hands out the source references of a run and owns them. References
// live until the server is destroyed; a pointer obtained from the server stays valid
// that long.
#ifndef HUL_PLATFORM_SUPPORT_KVCSRCREFSERVER_H
#define HUL_PLATFORM_SUPPORT_KVCSRCREFSERVER_H

#include "platform/support/KvCInternalSrcRef.h"

#include <memory>
#include <vector>

class HUL_PLATFORM_API KvCSrcRefServer {
public:
  KvCSrcRefServer();
  ~KvCSrcRefServer();
  KvCSrcRefServer(const KvCSrcRefServer&) = delete;
  KvCSrcRefServer& operator=(const KvCSrcRefServer&) = delete;

  // A new, empty internal source reference; the caller sets its location and cause.
  KvCInternalSrcRef* getSrcRef();
  // A new reference to a place of the model, described by `origin`.
  KvCSrcRef* createModelSrcRef(const WmCXString& origin);

  std::size_t getNumberOfSrcRefs() const { return refs.size(); }

private:
  std::vector<std::unique_ptr<KvCSrcRef>> refs;
};

#endif
