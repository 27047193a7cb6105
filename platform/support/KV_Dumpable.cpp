#include "platform/support/KV_Dumpable.h"

#include "platform/support/KV_Dump.h"

KV_Dumpable::~KV_Dumpable() = default;

WmCXString KV_Dumpable::getNameForDump() const { return getTypeNameForDump(); }

WmCXString KV_Dumpable::getTypeNameForDump() const { return "KV_Dumpable"; }

WmCXString KV_Dumpable::getLinkNameForDump() const { return getNameForDump(); }

WmCXString KV_Dumpable::getColorForDump() const { return "black"; }

void KV_Dumpable::dumpStart(KV_Dump* dump, const WmCXString& name) const {
  if (dump)
    dump->beginObject(name, getTypeNameForDump());
}

void KV_Dumpable::dumpFinish(KV_Dump* dump) const {
  if (dump)
    dump->endObject();
}

void KV_Dumpable::dump(KV_Dump* dump, bool deep) const { dumpContents(dump, deep); }

KV_Dump* KV_Dumpable::dumpContents(KV_Dump* dump, bool /*deep*/) const {
  dumpStart(dump, getNameForDump());
  dumpFinish(dump);
  return dump;
}
