#include "platform/support/KvCOptionValueStorage.h"

#include "platform/support/KV_Dump.h"
#include "platform/support/KvCOptionNameCodec.h"
#include "platform/support/mxArray.h"

#include <algorithm>
#include <cstdio>
#include <utility>

KvCOptionValueStorage::KvCOptionValueStorage() = default;
KvCOptionValueStorage::~KvCOptionValueStorage() = default;

bool KvCOptionValueStorage::registerInterface(leda::set<const char*> encodedNames,
                                              int& interfaceId) {
  if (refuseRegistration)
    return false;
  Options options;
  for (const char* name : encodedNames) {
    if (!name)
      return false;
    options.emplace(name, std::monostate());
  }
  interfaces.push_back(std::move(options));
  interfaceId = static_cast<int>(interfaces.size());
  return true;
}

std::size_t KvCOptionValueStorage::getNumberOfOptions(int interfaceId) const {
  if (interfaceId < 1 || interfaceId > getNumberOfInterfaces())
    return 0;
  return interfaces[static_cast<std::size_t>(interfaceId - 1)].size();
}

bool KvCOptionValueStorage::isRegistered(int interfaceId, const char* encodedName) const {
  return find(interfaceId, encodedName) != nullptr;
}

const KvCOptionValueStorage::Value* KvCOptionValueStorage::find(int interfaceId,
                                                                const char* encodedName) const {
  if (!encodedName || interfaceId < 1 || interfaceId > getNumberOfInterfaces())
    return nullptr;
  const Options& options = interfaces[static_cast<std::size_t>(interfaceId - 1)];
  auto it = options.find(std::string_view(encodedName));
  return it == options.end() ? nullptr : &it->second;
}

template <class T> T KvCOptionValueStorage::getAs(int interfaceId, const char* encodedName) const {
  const Value* value = find(interfaceId, encodedName);
  if (!value)
    return T();
  const T* typed = std::get_if<T>(value);
  return typed ? *typed : T();
}

template <class T>
bool KvCOptionValueStorage::setAs(int interfaceId, const char* encodedName, T value) {
  auto* slot = const_cast<Value*>(find(interfaceId, encodedName));
  if (!slot)
    return false;
  *slot = std::move(value);
  return true;
}

bool KvCOptionValueStorage::getBoolOptionValueByEncodedName(int id, const char* name) const {
  return getAs<bool>(id, name);
}
int KvCOptionValueStorage::getIntOptionValueByEncodedName(int id, const char* name) const {
  return getAs<int>(id, name);
}
unsigned int KvCOptionValueStorage::getUnsignedIntOptionValueByEncodedName(int id,
                                                                           const char* name) const {
  return getAs<unsigned int>(id, name);
}
double KvCOptionValueStorage::getDoubleOptionValueByEncodedName(int id, const char* name) const {
  return getAs<double>(id, name);
}
WmCXString KvCOptionValueStorage::getStringOptionValueByEncodedName(int id,
                                                                    const char* name) const {
  return getAs<WmCXString>(id, name);
}
mxArray_tag* KvCOptionValueStorage::getMXArrayOptionValueByEncodedName(int id,
                                                                       const char* name) const {
  // The storage hands the matrix to its owner's callers as it was given.
  return const_cast<mxArray_tag*>(getAs<const mxArray_tag*>(id, name));
}

bool KvCOptionValueStorage::setOptionValueByEncodedName(int id, const char* name, bool value) {
  return setAs(id, name, value);
}
bool KvCOptionValueStorage::setOptionValueByEncodedName(int id, const char* name, int value) {
  return setAs(id, name, value);
}
bool KvCOptionValueStorage::setOptionValueByEncodedName(int id, const char* name,
                                                        unsigned int value) {
  return setAs(id, name, value);
}
bool KvCOptionValueStorage::setOptionValueByEncodedName(int id, const char* name, double value) {
  return setAs(id, name, value);
}
bool KvCOptionValueStorage::setOptionValueByEncodedName(int id, const char* name,
                                                        const WmCXString& value) {
  return setAs(id, name, value);
}
bool KvCOptionValueStorage::setOptionValueByEncodedName(int id, const char* name,
                                                        const mxArray_tag* value) {
  return setAs(id, name, value);
}

namespace {
WmCXString formatValue(const std::variant<std::monostate, bool, int, unsigned int, double,
                                          WmCXString, const mxArray_tag*>& value) {
  char buffer[64];
  switch (value.index()) {
  case 1:
    return std::get<bool>(value) ? "true" : "false";
  case 2:
    return WmCXString(std::get<int>(value), false, false);
  case 3:
    return WmCXString(std::get<unsigned int>(value), true, false);
  case 4:
    std::snprintf(buffer, sizeof buffer, "%.17g", std::get<double>(value));
    return buffer;
  case 5:
    return "\"" + std::get<WmCXString>(value) + "\"";
  case 6: {
    const mxArray_tag* matrix = std::get<const mxArray_tag*>(value);
    if (!matrix)
      return "<null matrix>";
    std::snprintf(buffer, sizeof buffer, "<%zux%zu matrix>", matrix->rows, matrix->columns);
    return buffer;
  }
  default:
    return "<unset>";
  }
}
} // namespace

void KvCOptionValueStorage::dumpOptions(KV_Dump* dump, int interfaceId) const {
  if (!dump || interfaceId < 1 || interfaceId > getNumberOfInterfaces())
    return;
  std::vector<std::pair<std::string, const Value*>> rows;
  for (const auto& [encoded, value] : interfaces[static_cast<std::size_t>(interfaceId - 1)])
    rows.emplace_back(KvCOptionNameCodec::decode(encoded.c_str()), &value);
  std::sort(rows.begin(), rows.end());
  for (const auto& [name, value] : rows)
    dump->writeValue(name, formatValue(*value));
}
