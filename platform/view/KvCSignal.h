// KvCSignal: a signal of the block diagram (a line between blocks): its name, data type
// name and width. Keyed object servers hold signals and find an equal one by
// compareServerEntry.
#ifndef HUL_PLATFORM_VIEW_KVCSIGNAL_H
#define HUL_PLATFORM_VIEW_KVCSIGNAL_H

#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

#include <utility>

class HUL_PLATFORM_API KvCSignal {
public:
  KvCSignal(WmCXString signalName, WmCXString typeName, int signalWidth)
      : name(std::move(signalName)), type(std::move(typeName)), width(signalWidth) {}
  virtual ~KvCSignal() = default;
  KvCSignal(const KvCSignal&) = delete;
  KvCSignal& operator=(const KvCSignal&) = delete;

  const WmCXString& getName() const { return name; }
  const WmCXString& getTypeName() const { return type; }
  int getWidth() const { return width; }
  // Whether `other` describes the same signal: same name, type and width. False for null.
  bool compareServerEntry(const KvCSignal* other) const {
    return other && other->width == width && other->name.compareWith(name) == 0 &&
           other->type.compareWith(type) == 0;
  }

private:
  WmCXString name;
  WmCXString type;
  int width;
};

#endif
