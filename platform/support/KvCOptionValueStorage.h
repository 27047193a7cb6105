// KvCOptionValueStorage: the code generator's option value storage. Libraries register
// an interface (a set of encoded option names) and get an interface id; values are then
// kept per (interface id, encoded name), where names are compared by content, never by
// address.
//
// A value has the type of the setter that last wrote it. A getter of another type, of an
// unregistered name or of a name never set answers the type's zero (false, 0, 0.0, an
// empty string, null). A setter of an unregistered name answers false and stores nothing.
// Names are decoded (KvCOptionNameCodec) only for the dump.
#ifndef HUL_PLATFORM_SUPPORT_KVCOPTIONVALUESTORAGE_H
#define HUL_PLATFORM_SUPPORT_KVCOPTIONVALUESTORAGE_H

#include "platform/leda/set.h"
#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

#include <map>
#include <string>
#include <variant>
#include <vector>

class KV_Dump;
struct mxArray_tag;

class HUL_PLATFORM_API KvCOptionValueStorage {
public:
  KvCOptionValueStorage();
  ~KvCOptionValueStorage();
  KvCOptionValueStorage(const KvCOptionValueStorage&) = delete;
  KvCOptionValueStorage& operator=(const KvCOptionValueStorage&) = delete;

  // Registers the names (copied by content) under a new interface id, written into
  // `interfaceId`. Ids count from 1. Answers false and leaves `interfaceId` unchanged when
  // registration is refused (see setRefuseRegistration) or a name is null.
  bool registerInterface(leda::set<const char*> encodedNames, int& interfaceId);
  // Makes every later registration fail, as a storage that does not accept a library.
  void setRefuseRegistration(bool refuse) { refuseRegistration = refuse; }

  int getNumberOfInterfaces() const { return static_cast<int>(interfaces.size()); }
  // The number of names registered under `interfaceId`; 0 for an unknown id.
  std::size_t getNumberOfOptions(int interfaceId) const;
  bool isRegistered(int interfaceId, const char* encodedName) const;

  bool getBoolOptionValueByEncodedName(int interfaceId, const char* encodedName) const;
  int getIntOptionValueByEncodedName(int interfaceId, const char* encodedName) const;
  unsigned int getUnsignedIntOptionValueByEncodedName(int interfaceId,
                                                      const char* encodedName) const;
  double getDoubleOptionValueByEncodedName(int interfaceId, const char* encodedName) const;
  WmCXString getStringOptionValueByEncodedName(int interfaceId, const char* encodedName) const;
  mxArray_tag* getMXArrayOptionValueByEncodedName(int interfaceId, const char* encodedName) const;

  bool setOptionValueByEncodedName(int interfaceId, const char* encodedName, bool value);
  bool setOptionValueByEncodedName(int interfaceId, const char* encodedName, int value);
  bool setOptionValueByEncodedName(int interfaceId, const char* encodedName, unsigned int value);
  bool setOptionValueByEncodedName(int interfaceId, const char* encodedName, double value);
  bool setOptionValueByEncodedName(int interfaceId, const char* encodedName,
                                   const WmCXString& value);
  bool setOptionValueByEncodedName(int interfaceId, const char* encodedName,
                                   const mxArray_tag* value);
  // A string literal would otherwise convert to bool; pass a WmCXString.
  bool setOptionValueByEncodedName(int interfaceId, const char* encodedName,
                                   const char* value) = delete;

  // Writes "decodedName = value" for every option of the interface, sorted by decoded
  // name; unset options show "<unset>". Nothing for an unknown id or a null dump.
  void dumpOptions(KV_Dump* dump, int interfaceId) const;

private:
  using Value =
      std::variant<std::monostate, bool, int, unsigned int, double, WmCXString, const mxArray_tag*>;
  // Encoded name -> value, for one interface.
  using Options = std::map<std::string, Value, std::less<>>;

  const Value* find(int interfaceId, const char* encodedName) const;
  template <class T> T getAs(int interfaceId, const char* encodedName) const;
  template <class T> bool setAs(int interfaceId, const char* encodedName, T value);

  std::vector<Options> interfaces; // interface id i is interfaces[i - 1]
  bool refuseRegistration = false;
};

#endif
