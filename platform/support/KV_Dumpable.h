// KV_Dumpable: base of every object that can write itself into a KV_Dump. The virtual
// operations are in a fixed order that derived classes of other libraries rely on; do not
// reorder them.
#ifndef HUL_PLATFORM_SUPPORT_KV_DUMPABLE_H
#define HUL_PLATFORM_SUPPORT_KV_DUMPABLE_H

#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

class KV_Dump;

class HUL_PLATFORM_API KV_Dumpable {
public:
  KV_Dumpable() = default;
  virtual ~KV_Dumpable();

  virtual WmCXString getNameForDump() const;     // default: the type name
  virtual WmCXString getTypeNameForDump() const; // default: "KV_Dumpable"
  virtual WmCXString getLinkNameForDump() const; // default: the name
  virtual WmCXString getColorForDump() const;    // default: "black"
  // Opens the object's block under `name`; a null dump is ignored.
  virtual void dumpStart(KV_Dump* dump, const WmCXString& name) const;
  // Closes the block opened by dumpStart; a null dump is ignored.
  virtual void dumpFinish(KV_Dump* dump) const;
  // Writes the object: dumpContents. `deep` asks for owned objects to be written too.
  virtual void dump(KV_Dump* dump, bool deep) const;
  // Writes the object's block and returns `dump`. Default: an empty block named by
  // getNameForDump().
  virtual KV_Dump* dumpContents(KV_Dump* dump, bool deep) const;

protected:
  KV_Dumpable(const KV_Dumpable&) = default;
  KV_Dumpable& operator=(const KV_Dumpable&) = default;
};

#endif
