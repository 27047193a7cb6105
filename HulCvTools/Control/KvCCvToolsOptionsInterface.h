// KvCCvToolsOptionsInterface: makes the library's options known to the code generator's
// option value storage and reachable for the passes.
//
// boot() registers the 229 encoded option names as one interface of the storage and
// keeps the id the storage assigns. Each option then has a getter get<Name>() and a
// setter set<Name>(value) that ask the storage under that id and the option's encoded
// name (the table is KvCCvToolsOptions.def). The library keeps no values or defaults;
// none of its services reads an option.
//
// The storage is not owned; it must outlive the interface's use. Before boot (or when
// the storage assigned no id) getters answer the type's zero through the storage, or
// without it when there is no storage at all, and setters answer false.
#ifndef HULCVTOOLS_CONTROL_KVCCVTOOLSOPTIONSINTERFACE_H
#define HULCVTOOLS_CONTROL_KVCCVTOOLSOPTIONSINTERFACE_H

#include "HulCvTools/Control/KvCHeapObject.h"
#include "HulCvTools/HulCvToolsExport.h"
#include "platform/support/KV_Dumpable.h"
#include "platform/support/WmCXString.h"

class KvCOptionValueStorage;
class KV_Dump;
struct mxArray_tag;

// Value types of the option kinds, as the getters return them and the setters take them.
#define HULCV_OPTION_GET_TYPE_Bool bool
#define HULCV_OPTION_GET_TYPE_Int int
#define HULCV_OPTION_GET_TYPE_UInt unsigned int
#define HULCV_OPTION_GET_TYPE_Double double
#define HULCV_OPTION_GET_TYPE_String WmCXString
#define HULCV_OPTION_GET_TYPE_MxArray mxArray_tag*
#define HULCV_OPTION_SET_TYPE_Bool bool
#define HULCV_OPTION_SET_TYPE_Int int
#define HULCV_OPTION_SET_TYPE_UInt unsigned int
#define HULCV_OPTION_SET_TYPE_Double double
#define HULCV_OPTION_SET_TYPE_String const WmCXString&
#define HULCV_OPTION_SET_TYPE_MxArray const mxArray_tag*

class HULCV_API KvCCvToolsOptionsInterface : public KV_Dumpable {
public:
  static constexpr int kNumberOfOptions = 229;

  KvCCvToolsOptionsInterface() = default;
  // Resets the storage and the id; the registration stays with the storage.
  ~KvCCvToolsOptionsInterface() override;
  KvCCvToolsOptionsInterface(const KvCCvToolsOptionsInterface&) = delete;
  KvCCvToolsOptionsInterface& operator=(const KvCCvToolsOptionsInterface&) = delete;

  // Keeps `storage` and registers the option names with it; answers the storage's answer.
  // Booting again registers the names again, under the id the storage then assigns.
  bool boot(KvCOptionValueStorage* storage);

  KvCOptionValueStorage* getStorage() const { return storage; }
  // The id the storage assigned, or -1.
  int getInterfaceId() const { return interfaceId; }

  WmCXString getNameForDump() const override;
  WmCXString getTypeNameForDump() const override;
  // A block "KvCCvToolsOptionsInterface" holding the storage's dump of the options.
  KV_Dump* dumpContents(KV_Dump* dump, bool deep) const override;

#define HULCV_OPTION(Kind, Name)                                                                   \
  HULCV_OPTION_GET_TYPE_##Kind get##Name() const;                                                  \
  bool set##Name(HULCV_OPTION_SET_TYPE_##Kind value);
#include "HulCvTools/Control/KvCCvToolsOptions.def"

  HULCV_HEAP_OPERATORS

private:
  KvCOptionValueStorage* storage = nullptr;
  int interfaceId = -1;
};

#endif
