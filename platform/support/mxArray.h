// mxArray_tag: the matrix value of matrix-typed options. The library only passes
// pointers to it through; this stand-in gives it a small dense double matrix so that
// tests and the demo can make one.
#ifndef HUL_PLATFORM_SUPPORT_MXARRAY_H
#define HUL_PLATFORM_SUPPORT_MXARRAY_H

#include "platform/support/HulPlatformExport.h"

#include <cstddef>
#include <vector>

struct HUL_PLATFORM_API mxArray_tag {
  mxArray_tag(std::size_t rows, std::size_t columns);

  std::size_t rows;
  std::size_t columns;
  std::vector<double> values; // column-major, rows * columns
};

#endif
