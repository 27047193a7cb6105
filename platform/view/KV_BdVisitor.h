// KV_BdVisitor: a visitor over the blocks of the diagram, one visit operation per block
// kind; each does nothing in the base.
#ifndef HUL_PLATFORM_VIEW_KV_BDVISITOR_H
#define HUL_PLATFORM_VIEW_KV_BDVISITOR_H

#include "platform/support/HulPlatformExport.h"

class KV_BdBlock;
class KV_BdPartition;

class HUL_PLATFORM_API KV_BdVisitor {
public:
  KV_BdVisitor() = default;
  virtual ~KV_BdVisitor() = default;
  KV_BdVisitor(const KV_BdVisitor&) = delete;
  KV_BdVisitor& operator=(const KV_BdVisitor&) = delete;

  virtual void visitPartition(KV_BdPartition* /*partition*/) {}
  virtual void visitBlock(KV_BdBlock* /*block*/) {}
};

#endif
