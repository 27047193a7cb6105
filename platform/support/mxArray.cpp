#include "platform/support/mxArray.h"

mxArray_tag::mxArray_tag(std::size_t rowCount, std::size_t columnCount)
    : rows(rowCount), columns(columnCount), values(rowCount * columnCount, 0.0) {}
