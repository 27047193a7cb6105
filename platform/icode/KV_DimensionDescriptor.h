// KV_DimensionDescriptor: the dimensions of a type: none for a scalar, else the element
// count of each dimension, outermost first (a C declarator `x[2][3]` has the dimensions 2
// and 3). A default-constructed descriptor is scalar. A value class: copies are
// independent and compare equal when their dimensions are equal.
#ifndef HUL_PLATFORM_ICODE_KV_DIMENSIONDESCRIPTOR_H
#define HUL_PLATFORM_ICODE_KV_DIMENSIONDESCRIPTOR_H

#include "platform/support/HulPlatformExport.h"

#include <cstddef>
#include <vector>

class HUL_PLATFORM_API KV_DimensionDescriptor {
public:
  KV_DimensionDescriptor() = default;

  bool isScalar() const { return sizes.empty(); }
  int getNumberOfDimensions() const { return static_cast<int>(sizes.size()); }
  // The element count of dimension i (0 is the outermost).
  int getDimension(int i) const { return sizes[static_cast<std::size_t>(i)]; }
  // Adds an innermost dimension. False, and nothing changed, for a count below 1.
  bool addDimension(int elementCount) {
    if (elementCount < 1)
      return false;
    sizes.push_back(elementCount);
    return true;
  }
  void setScalar() { sizes.clear(); }

  friend bool operator==(const KV_DimensionDescriptor& a, const KV_DimensionDescriptor& b) {
    return a.sizes == b.sizes;
  }

private:
  std::vector<int> sizes;
};

#endif
